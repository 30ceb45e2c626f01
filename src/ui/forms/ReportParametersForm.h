#pragma once
// "Report Parameters": output units and the columns of the reduction report.

#include <map>

#include "report/UOutputParamDlg.h"
#include "ui/forms/LogicForm.h"

class QButtonGroup;
class QCheckBox;

namespace nedit {

class ReportParametersForm : public LogicForm {
    Q_OBJECT
  public:
    ReportParametersForm(UOutputParamDlg& dialog, const FormContext& context, QWidget* parent);

    /// The box of a column, by its option id.
    QCheckBox* ColumnBox(int option) const { return columns_.at(option); }
    QButtonGroup* AngularGroup() const { return angular_; }
    QButtonGroup* LinearGroup() const { return linear_; }

  private:
    UOutputParamDlg& dialog_;
    QButtonGroup* angular_ = nullptr;
    QButtonGroup* linear_ = nullptr;
    std::map<int, QCheckBox*> columns_;
};

}  // namespace nedit
