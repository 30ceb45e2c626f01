#pragma once
// "Modified Selected Records": a box and a value for each change, the station's code and
// instrument height above, the target's code and height below. A box that does not concern
// the rows selected is disabled, and a value can be typed only while its box is ticked. The
// heights show the job's length unit.

#include <map>

#include "ui/dialogs/NEdit_Global_Edit.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;

namespace nedit {

class UEdit;

class GlobalEditForm : public LogicForm {
    Q_OBJECT
  public:
    GlobalEditForm(NEdit_Global_Edit& dialog, const FormContext& context, QWidget* parent);

    /// The check box of a change, by its number (NEdit_Global_Edit::kStnCodeBox, ...).
    QCheckBox* Box(int box) const { return boxes_.at(box); }
    /// The value that goes with a box.
    UEdit* Value(int box) const { return values_.at(box); }

  private:
    void UpdateEnabling();

    NEdit_Global_Edit& dialog_;
    std::map<int, QCheckBox*> boxes_;
    std::map<int, UEdit*> values_;
};

}  // namespace nedit
