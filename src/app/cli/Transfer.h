#pragma once
// What the import and download commands share: their common options, the document that
// receives the records (free-standing, or a new document of a job), where the records go
// afterwards, and the progress line with Ctrl-C as abort.

#include <csignal>
#include <functional>
#include <memory>
#include <string>

#include "ConsoleDialogHost.h"
#include "RunFiles.h"
#include "platform/messages/ProgressSink.h"

namespace CLI {
class App;
}

class UDeviceManager;
class UListCtrl;
class UNeditDoc;
class URawDataContainer;
class USurveyDoc;

/// The options both commands take.
struct TransferOptions {
    std::string instrument;
    std::string output;  // -o: a neutral file
    std::string job;     // --job: a new document of this job
    std::string name;    // --name: the document's name
    int angles = -1;     // --angles: 0 dms, 1 deg, 2 gon; -1 the job's
    int lengths = -1;    // --lengths: 0 m, 1 ft, 2 usft; -1 the job's
};

/// Adds the options of TransferOptions to `command`: --instrument (required), -o or --job
/// (not both), --name (only with --job), --angles and --lengths.
void AddTransferOptions(CLI::App& command, TransferOptions& options);

/// The files of the transfer: the job is read, -o is written. False, with the reason on
/// standard error, when an output may not be written.
bool CheckTransferFiles(const TransferOptions& options, RunFiles files);

/// Loads the driver of `instrument`; on failure says why and which drivers there are, and
/// gives the exit status (0 when loaded).
int LoadDriver(UDeviceManager& manager, const std::string& instrument);

/// The document that receives the records, with its list and the console host.
class TransferTarget {
  public:
    TransferTarget();
    ~TransferTarget();

    /// Opens the job when one is given (and checks that the name is free), makes the
    /// document, applies the units of the options and loads the driver. On failure the
    /// reason is on standard error and the exit status is given; else 0.
    int Open(const TransferOptions& options);
    UNeditDoc& Doc() { return *Document; }
    UListCtrl& List();
    UDeviceManager& Manager();
    ConsoleDialogHost& Host() { return ConsoleHost; }

    /// Sends the records where the options say: the file of -o, the new document of the job
    /// (reported as "`verb` SOURCE as NAME"), or standard output. Gives the exit status.
    int Deliver(const TransferOptions& options, const std::string& verb, const std::string& source);

  private:
    ConsoleDialogHost ConsoleHost;
    std::unique_ptr<USurveyDoc> Job;
    std::unique_ptr<URawDataContainer> Container;
    std::unique_ptr<UNeditDoc> Document;
    std::wstring Name;
};

/// The progress line on standard error, when that is a terminal, and Ctrl-C as the user's
/// abort for the time the object lives.
class TerminalProgress : public nedit::ProgressSink {
  public:
    TerminalProgress(const UListCtrl& list, const UDeviceManager& manager);
    ~TerminalProgress() override;

    void Update(int percent, const std::wstring& text) override;
    /// True when Ctrl-C was pressed.
    bool Interrupted() const;

  private:
    const UListCtrl& List;
    const UDeviceManager& Manager;
    bool Terminal;
    bool Shown = false;
    long long LastShown = 0;  // milliseconds
    struct sigaction Previous {};
};
