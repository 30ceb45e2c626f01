#pragma once
// "Point Code": what a transfer writes into the job's point codes (string numbers, comments,
// commands, the code's description, the feature code) and whether the points are locked.
// OK keeps the choices as the last used values.

#include "transfer/UToSvyDlg.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;

namespace nedit {

class PointCodeForm : public LogicForm {
    Q_OBJECT
  public:
    PointCodeForm(UToSvyDlg& dialog, QWidget* parent);

    /// The check box of that text: "Include String Numbers", "Locked", ...
    QCheckBox* Box(const QString& text) const;
};

}  // namespace nedit
