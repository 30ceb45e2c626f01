#pragma once
// "Edit Record Data": one line per field of the record, its name and its value.

#include <vector>

#include "ui/dialogs/UEditRecordDlg.h"
#include "ui/forms/LogicForm.h"

class QLineEdit;

namespace nedit {

class EditRecordForm : public LogicForm {
    Q_OBJECT
  public:
    EditRecordForm(UEditRecordDlg& dialog, QWidget* parent);

    QLineEdit* FieldEdit(int index) const { return edits_.at(static_cast<std::size_t>(index)); }

  protected:
    void Store() override;

  private:
    UEditRecordDlg& dialog_;
    std::vector<QLineEdit*> edits_;
};

}  // namespace nedit
