#include "ConsoleDialogHost.h"

#include <cstdio>

#include "platform/text/WideText.h"

int ConsoleDialogHost::ShowMessage(const std::wstring& text, unsigned flags, unsigned /*help*/) {
    ++messages_shown_;
    std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(text).c_str());
    return nedit::mb::DefaultAnswer(flags);
}

int ConsoleDialogHost::RunDialog(nedit::UDialogLogic& dialog) {
    dialog.OnInitDialog();
    if (dialog.OnOK()) return nedit::mb::IdOk;
    dialog.OnCancel();
    return nedit::mb::IdCancel;
}
