#pragma once
// An export of a job: what the command line and the desktop both run. It reads the job's
// objects on the layers asked for, lays them out in the format asked for and writes each
// file whole (ReplaceFile: a plain file is renamed into place, so a failed export leaves the
// old file as it was).
//
// The caller checks the outputs first (never an input, a read-only file, ...), and keeps the
// coordinate system in the job when the user gives one; the request carries the one to use.
//
// What a format cannot hold is said in the messages, never dropped without a word: a CSV
// holds points only, LandXML the points and the survey's observations only.

#include <string>
#include <vector>

#include "exports/ExportFormat.h"
#include "exports/JobContents.h"

class USurveyDoc;

namespace nedit {

/// The observations of a raw-data document for LandXML: its name and rows.
struct ExportDocument {
    std::string name;
    std::vector<std::wstring> rows;
};

struct ExportRequest {
    ExportFormat format = ExportFormat::Csv;
    std::string output;
    std::vector<std::string> layers;           // none: every layer
    std::string crs;                           // "EPSG:NNNN", or empty for none
    const ExportDocument* document = nullptr;  // LandXML: the observations under Survey
    std::string stamp;  // LandXML: the time written, "YYYY-MM-DDTHH:MM:SS"; empty: now (UTC)
};

struct ExportResult {
    bool written = false;
    std::vector<std::string> files;     // the files written
    std::vector<std::string> messages;  // what a format left out, or why nothing was written
    JobContents contents;               // what was read from the job
    int observations = 0;               // observations of the document written (LandXML)
};

/// Runs the export. Never throws: a failure comes back with written false and its reason.
ExportResult ExportJob(USurveyDoc& job, const ExportRequest& request);

}  // namespace nedit
