#pragma once
// The desktop's DialogHost: message boxes as modal Qt message boxes with the system's
// buttons and icons, and every dialog logic object in a modal form bound to it. A dialog
// that has no form of its own yet is shown in a generic form that says so and accepts the
// logic object's defaults with OK. Forms show lengths and angles in the units of the job
// whose document is active, and say their refusals through this host.
//
// Forms and message boxes are shown through ExecForm and ExecMessage, which tests override
// to answer without a screen.

#include <QString>
#include <type_traits>

#include "platform/messages/DialogHost.h"
#include "ui/forms/LogicForm.h"

class QDialog;
class QMessageBox;
class QWidget;
class UJobSettings;

namespace nedit {

class QtDialogHost : public DialogHost {
  public:
    /// The window title of every message box.
    static constexpr const char* kTitle = "SXNedit";

    /// A host whose forms are modal over `parent`; it gives every dialog that has a form of
    /// its own that form, and every other the generic one.
    explicit QtDialogHost(QWidget* parent = nullptr);
    ~QtDialogHost() override;

    void SetParent(QWidget* parent) { parent_ = parent; }
    QWidget* Parent() const { return parent_; }
    /// The settings of the job whose document is active: forms show and read angles and
    /// lengths in its units. Null gives metres and ddd.mmss.
    void SetJobSettings(const UJobSettings* settings) { settings_ = settings; }
    /// Unattended, nothing is shown: every message box gets its default button's answer and
    /// every dialog is accepted as it stands, as the command line answers.
    void SetUnattended(bool unattended) { unattended_ = unattended; }

    int ShowMessage(const std::wstring& text, unsigned flags, unsigned help) override;

  protected:
    /// Shows the dialog's form, or the generic form for a dialog without one of its own;
    /// gives mb::IdOk when it was accepted, else mb::IdCancel.
    int Show(UDialogLogic& dialog, const Face* face) override;

    /// Runs a form modally; gives QDialog::Accepted or Rejected.
    virtual int ExecForm(QDialog& form);
    /// Runs a message box modally; gives the standard button pressed.
    virtual int ExecMessage(QMessageBox& box);

  private:
    int Exec(QDialog& form);
    template <typename Form, typename Dialog>
    int ShowForm(Dialog& dialog) {
        if constexpr (std::is_constructible_v<Form, Dialog&, const FormContext&, QWidget*>) {
            Form form(dialog, FormContext{settings_, this}, parent_);
            return Exec(form);
        } else {
            Form form(dialog, parent_);
            return Exec(form);
        }
    }
    /// Shows dialogs of type `Dialog` in forms of type `Form` from now on.
    template <typename Form, typename Dialog>
    void SetForm() {
        SetFace<Dialog>([this](Dialog& dialog) { return ShowForm<Form>(dialog); });
    }

    QWidget* parent_;
    const UJobSettings* settings_ = nullptr;
    bool unattended_ = false;
};

}  // namespace nedit
