#pragma once
// A DialogHost without a screen, for tests: it records every message and dialog, answers
// message boxes from a queue or with the default button, and shows a dialog through the face
// a test gave for its type, or accepts it with its defaults.

#include <deque>
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

    int ShowMessage(const std::wstring& text, unsigned flags, unsigned help) override;

    /// The next message box gets this answer instead of its default.
    void QueueAnswer(int answer) { answers_.push_back(answer); }

    const std::vector<Message>& Messages() const { return messages_; }
    /// The dialogs run so far, by name, in order.
    const std::vector<std::wstring>& DialogsRun() const { return dialogs_run_; }

  protected:
    /// OnInitDialog, then the face for the dialog's type when the test gave one; without
    /// one the dialog is accepted with its defaults (a refusal of OnOK cancels it).
    int Show(UDialogLogic& dialog, const Face* face) override;

  private:
    std::deque<int> answers_;
    std::vector<Message> messages_;
    std::vector<std::wstring> dialogs_run_;
};

}  // namespace nedit
