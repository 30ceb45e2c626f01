#pragma once
// "Edit {1} Record": the record's row as it stands, then one line per field, its name and
// what it is, and its value in the job's units. A unit record shows its linear and angular
// unit as choices, an angular mode record its horizontal and vertical mode.

#include <vector>

#include "ui/dialogs/UEditRecordDlg.h"
#include "ui/forms/LogicForm.h"

class QButtonGroup;

namespace nedit {

class UEdit;

class EditRecordForm : public LogicForm {
    Q_OBJECT
  public:
    EditRecordForm(UEditRecordDlg& dialog, const FormContext& context, QWidget* parent);

    /// The edit of field `index`; null for a record that shows choices.
    UEdit* FieldEdit(int index) const;
    /// The choices of a unit record (Linear, Angular) or a mode record (Horizontal Angle,
    /// Vertical Angle); null for others.
    QButtonGroup* FirstChoice() const { return first_; }
    QButtonGroup* SecondChoice() const { return second_; }

    /// What a field id is, for its label ("Horizontal Angle"); empty for one not known.
    static QString Description(int fieldId);

  private:
    UEditRecordDlg& dialog_;
    std::vector<UEdit*> edits_;
    QButtonGroup* first_ = nullptr;
    QButtonGroup* second_ = nullptr;
};

}  // namespace nedit
