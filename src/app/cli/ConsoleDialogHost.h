#pragma once
// The command line's dialog host: messages go to standard error, and every question is
// answered with its default button, since nobody is there to press one.

#include "platform/messages/DialogHost.h"

class ConsoleDialogHost : public nedit::DialogHost {
public:
    int ShowMessage(const std::wstring& text, unsigned flags, unsigned help) override;
    int RunDialog(nedit::UDialogLogic& dialog) override;

    int MessagesShown() const { return messages_shown_; }

private:
    int messages_shown_ = 0;
};
