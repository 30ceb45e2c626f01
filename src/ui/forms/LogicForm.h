#pragma once
// The base of every form that shows a dialog logic object: OK stores the widgets into the
// object and closes only when the object's OnOK accepts; Cancel tells the object.

#include <QDialog>
#include <QDialogButtonBox>

#include "platform/messages/DialogHost.h"

class QBoxLayout;

namespace nedit {

class LogicForm : public QDialog {
    Q_OBJECT
  public:
    LogicForm(UDialogLogic& logic, const QString& title, QWidget* parent);

    void accept() override;
    void reject() override;

  protected:
    /// Takes the values of the widgets into the logic object, before its OnOK.
    virtual void Store() {}
    /// Adds the buttons at the foot of `layout`.
    QDialogButtonBox* AddButtons(
        QBoxLayout* layout, QDialogButtonBox::StandardButtons buttons = QDialogButtonBox::Ok |
                                                                        QDialogButtonBox::Cancel);

  private:
    UDialogLogic& logic_;
};

}  // namespace nedit
