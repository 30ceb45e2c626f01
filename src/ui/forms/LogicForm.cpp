#include "ui/forms/LogicForm.h"

#include <QBoxLayout>

#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

LogicForm::LogicForm(UDialogLogic& logic, const QString& title, QWidget* parent,
                     const FormContext& context)
    : QDialog(parent), logic_(logic), context_(context) {
    setWindowTitle(title);
    setObjectName(QString::fromStdWString(logic.DialogName()));
}

UDlgMaker& LogicForm::Maker() {
    if (maker_ == nullptr) maker_ = new UDlgMaker(context_.job, this);
    return *maker_;
}

bool LogicForm::FieldsAreValid() {
    for (UEdit* field : findChildren<UEdit*>()) {
        const QString problem = field->Problem();
        if (problem.isEmpty() || !field->isEnabled()) continue;
        AppMessageBox(context_.host, problem.toStdWString(), mb::Ok | mb::IconExclamation);
        field->setFocus();
        field->selectAll();
        return false;
    }
    return true;
}

void LogicForm::accept() {
    if (!FieldsAreValid()) return;
    if (maker_ != nullptr) maker_->UpdateData(true);
    Store();
    if (logic_.OnOK()) {
        QDialog::accept();
    } else {
        Refused();
    }
}

void LogicForm::reject() {
    logic_.OnCancel();
    QDialog::reject();
}

QDialogButtonBox* LogicForm::AddButtons(QBoxLayout* layout,
                                        QDialogButtonBox::StandardButtons buttons) {
    auto* box = new QDialogButtonBox(buttons, this);
    connect(box, &QDialogButtonBox::accepted, this, &LogicForm::accept);
    connect(box, &QDialogButtonBox::rejected, this, &LogicForm::reject);
    layout->addWidget(box);
    return box;
}

}  // namespace nedit
