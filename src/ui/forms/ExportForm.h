#pragma once
// "Export": the form of UExportDlg. The format, the file (typed, or chosen with Browse...), the
// job's layers to tick (none ticked: all), the coordinate system, and for LandXML the open
// document's observations. A refusal of OK is said through the host and the cursor goes to
// the file.

#include "exports/UExportDlg.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;
class QComboBox;
class QLineEdit;
class QListWidget;

namespace nedit {

class ExportForm : public LogicForm {
    Q_OBJECT
  public:
    ExportForm(UExportDlg& dialog, const FormContext& context, QWidget* parent);

    QComboBox* FormatList() const { return format_; }
    QLineEdit* FileField() const { return file_; }
    QListWidget* LayerList() const { return layers_; }
    QLineEdit* CrsField() const { return crs_; }
    QCheckBox* DocumentBox() const { return document_; }

  protected:
    void Store() override;
    void Refused() override;

  private:
    void Browse();
    void FormatChosen();

    UExportDlg& dialog_;
    QComboBox* format_;
    QLineEdit* file_;
    QListWidget* layers_;
    QLineEdit* crs_;
    QCheckBox* document_;
};

}  // namespace nedit
