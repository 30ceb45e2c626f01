#pragma once
// The pane's instrument commands without windows: "Import Raw File" (command 34651),
// "Download Raw Data..." (34603) and what goes with them: the end of a download, its abort
// commands, keeping the raw file, and the patterns of a driver's raw files. The pane owns
// one and passes its windows in through UTransferView.
//
// Decisions:
// - A driver that cannot be loaded and a port that cannot be opened are said in a message:
//   the user cannot otherwise tell why nothing happened.
// - A download always receives into the temporary raw file. When the user asked to keep the
//   raw file, it is copied to the chosen path once the download has ended, whole or not at
//   all; a kill at any moment leaves the chosen file as it was or complete, and the
//   temporary file holds everything that arrived either way.
// - "Import from Device..." only loads and unloads the driver, as its dialog keeps it hidden.

#include <functional>
#include <string>

#include "platform/messages/DialogHost.h"

class UListCtrl;
class UNeditDoc;

/// What the commands do to the pane's windows; each call may do nothing.
class UTransferView {
  public:
    virtual ~UTransferView() = default;
    /// Blocks or lets through mouse input in the graphic view.
    virtual void BlockMouse(bool /*block*/) {}
    /// Empties the record form: its label and its field controls.
    virtual void ClearForm() {}
    /// Clears the graphic view's selected line, resets its extents and redraws it.
    virtual void ShowNewData() {}
    /// Runs `transfer`, the records of a raw file or (with `download`) of an instrument
    /// coming into the list, as the window shows such work; gives what it gives.
    virtual int Transfer(bool /*download*/, const std::function<int()>& transfer) {
        return transfer();
    }
    /// Runs `reduce`, which replaces the document's engine, as the window shows a reduction;
    /// gives what it gives.
    virtual int Reduction(const std::function<int()>& reduce) { return reduce(); }
};

class UInstrumentCommands {
  public:
    static constexpr const wchar_t* kDirectoryKey = L"LastOpenDirectoryNeutral";

    /// The commands act on `doc` and its `list`; `view` may be null.
    UInstrumentCommands(UNeditDoc& doc, UListCtrl& list, nedit::DialogHost* host,
                        UTransferView* view = nullptr);

    /// "Import Raw File": the instrument, the file (or a file of a mobile device), then the
    /// rows of the list are replaced by the file's records and reduced. Gives 1 when a file
    /// was imported.
    int OnImportRawfile();
    /// "Download Raw Data...": parameters, port, raw file, then the rows are replaced by what
    /// arrives, and reduced. Gives 1 when a download ran.
    int OnNeditDownload();
    /// Ends what a download left behind: the driver is unloaded and the mouse let through.
    void StopDownload();
    /// Command 33300: the running download or import stops after its current step.
    void OnAbortProcess();
    /// Command 1201: stops and ends the transfer at once.
    void OnCancelButtonClicked();
    /// Command 34649.
    void OnNeditDownloadAbort() { StopDownload(); }
    /// Copies the raw file of the last download to a path the user chooses; 1 when copied.
    int SaveRawFile();

    /// The driver's raw file patterns: `patterns` "(*.gsi;*.gs8)" and `list` "*.gsi;*.gs8".
    /// 0 without a driver manager.
    int GetDeviceDriverFileExt(const std::wstring& device, bool, std::wstring& patterns,
                               std::wstring& list);

    bool GetSaveRaw() const { return SaveRaw; }
    bool GetAckNak() const { return AckNak; }
    bool IsDownloadActive() const { return DownloadActive; }
    const std::wstring& GetDeviceFileExt() const { return DeviceFileExt; }
    /// Where the bytes of the last download are.
    static const std::string& GetRawFilePath() { return RawFilePath; }

  private:
    /// Asks "Overwrite Existing Data?" when the list has rows; false for no.
    bool MayOverwrite();
    /// The file a raw import reads, copied from a mobile device when it lies on one; empty
    /// when that failed (the user was told). `copy` is the copy to delete afterwards.
    std::string LocalRawFile(const std::string& path, std::string& copy);
    /// Reduces what came in and shows it.
    void Reduce();
    void Tell(const std::wstring& text);
    /// Ends a download command that did not get to run: the port closed, the driver gone.
    int GiveUp();

    UNeditDoc& Doc;
    UListCtrl& List;
    nedit::DialogHost* Host;
    UTransferView NoView;
    UTransferView& View;
    bool SaveRaw = false;
    bool AckNak = false;
    bool DownloadActive = false;
    std::wstring DeviceFileExt;
    static std::string RawFilePath;
};
