#include "ui/forms/GetNameForm.h"

#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QVBoxLayout>

namespace nedit {

GetNameForm::GetNameForm(UGetNameDlg& dialog, QWidget* parent)
    : LogicForm(dialog, QString::fromStdWString(dialog.DialogName()), parent),
      dialog_(dialog),
      names_(new QListWidget(this)),
      name_(new QLineEdit(QString::fromStdWString(dialog.Name), this)) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(new QLabel(QStringLiteral("Raw data in the job:"), this));
    for (const std::wstring& name : dialog_.GetNames())
        names_->addItem(QString::fromStdWString(name));
    layout->addWidget(names_);
    layout->addWidget(new QLabel(QStringLiteral("Name:"), this));
    layout->addWidget(name_);
    name_->setReadOnly(dialog_.GetMode() == UGetNameDlg::Mode::Open);
    connect(names_, &QListWidget::currentTextChanged, name_, &QLineEdit::setText);
    connect(names_, &QListWidget::itemDoubleClicked, this, &GetNameForm::accept);
    if (dialog_.GetMode() == UGetNameDlg::Mode::Open && names_->count() > 0)
        names_->setCurrentRow(0);
    AddButtons(layout);
}

void GetNameForm::Store() {
    dialog_.Name = name_->text().toStdWString();
}

}  // namespace nedit
