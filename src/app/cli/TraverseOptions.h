#pragma once
// The options that `traverse adjust` and `doc traverse` share: the parameters (a file or the
// flags), and where the results go.

#include <string>

#include "TraverseRequest.h"

namespace CLI {
class App;
}

class ConsoleDialogHost;
class UNeditReport;
struct TraverseOutcome;

struct TraverseOptions {
    std::string params;  // P.json; excludes the flags
    TraverseFlags flags;
    bool json = false;
    std::string report;  // a file, "-" for standard output, empty for none
    std::string save;    // the rows after saving, as a neutral file
};

/// Adds the options to `command`; the help tells the defaults the dialog takes.
void AddTraverseOptions(CLI::App& command, TraverseOptions& options);

/// The request of the options; false after a message on standard error.
bool ReadRequest(const TraverseOptions& options, TraverseRequest& request);

/// Tells what saving keeps of an adjustment, then writes the report, and the JSON or the
/// text of the outcome. Gives the exit status: Ok for a traverse adjusted, else Failed.
int WriteTraverseOutput(const TraverseOutcome& outcome, const UNeditReport* report,
                        const TraverseOptions& options, ConsoleDialogHost& host, int decimals);
