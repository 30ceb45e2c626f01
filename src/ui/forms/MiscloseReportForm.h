#pragma once
// "Traverse Misclose Report": how far the traverse misses its fixed point, the observed end
// beside the fixed one and their differences, the misclose as a bearing and a distance, the
// angular error, the enclosed area, the accuracy and the length. "Angles" and "Coordinates"
// run the stages of the adjustment, after which the figures and the title show the stage
// reached, which also heads the form; OK goes on to reduce the side shots and save the points,
// Cancel gives up. Coordinates stand in the job's order and units; the figures cannot be typed in.

#include "traverse/UMisReportDlg.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;
class QLabel;
class QPushButton;

namespace nedit {

class UEdit;

class MiscloseReportForm : public LogicForm {
    Q_OBJECT
  public:
    MiscloseReportForm(UMisReportDlg& dialog, const FormContext& context, QWidget* parent);

    QPushButton* AnglesButton() const { return angles_; }
    QPushButton* CoordinatesButton() const { return coordinates_; }
    QCheckBox* AdjustElevationsBox() const { return elevations_; }
    /// The field of a figure, by its label: "East Diff", "Misclose Bearing", "Accuracy", ...
    /// and "Fixed East", "Observed North", ... for the two points.
    UEdit* Figure(const QString& label) const;

  private:
    /// Shows the figures, the title and the enabling of the stage reached.
    void ShowStage();

    UMisReportDlg& dialog_;
    QLabel* stage_ = nullptr;
    QPushButton* angles_ = nullptr;
    QPushButton* coordinates_ = nullptr;
    QCheckBox* elevations_ = nullptr;
    UEdit* angular_error_ = nullptr;
    UEdit* per_station_ = nullptr;
};

}  // namespace nedit
