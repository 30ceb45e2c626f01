#pragma once
// The form of a dialog that has no face of its own yet: it names the dialog, says that its
// defaults will be taken, and runs the logic object's OnOK on OK.

#include "ui/forms/LogicForm.h"

namespace nedit {

class GenericForm : public LogicForm {
    Q_OBJECT
  public:
    GenericForm(UDialogLogic& dialog, QWidget* parent);
};

}  // namespace nedit
