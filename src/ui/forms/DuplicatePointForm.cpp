#include "ui/forms/DuplicatePointForm.h"

#include <QAbstractButton>
#include <QButtonGroup>
#include <QCheckBox>
#include <QGridLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

DuplicatePointForm::DuplicatePointForm(DuplicatePtsDlg& dialog, const FormContext& context,
                                       QWidget* parent)
    : LogicForm(dialog, QString::fromStdWString(dialog.DialogName()), parent, context),
      dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    auto* message = new QLabel(QString::fromStdWString(dialog_.Message).trimmed(), this);
    message->setWordWrap(true);
    layout->addWidget(message);

    choices_ =
        maker.Radio("RADIO,1,", dialog_.Mode,
                    {{DuplicatePtsDlg::kOverwrite, QStringLiteral("Overwrite")},
                     {DuplicatePtsDlg::kNewNumber, QStringLiteral("Create with a new number:")},
                     {DuplicatePtsDlg::kPrefix, QStringLiteral("Create new with a prefix:")}});
    auto* grid = new QGridLayout();
    grid->addWidget(ChoiceButton(DuplicatePtsDlg::kOverwrite), 0, 0);
    grid->addWidget(ChoiceButton(DuplicatePtsDlg::kNewNumber), 1, 0);
    number_ = maker.Edit("POINTNAME", dialog_.NewNumber);
    grid->addWidget(number_, 1, 1);
    grid->addWidget(ChoiceButton(DuplicatePtsDlg::kPrefix), 2, 0);
    prefix_ = maker.Edit("POINTNAME,,,4", dialog_.Prefix);
    prefix_->setMaximumWidth(prefix_->fontMetrics().horizontalAdvance(QLatin1Char('W')) * 6);
    grid->addWidget(prefix_, 2, 1, Qt::AlignLeft);
    layout->addLayout(grid);
    apply_all_ =
        maker.Check("CHECK,0", QStringLiteral("Apply this method to the rest of the process"),
                    dialog_.ApplyAll);
    layout->addWidget(apply_all_);

    QDialogButtonBox* buttons = AddButtons(layout, QDialogButtonBox::Ok);
    buttons->addButton(QStringLiteral("Abort"), QDialogButtonBox::RejectRole);
    connect(&maker, &UDlgMaker::changed, this, &DuplicatePointForm::UpdateEditable);
    UpdateEditable();
}

QAbstractButton* DuplicatePointForm::ChoiceButton(int mode) const {
    return choices_->button(mode);
}

void DuplicatePointForm::UpdateEditable() {
    number_->setEnabled(dialog_.IsNumberEditEnabled());
    prefix_->setEnabled(dialog_.IsPrefixEditEnabled());
}

void DuplicatePointForm::Refused() {
    // The prefix gave a name the job has: the cursor goes back to it.
    prefix_->setFocus();
    prefix_->selectAll();
}

}  // namespace nedit
