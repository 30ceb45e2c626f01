#pragma once
// The command line's dialog host. Unattended, it answers as "Apply to All" would: a point's
// coordinates come from the job if it offers them, else from the field records, else the
// entered values; every message box takes its default button. With `interactive` it asks
// on the terminal instead. Every message shown is kept, in order, for the JSON output.
// It has faces for the coordinate and back-bearing dialogs and for the questions of a
// transfer to the job (a point of other coordinates, a polyline of the same name, locked
// layers); every other dialog is accepted as it stands.

#include <cstdio>
#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

class DuplicatePtsDlg;
class UBKBCoordDlg;
class UCoordEntryDlg;
class UOverridePolyDlg;
namespace nedit {
class LockedLayersQuestion;
}

class ConsoleDialogHost : public nedit::DialogHost {
  public:
    /// `echo` prints each message on standard error as it is shown.
    explicit ConsoleDialogHost(bool interactive = false, bool echo = true);

    int ShowMessage(const std::wstring& text, unsigned flags, unsigned help) override;

    void SetInteractive(bool interactive) { Interactive = interactive; }
    void SetEcho(bool echo) { Echo = echo; }
    const std::vector<std::wstring>& Messages() const { return MessagesShown; }

    /// The questions of a transfer, asked on the terminal; each gives how the dialog ended.
    int AskDuplicatePoint(DuplicatePtsDlg& dialog);
    int AskOverrideString(UOverridePolyDlg& dialog);
    int AskLockedLayers(nedit::LockedLayersQuestion& question);

  protected:
    int Show(nedit::UDialogLogic& dialog, const Face* face) override;

  private:
    int AskMessage(const std::wstring& text, unsigned flags);
    int AskCoordinates(UCoordEntryDlg& dialog);
    int AskBackStation(UBKBCoordDlg& dialog);
    /// A line from the terminal; empty at the end of input, after which InputEnded holds.
    std::string ReadAnswer(const std::string& prompt);
    bool InputEnded() const;

    bool Interactive;
    bool Echo;
    std::vector<std::wstring> MessagesShown;
};
