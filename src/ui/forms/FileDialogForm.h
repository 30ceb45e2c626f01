#pragma once
// The desktop's file dialog for a UFileDialog: open or save, its filter, start folder,
// default extension and overwrite prompt; the path chosen goes back as UTF-8.

#include <QFileDialog>
#include <QStringList>

#include "platform/messages/UFileDialog.h"

namespace nedit {

class FileDialogForm : public QFileDialog {
    Q_OBJECT
  public:
    FileDialogForm(UFileDialog& dialog, QWidget* parent);

    void accept() override;
    void reject() override;

    /// The system's filter ("GSI (*.gsi)|*.gsi|All Files (*.*)|*.*||") as the name filters
    /// of the dialog ("GSI (*.gsi)", "All Files (*)").
    static QStringList NameFilters(const std::wstring& filter);

  private:
    UFileDialog& dialog_;
};

}  // namespace nedit
