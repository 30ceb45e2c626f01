#include "platform/messages/HeadlessDialogHost.h"

namespace nedit {

int HeadlessDialogHost::ShowMessage(const std::wstring& text, unsigned flags, unsigned /*help*/) {
    messages_.push_back({text, flags});
    if (answers_.empty()) return mb::DefaultAnswer(flags);
    const int answer = answers_.front();
    answers_.pop_front();
    return answer;
}

int HeadlessDialogHost::RunDialog(UDialogLogic& dialog) {
    dialogs_run_.push_back(dialog.DialogName());
    dialog.OnInitDialog();
    const auto script = scripts_.find(dialog.DialogName());
    if (script != scripts_.end()) return script->second(dialog);
    if (dialog.OnOK()) return mb::IdOk;
    dialog.OnCancel();
    return mb::IdCancel;
}

void HeadlessDialogHost::SetDialogScript(const std::wstring& dialog_name, DialogScript script) {
    scripts_[dialog_name] = std::move(script);
}

}  // namespace nedit
