#include "HeadlessDialogHost.h"

namespace nedit {

int HeadlessDialogHost::ShowMessage(const std::wstring& text, unsigned flags, unsigned /*help*/) {
    messages_.push_back({text, flags});
    if (answers_.empty()) return mb::DefaultAnswer(flags);
    const int answer = answers_.front();
    answers_.pop_front();
    return answer;
}

int HeadlessDialogHost::Show(UDialogLogic& dialog, const Face* face) {
    dialogs_run_.push_back(dialog.DialogName());
    dialog.OnInitDialog();
    return face != nullptr ? (*face)(dialog) : Accept(dialog);
}

}  // namespace nedit
