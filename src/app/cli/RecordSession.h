#pragma once
// What every command that reads records needs: the raw-data document with the record
// definition loaded, a record list, a dialog host, the report and an engine, wired together.

#include <memory>
#include <string>

#include "ConsoleDialogHost.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "platform/job/USurveyDoc.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

struct RecordSession {
    /// Installs the default NEDIT.INI when there is none and makes the document on `job` (may
    /// be null); false, with a message on standard error, when the record definition cannot
    /// be loaded.
    bool Start(USurveyDoc* job = nullptr);
    /// The engine, always with its report, as the document builds it: the report takes part
    /// in the reduction (a back station of known position orients a station only when there
    /// is one), so a run without it would give other points.
    UNeditDatabase& StartEngine();
    /// Opens the job at `path` (none for an empty path) and starts on it, the host echoing
    /// messages unless `quiet`. Exit status Ok, or Unreadable or Failed after a message.
    int Start(const std::string& jobPath, bool quiet);
    /// Starts the engine and loads the neutral file into the rows; false when it cannot be
    /// read, after its messages (on standard error when `quiet` kept them off it).
    bool Load(const std::string& path, bool quiet);

    ConsoleDialogHost host;
    std::unique_ptr<USurveyDoc> openedJob;  // the job of Start(jobPath), if any
    std::unique_ptr<UNeditDoc> doc;
    std::unique_ptr<UListCtrl> list;
    std::unique_ptr<UNeditReport> report;
    std::unique_ptr<UNeditDatabase> engine;
};
