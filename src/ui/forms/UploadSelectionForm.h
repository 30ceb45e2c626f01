#pragma once
// "Selection Screen Entry": where the points to send to an instrument come from, which layers
// go, and the ranges that choose the points. A range's From and To can be filled only while
// its box is ticked; the layer lists hold the job's layers, the code lists are typed in, and
// heights show the job's length unit.

#include <map>

#include "instruments/UUploadSource.h"
#include "ui/forms/LogicForm.h"

class QButtonGroup;
class QCheckBox;

namespace nedit {

class UploadSelectionForm : public LogicForm {
    Q_OBJECT
  public:
    UploadSelectionForm(UUploadSource& dialog, const FormContext& context, QWidget* parent);

    QButtonGroup* SourceGroup() const { return source_; }
    QButtonGroup* LayerGroup() const { return layers_; }
    /// The box of a range by its control number (1122 points, 1123 layers, 1124 codes, 1025
    /// heights, 1120 window, 1121 screen).
    QCheckBox* Box(int id) const { return boxes_.at(id); }
    /// The From and To of a range's box.
    QWidget* From(int id) const { return ranges_.at(id).first; }
    QWidget* To(int id) const { return ranges_.at(id).second; }

  private:
    void UpdateEnabling();

    UUploadSource& dialog_;
    QButtonGroup* source_ = nullptr;
    QButtonGroup* layers_ = nullptr;
    std::map<int, QCheckBox*> boxes_;
    std::map<int, std::pair<QWidget*, QWidget*>> ranges_;
};

}  // namespace nedit
