#include "ui/forms/LogicForm.h"

#include <QBoxLayout>

namespace nedit {

LogicForm::LogicForm(UDialogLogic& logic, const QString& title, QWidget* parent)
    : QDialog(parent), logic_(logic) {
    setWindowTitle(title);
    setObjectName(QString::fromStdWString(logic.DialogName()));
}

void LogicForm::accept() {
    Store();
    if (logic_.OnOK()) QDialog::accept();
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
