#pragma once
// "Back Bearing": the back station's coordinates, or, with "Apply Bearing" ticked, the
// bearing to it, typed in the job's angle unit. OK only.

#include "reduction/UBKBCoordDlg.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;
class UJobSettings;

namespace nedit {

class NumberField;

class BackBearingForm : public LogicForm {
    Q_OBJECT
  public:
    /// `settings` give the angle unit of the bearing; without them ddd.mmss.
    BackBearingForm(UBKBCoordDlg& dialog, const UJobSettings* settings, QWidget* parent);

    QCheckBox* ApplyBearingBox() const { return apply_bearing_; }
    NumberField* BearingField() const { return bearing_; }

  protected:
    void Store() override;

  private:
    void UpdateEditable();

    UBKBCoordDlg& dialog_;
    const UJobSettings* settings_;
    NumberField* east_;
    NumberField* north_;
    NumberField* height_;
    NumberField* bearing_;
    QCheckBox* apply_bearing_;
};

}  // namespace nedit
