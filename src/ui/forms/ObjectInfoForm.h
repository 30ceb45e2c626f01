#pragma once
// The read-only forms of a picked point, line or arc: a heading and rows of label and
// value, with OK only. The values can be selected and copied.

#include "ui/dialogs/ObjectInfoDialogs.h"
#include "ui/forms/LogicForm.h"

namespace nedit {

class ObjectInfoForm : public LogicForm {
    Q_OBJECT
  public:
    ObjectInfoForm(UObjectInfoDlg& dialog, QWidget* parent);
};

}  // namespace nedit
