#pragma once
// "Override String": the job holds a polyline of the name of a string being written. "Yes"
// replaces it, "No" (the default, and Escape) keeps it and writes another of that name;
// "Apply to All" makes the answer stand for the strings that follow.

#include "transfer/UOverridePolyDlg.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;
class QPushButton;

namespace nedit {

class OverrideStringForm : public LogicForm {
    Q_OBJECT
  public:
    OverrideStringForm(UOverridePolyDlg& dialog, QWidget* parent);

    QPushButton* YesButton() const { return yes_; }
    QPushButton* NoButton() const { return no_; }
    QCheckBox* ApplyAllBox() const { return apply_all_; }

  private:
    QPushButton* yes_ = nullptr;
    QPushButton* no_ = nullptr;
    QCheckBox* apply_all_ = nullptr;
};

}  // namespace nedit
