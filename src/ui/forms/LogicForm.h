#pragma once
// The base of every form that shows a dialog logic object: OK first checks that every field
// holds a value of its kind (saying what is wrong and putting the cursor there), stores the
// widgets into the object, and closes only when the object's OnOK accepts; Cancel and Escape
// tell the object. Enter is OK, as in every dialog of the desktop.

#include <QDialog>
#include <QDialogButtonBox>

#include "platform/messages/DialogHost.h"

class QBoxLayout;
class UJobSettings;

namespace nedit {

class UDlgMaker;

/// What a form needs of where it is shown: the job whose units its fields show (null:
/// metres, ddd.mmss) and the host of its messages (null: a refusal is not said, the cursor
/// only goes to the field).
struct FormContext {
    const UJobSettings* job = nullptr;
    DialogHost* host = nullptr;
};

class LogicForm : public QDialog {
    Q_OBJECT
  public:
    LogicForm(UDialogLogic& logic, const QString& title, QWidget* parent,
              const FormContext& context = {});

    void accept() override;
    void reject() override;

    /// The binding of the form's controls, made on first use.
    UDlgMaker& Maker();

  protected:
    /// Takes the values of the widgets into the logic object, before its OnOK.
    virtual void Store() {}
    /// The logic object refused OK: the form may show why (the default does nothing).
    virtual void Refused() {}
    /// Adds the buttons at the foot of `layout`.
    QDialogButtonBox* AddButtons(
        QBoxLayout* layout, QDialogButtonBox::StandardButtons buttons = QDialogButtonBox::Ok |
                                                                        QDialogButtonBox::Cancel);
    const FormContext& Context() const { return context_; }

  private:
    /// The first enabled field whose text is no value of its kind is said and focused.
    bool FieldsAreValid();

    UDialogLogic& logic_;
    FormContext context_;
    UDlgMaker* maker_ = nullptr;
};

}  // namespace nedit
