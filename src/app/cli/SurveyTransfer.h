#pragma once
// "Save To Survey" on the command line, as `transfer` and `doc transfer` share it: the answers
// to the transfer's questions from options, the run inside one transaction of its own, and
// what was written, left out and said.
//
// A surveyor's job is never changed by a default they did not choose: a question that no
// option answers (and --interactive does not put to the terminal) is a conflict. The run then
// goes on with a provisional answer only to find every conflict; afterwards nothing is
// written, the conflicts are listed, and the command fails.

#include <string>

namespace CLI {
class App;
}

class ConsoleDialogHost;
class UNeditDatabase;
class UNeditDoc;

struct SurveyTransferOptions {
    std::string existing;          // overwrite, prefix=TEXT, renumber or abort; empty: no answer
    std::string replacePolylines;  // yes or no; empty: no answer
    std::string unlockLayers;      // yes or no; empty: no answer
    bool interactive = false;
    bool json = false;
};

/// Adds --existing, --replace-polylines, --unlock-layers, --interactive and --json.
void AddSurveyTransferOptions(CLI::App& command, SurveyTransferOptions& options);

/// Writes the stores of `engine` into the job of `doc`, answering through `host` as the
/// options say, and prints what was written (a line of counts, or the JSON). `source` names
/// the survey in the job's record of the transfer (empty: the document's name). The exit
/// status: Ok when the run came to its end and was kept, else Failed.
int SaveToSurvey(UNeditDoc& doc, const UNeditDatabase& engine, ConsoleDialogHost& host,
                 const SurveyTransferOptions& options, const std::wstring& source = L"");
