#pragma once
// "Control Point Coordinate": where a point's coordinates come from, the job, the field
// records or values typed in. One row per source with a radio button; the typed row can
// be edited only while its radio is on. Easting comes first or second as the dialog's
// form (the job's coordinate order) says.

#include <array>

#include "reduction/UCoordEntryDlg.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;
class QRadioButton;

namespace nedit {

class NumberField;

class CoordEntryForm : public LogicForm {
    Q_OBJECT
  public:
    CoordEntryForm(UCoordEntryDlg& dialog, QWidget* parent);

    QRadioButton* SourceButton(UCoordEntryDlg::Source source) const;
    /// The fields of the typed row: East, North, Height.
    NumberField* EnteredField(int column) const { return entered_[column]; }
    QCheckBox* ApplyToAllBox() const { return apply_all_; }

  protected:
    void Store() override;

  private:
    void Choose(UCoordEntryDlg::Source source);

    UCoordEntryDlg& dialog_;
    std::array<QRadioButton*, 3> sources_{};
    std::array<NumberField*, 3> entered_{};
    QCheckBox* apply_all_ = nullptr;
    QCheckBox* fixed_ = nullptr;
};

}  // namespace nedit
