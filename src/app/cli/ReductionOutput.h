#pragma once
// What a reduction gives, as the command line prints and writes it.
//
// Decision: the arithmetic stands as it is, and the report prints what it gives; but a point
// whose coordinates came out as no finite number (an overflow, say of a scale of 1e308) is
// named in the run's messages and left out of the table, the JSON and the points file, so
// that no program reads "inf" as a coordinate or null as "no height", and the run fails.
// A circle that came out so is left out alike.

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "PointOutput.h"

class ConsoleDialogHost;
class UNeditDatabase;
class UNeditReport;

/// One JSON object: points, lines, arcs, circles (those with finite numbers), the engine's
/// error code and the messages, given to `write` a piece at a time (a survey's points are
/// never laid out whole in memory). False when `write` refused a piece.
bool WriteReductionJson(const UNeditDatabase& engine, const std::vector<std::wstring>& messages,
                        const std::function<bool(std::string_view)>& write);

/// Throws CLI::ValidationError when the JSON and the report would both go to standard output.
void CheckOutputOptions(const std::string& reportPath, bool json);

/// Writes the report to `path`, "-" to standard output; nothing without a report or a path.
/// False, after a message, when the file cannot be written.
bool WriteReport(const UNeditReport* report, const std::string& path);

/// Where a reduction's results go.
struct ReductionOutputs {
    std::string report;  // a file, "-" for standard output, empty for none
    std::string points;  // the points file, empty for none
    bool json = false;   // the JSON on standard output, else the table of points
    int decimals = 3;    // of the table
};

/// Tells through `host` of points and circles that are no finite numbers, then writes the
/// report, the JSON or the table of points (unless the report took standard output) and the
/// points file. Gives the exit status: Failed, after a message, when a file cannot be
/// written or something was left out; else Ok.
int WriteReductionOutput(const UNeditDatabase& engine, const UNeditReport* report,
                         const ReductionOutputs& outputs, ConsoleDialogHost& host);
