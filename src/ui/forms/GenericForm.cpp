#include "ui/forms/GenericForm.h"

#include <QLabel>
#include <QVBoxLayout>

namespace nedit {

GenericForm::GenericForm(UDialogLogic& dialog, QWidget* parent)
    : LogicForm(dialog, QString::fromStdWString(dialog.DialogName()), parent) {
    dialog.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    auto* text = new QLabel(QStringLiteral("This dialog has no form in this build. OK accepts "
                                           "its values as they stand; Cancel leaves them."),
                            this);
    text->setWordWrap(true);
    layout->addWidget(text);
    AddButtons(layout);
}

}  // namespace nedit
