#pragma once
// "Back Bearing": the back station's coordinates, or, with "Apply Bearing" ticked, the
// bearing to it. Coordinates show in the job's length unit and its coordinate order, the
// bearing in its angle unit. OK only.

#include "reduction/UBKBCoordDlg.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;

namespace nedit {

class UEdit;

class BackBearingForm : public LogicForm {
    Q_OBJECT
  public:
    BackBearingForm(UBKBCoordDlg& dialog, const FormContext& context, QWidget* parent);

    QCheckBox* ApplyBearingBox() const { return apply_bearing_; }
    UEdit* EastField() const { return east_; }
    UEdit* NorthField() const { return north_; }
    UEdit* HeightField() const { return height_; }
    UEdit* BearingField() const { return bearing_; }

  private:
    void UpdateEditable();

    UBKBCoordDlg& dialog_;
    UEdit* east_ = nullptr;
    UEdit* north_ = nullptr;
    UEdit* height_ = nullptr;
    UEdit* bearing_ = nullptr;
    QCheckBox* apply_bearing_ = nullptr;
};

}  // namespace nedit
