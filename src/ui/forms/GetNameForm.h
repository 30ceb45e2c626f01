#pragma once
// The name of a raw-data document: a list of the job's documents to open one from, or a
// name to save one under.

#include "ui/dialogs/UGetNameDlg.h"
#include "ui/forms/LogicForm.h"

class QLineEdit;
class QListWidget;

namespace nedit {

class GetNameForm : public LogicForm {
    Q_OBJECT
  public:
    GetNameForm(UGetNameDlg& dialog, QWidget* parent);

    QLineEdit* NameField() const { return name_; }

  protected:
    void Store() override;

  private:
    UGetNameDlg& dialog_;
    QListWidget* names_;
    QLineEdit* name_;
};

}  // namespace nedit
