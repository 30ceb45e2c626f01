#pragma once
// Dialogs and message boxes in the middle of an algorithm go through a DialogHost that the
// caller was given. The desktop shows real windows, the command line answers by policy or
// at the terminal, and tests script the answers; the logic is the same in all three.
//
// A dialog shows itself by a typed call, host.Run(*this). A host has a face for each kind of
// dialog it knows, given by type with SetFace<UCoordEntryDlg>(...); every other dialog is
// shown by the host's default face, which a host must have. So a new dialog needs nothing
// but its own class: no host has to learn it, and there is no list of dialogs to extend.
// Faces are kept by the type a dialog is run as, which is the type its own code names.

#include <functional>
#include <string>
#include <type_traits>
#include <typeindex>
#include <typeinfo>
#include <unordered_map>

namespace nedit {

/// Message box buttons, icons and answers, with the numbers the system has always used
/// (a question with Yes and No is 36: YesNo | IconQuestion).
namespace mb {
constexpr unsigned Ok = 0x00;
constexpr unsigned OkCancel = 0x01;
constexpr unsigned AbortRetryIgnore = 0x02;
constexpr unsigned YesNoCancel = 0x03;
constexpr unsigned YesNo = 0x04;
constexpr unsigned RetryCancel = 0x05;
constexpr unsigned ButtonsMask = 0x0F;
constexpr unsigned IconStop = 0x10;
constexpr unsigned IconQuestion = 0x20;
constexpr unsigned IconExclamation = 0x30;
constexpr unsigned IconInformation = 0x40;
constexpr unsigned IconMask = 0xF0;
constexpr unsigned DefButton2 = 0x100;
constexpr unsigned DefButton3 = 0x200;
constexpr unsigned DefButtonMask = 0xF00;

constexpr int IdOk = 1;
constexpr int IdCancel = 2;
constexpr int IdAbort = 3;
constexpr int IdRetry = 4;
constexpr int IdIgnore = 5;
constexpr int IdYes = 6;
constexpr int IdNo = 7;

/// The answer given by the default button of a message box with these flags.
int DefaultAnswer(unsigned flags);
}  // namespace mb

/// The logic of one modal dialog: its members, defaults and handlers. A host shows it and
/// reports how it ended; everything else is tested without a screen.
class UDialogLogic {
  public:
    virtual ~UDialogLogic();
    /// The dialog's title, which a host shows and records of what was shown keep.
    virtual std::wstring DialogName() const = 0;
    /// Called once before the dialog is shown.
    virtual void OnInitDialog() {}
    /// Validates and takes the values; false keeps the dialog open.
    virtual bool OnOK() { return true; }
    virtual void OnCancel() {}
};

class DialogHost {
  public:
    virtual ~DialogHost();
    /// Shows an already translated message; gives the answer (mb::IdOk, mb::IdYes, ...).
    virtual int ShowMessage(const std::wstring& text, unsigned flags, unsigned help) = 0;

    /// Runs `dialog` modally, through this host's face for its type or else its default face.
    /// Gives mb::IdOk when it was accepted, else mb::IdCancel or the dialog's own end code.
    template <class Dialog>
    int Run(Dialog& dialog) {
        static_assert(std::is_base_of_v<UDialogLogic, Dialog>, "a dialog is a UDialogLogic");
        const auto face = Faces.find(std::type_index(typeid(Dialog)));
        return Show(dialog, face == Faces.end() ? nullptr : &face->second);
    }

    /// Shows dialogs of type `Dialog` through `face` from now on, in place of the default
    /// face; the face fills in or changes the dialog and gives how it ended.
    template <class Dialog>
    void SetFace(std::function<int(Dialog&)> face) {
        static_assert(std::is_base_of_v<UDialogLogic, Dialog>, "a dialog is a UDialogLogic");
        // Run looks a face up by the very type it was given for, so the dialog is a Dialog.
        Faces[std::type_index(typeid(Dialog))] = [face = std::move(face)](UDialogLogic& dialog) {
            return face(static_cast<Dialog&>(dialog));
        };
    }

  protected:
    using Face = std::function<int(UDialogLogic&)>;
    /// Shows a dialog: through `face` when the host has one for its type, else through the
    /// host's default face.
    virtual int Show(UDialogLogic& dialog, const Face* face) = 0;
    /// The end of a dialog accepted as it stands: OnOK, and mb::IdOk; when OnOK refuses,
    /// OnCancel and mb::IdCancel.
    static int Accept(UDialogLogic& dialog);

  private:
    std::unordered_map<std::type_index, Face> Faces;
};

/// Shows `text` through `host`. Without a host nothing is shown and the default button's
/// answer is given, so engines run unattended behave as if the user pressed Enter.
int AppMessageBox(DialogHost* host, const std::wstring& text, unsigned flags, unsigned help = 0);

}  // namespace nedit
