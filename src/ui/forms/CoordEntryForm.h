#pragma once
// "Control Point Coordinate": where a point's coordinates come from, the job, the field
// records or values typed in. One row per source with a radio button; the typed row can
// be edited only while its radio is on. Easting comes first or second as the dialog's
// form (the job's coordinate order) says, and the cursor walks the columns in that order.
// Coordinates show in the job's length unit.

#include <array>

#include "reduction/UCoordEntryDlg.h"
#include "ui/forms/LogicForm.h"

class QButtonGroup;
class QCheckBox;
class QRadioButton;

namespace nedit {

class UEdit;

class CoordEntryForm : public LogicForm {
    Q_OBJECT
  public:
    CoordEntryForm(UCoordEntryDlg& dialog, const FormContext& context, QWidget* parent);

    QRadioButton* SourceButton(UCoordEntryDlg::Source source) const;
    /// A field of a row: column 0 East, 1 North, 2 Height.
    UEdit* Field(UCoordEntryDlg::Source source, int column) const;
    /// The fields of the typed row: East, North, Height.
    UEdit* EnteredField(int column) const { return Field(UCoordEntryDlg::Source::Enter, column); }
    QCheckBox* ApplyToAllBox() const { return apply_all_; }
    QCheckBox* FixedBox() const { return fixed_; }

  private:
    void UpdateEditable();

    UCoordEntryDlg& dialog_;
    QButtonGroup* sources_ = nullptr;
    std::array<std::array<UEdit*, 3>, 3> fields_{};
    QCheckBox* apply_all_ = nullptr;
    QCheckBox* fixed_ = nullptr;
};

}  // namespace nedit
