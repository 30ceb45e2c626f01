#pragma once
// "Load Raw File Entry": the instruments whose drivers read raw files, the chosen one's
// description, and "Import..." to go on to the file. A double click on an instrument is
// "Import..." too. Enter does nothing, as the dialog has always had it; "Import from
// Device..." stays hidden. The form ends with the button that ended it.

#include "instruments/ULoadRawDlg.h"
#include "ui/forms/LogicForm.h"

class QListWidget;
class QPlainTextEdit;
class QPushButton;

namespace nedit {

class LoadRawForm : public LogicForm {
    Q_OBJECT
  public:
    LoadRawForm(ULoadRawDlg& dialog, const FormContext& context, QWidget* parent);

    QListWidget* InstrumentList() const { return list_; }
    QPlainTextEdit* DetailsBox() const { return details_; }
    QPushButton* ImportButton() const { return import_; }
    /// Presses a button of the dialog (ULoadRawDlg::kImport, kImportFromDevice).
    void Press(int id);

  private:
    void UpdateChoice();

    ULoadRawDlg& dialog_;
    QListWidget* list_;
    QPlainTextEdit* details_;
    QPushButton* import_;
    QPushButton* from_device_;
};

}  // namespace nedit
