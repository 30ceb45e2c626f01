#pragma once
// A DialogHost without a screen: it records every message and answers from a script, or
// with the default button when the script has run out. Used by tests and unattended runs.

#include <deque>
#include <functional>
#include <map>
#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

namespace nedit {

class HeadlessDialogHost : public DialogHost {
  public:
    struct Message {
        std::wstring text;
        unsigned flags;
    };
    /// Fills in or changes a dialog's members, then gives how it ends (mb::IdOk, ...).
    using DialogScript = std::function<int(UDialogLogic&)>;

    int ShowMessage(const std::wstring& text, unsigned flags, unsigned help) override;
    /// Runs the script for the dialog's name when there is one. Otherwise the dialog is
    /// accepted with its defaults: OnInitDialog, then OnOK (a refusal cancels it).
    int RunDialog(UDialogLogic& dialog) override;

    /// The next message box gets this answer instead of its default.
    void QueueAnswer(int answer) { answers_.push_back(answer); }
    void SetDialogScript(const std::wstring& dialog_name, DialogScript script);

    const std::vector<Message>& Messages() const { return messages_; }
    /// The dialogs run so far, by name, in order.
    const std::vector<std::wstring>& DialogsRun() const { return dialogs_run_; }

  private:
    std::deque<int> answers_;
    std::map<std::wstring, DialogScript> scripts_;
    std::vector<Message> messages_;
    std::vector<std::wstring> dialogs_run_;
};

}  // namespace nedit
