#pragma once
// "Coordinate Change To Existing Point In Database": what to do with a point that the job
// holds with other coordinates. "Overwrite", "Create with a new number:" or "Create new with
// a prefix:", each enabling only its own edit, and whether the choice holds for the rest of
// the transfer. OK gives the end code of the choice; "Abort" stops the transfer. A prefix
// that would give a name the job has is refused, and the cursor goes to it.

#include "transfer/DuplicatePtsDlg.h"
#include "ui/forms/LogicForm.h"

class QAbstractButton;
class QButtonGroup;
class QCheckBox;

namespace nedit {

class UEdit;

class DuplicatePointForm : public LogicForm {
    Q_OBJECT
  public:
    DuplicatePointForm(DuplicatePtsDlg& dialog, const FormContext& context, QWidget* parent);

    /// The radio of a choice (DuplicatePtsDlg::kOverwrite, kPrefix, kNewNumber).
    QAbstractButton* ChoiceButton(int mode) const;
    UEdit* NumberField() const { return number_; }
    UEdit* PrefixField() const { return prefix_; }
    QCheckBox* ApplyAllBox() const { return apply_all_; }

  protected:
    void Refused() override;

  private:
    void UpdateEditable();

    DuplicatePtsDlg& dialog_;
    QButtonGroup* choices_ = nullptr;
    UEdit* number_ = nullptr;
    UEdit* prefix_ = nullptr;
    QCheckBox* apply_all_ = nullptr;
};

}  // namespace nedit
