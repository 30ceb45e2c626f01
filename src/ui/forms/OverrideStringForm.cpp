#include "ui/forms/OverrideStringForm.h"

#include <QCheckBox>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

#include "ui/forms/UDlgMaker.h"

namespace nedit {

OverrideStringForm::OverrideStringForm(UOverridePolyDlg& dialog, QWidget* parent)
    : LogicForm(dialog, QString::fromStdWString(dialog.DialogName()), parent) {
    dialog.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(new QLabel(QString::fromStdWString(dialog.GetMessage()), this));
    apply_all_ = Maker().Check("CHECK,0", QStringLiteral("Apply to All"), dialog.ApplyAll);
    layout->addWidget(apply_all_);
    QDialogButtonBox* buttons = AddButtons(layout, QDialogButtonBox::Yes | QDialogButtonBox::No);
    yes_ = buttons->button(QDialogButtonBox::Yes);
    no_ = buttons->button(QDialogButtonBox::No);
    no_->setDefault(true);
    // Each button takes its answer; both close the dialog with the check box as it stands.
    connect(yes_, &QPushButton::clicked, this, [this, &dialog] {
        dialog.OnYes();
        accept();
    });
    connect(no_, &QPushButton::clicked, this, [this, &dialog] {
        dialog.OnNo();
        accept();
    });
}

}  // namespace nedit
