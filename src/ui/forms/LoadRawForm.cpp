#include "ui/forms/LoadRawForm.h"

#include <QDialogButtonBox>
#include <QLabel>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace nedit {

LoadRawForm::LoadRawForm(ULoadRawDlg& dialog, const FormContext& context, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Load Raw File Entry"), parent, context),
      dialog_(dialog),
      list_(new QListWidget(this)),
      details_(new QPlainTextEdit(this)),
      import_(new QPushButton(QStringLiteral("Import..."), this)),
      from_device_(new QPushButton(QStringLiteral("Import from Device..."), this)) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(new QLabel(QStringLiteral("Instrument List"), this));
    for (const std::wstring& name : dialog_.GetNames())
        list_->addItem(QString::fromStdWString(name));
    list_->setCurrentRow(dialog_.GetSelected());
    layout->addWidget(list_, 1);
    layout->addWidget(new QLabel(QStringLiteral("Driver details"), this));
    details_->setReadOnly(true);
    details_->setMaximumHeight(details_->fontMetrics().lineSpacing() * 4);
    layout->addWidget(details_);
    auto* buttons = new QDialogButtonBox(this);
    buttons->addButton(import_, QDialogButtonBox::ActionRole);
    buttons->addButton(from_device_, QDialogButtonBox::ActionRole);
    buttons->addButton(QDialogButtonBox::Cancel);
    from_device_->setVisible(false);
    // Enter does nothing here: neither button is pressed by it.
    for (QAbstractButton* button : buttons->buttons()) {
        if (auto* push = qobject_cast<QPushButton*>(button)) push->setAutoDefault(false);
    }
    layout->addWidget(buttons);
    connect(buttons, &QDialogButtonBox::rejected, this, &LogicForm::reject);
    connect(import_, &QPushButton::clicked, this, [this] { Press(ULoadRawDlg::kImport); });
    connect(from_device_, &QPushButton::clicked, this,
            [this] { Press(ULoadRawDlg::kImportFromDevice); });
    connect(list_, &QListWidget::currentRowChanged, this, [this](int row) {
        dialog_.OnSelchangeList(row);
        UpdateChoice();
    });
    connect(list_, &QListWidget::itemDoubleClicked, this, [this] { Press(ULoadRawDlg::kImport); });
    resize(420, 360);
    UpdateChoice();
}

void LoadRawForm::UpdateChoice() {
    details_->setPlainText(QString::fromStdWString(dialog_.GetDetails()));
    import_->setEnabled(dialog_.GetSelected() >= 0);
}

void LoadRawForm::Press(int id) {
    if (dialog_.GetSelected() < 0) return;
    dialog_.OnButton(id);
    QDialog::accept();
}

}  // namespace nedit
