#include "platform/messages/DialogHost.h"

namespace nedit {

int mb::DefaultAnswer(unsigned flags) {
    static const int kButtons[6][3] = {
        {IdOk, IdOk, IdOk},      {IdOk, IdCancel, IdCancel}, {IdAbort, IdRetry, IdIgnore},
        {IdYes, IdNo, IdCancel}, {IdYes, IdNo, IdNo},        {IdRetry, IdCancel, IdCancel},
    };
    const unsigned buttons = flags & ButtonsMask;
    const unsigned which = (flags & DefButtonMask) >> 8;
    if (buttons > 5 || which > 2) return IdOk;
    return kButtons[buttons][which];
}

UDialogLogic::~UDialogLogic() = default;
DialogHost::~DialogHost() = default;

int DialogHost::Accept(UDialogLogic& dialog) {
    if (dialog.OnOK()) return mb::IdOk;
    dialog.OnCancel();
    return mb::IdCancel;
}

int AppMessageBox(DialogHost* host, const std::wstring& text, unsigned flags, unsigned help) {
    if (host == nullptr) return mb::DefaultAnswer(flags);
    return host->ShowMessage(text, flags, help);
}

}  // namespace nedit
