// sxnedit reduce FILE.neu: a full reduction of a neutral file, its points as a table, as
// JSON, or as a CSV file.

#include <algorithm>
#include <cstdio>
#include <initializer_list>
#include <string>

#include "Commands.h"
#include "PointOutput.h"
#include "RecordSession.h"
#include "ReductionOutput.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"
#include "report/OutParamStruct.h"

namespace {

struct ReduceOptions {
    std::string file;
    std::string job;
    std::string points_csv;
    std::string report;  // a file, or "-" for standard output
    int angles = -1;     // report output units; -1 keeps the job's
    int lengths = -1;
    std::string columns;
    bool columns_given = false;
    bool json = false;
    bool interactive = false;
};

// The place of `word` in `choices`, or -1.
int Choice(const std::string& word, std::initializer_list<const char*> choices) {
    int index = 0;
    for (const char* choice : choices) {
        if (word == choice) return index;
        ++index;
    }
    return -1;
}

// Column tokens as --columns takes them, separated by commas.
bool ValidColumns(const std::string& columns) {
    std::size_t start = 0;
    while (start <= columns.size()) {
        const std::size_t comma = std::min(columns.find(',', start), columns.size());
        const std::wstring token = nedit::FromUtf8(columns.substr(start, comma - start));
        if (!token.empty() && !IsColumnToken(token)) return false;
        start = comma + 1;
    }
    return true;
}

bool ParseOptions(const std::vector<std::string>& args, ReduceOptions& options) {
    for (std::size_t i = 0; i < args.size(); ++i) {
        const std::string& arg = args[i];
        const bool has_value = i + 1 < args.size();
        if (arg == "--json") {
            options.json = true;
        } else if (arg == "--interactive") {
            options.interactive = true;
        } else if (arg == "--job" && has_value) {
            options.job = args[++i];
        } else if (arg == "--points" && has_value) {
            options.points_csv = args[++i];
        } else if (arg == "--report" && has_value) {
            options.report = args[++i];
        } else if (arg == "--angles" && has_value &&
                   (options.angles = Choice(args[i + 1], {"dms", "deg", "gon"})) >= 0) {
            ++i;
        } else if (arg == "--lengths" && has_value &&
                   (options.lengths = Choice(args[i + 1], {"m", "ft", "usft"})) >= 0) {
            ++i;
        } else if (arg == "--columns" && has_value && ValidColumns(args[i + 1])) {
            options.columns = args[++i];
            options.columns_given = true;
        } else if (!arg.empty() && arg[0] != '-' && options.file.empty()) {
            options.file = arg;
        } else {
            std::fprintf(stderr, "sxnedit: reduce: unexpected '%s' (see sxnedit --help)\n",
                         arg.c_str());
            return false;
        }
    }
    if (options.file.empty()) {
        std::fprintf(stderr, "sxnedit: reduce needs a neutral file (see sxnedit --help)\n");
        return false;
    }
    return CheckOutputOptions(options.report, options.json);
}

}  // namespace

int RunReduce(const std::vector<std::string>& args) {
    ReduceOptions options;
    if (!ParseOptions(args, options)) return exit_status::Usage;
    std::unique_ptr<USurveyDoc> job;
    if (!options.job.empty()) {
        try {
            job = USurveyDoc::OpenJob(options.job);
        } catch (const nedit::JobError& error) {
            std::fprintf(stderr, "sxnedit: %s\n", error.what());
            return exit_status::Unreadable;
        }
    }
    RecordSession session;
    session.host.SetInteractive(options.interactive);
    session.host.SetEcho(!options.json);
    if (!session.Start(job.get())) return exit_status::Failed;
    OutParamStruct& parameters = session.doc->GetOutputParameters();
    if (options.angles >= 0) parameters.AngularUnit = options.angles;
    if (options.lengths >= 0) parameters.LinearUnit = options.lengths;
    if (options.columns_given) SetFlagsFromOrder(parameters, nedit::FromUtf8(options.columns));

    UNeditDatabase& engine = session.StartEngine(!options.report.empty());
    if (!engine.LoadNeFile(nedit::FromUtf8(options.file))) {
        if (options.json) {
            for (const std::wstring& message : session.host.Messages()) {
                std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(message).c_str());
            }
        }
        return exit_status::Unreadable;
    }
    const int result = engine.Process();
    if (!WriteReductionOutput(engine, session.report.get(), options.report, options.json,
                              session.host.Messages(),
                              session.doc->GetSettings().GetLengthDecimals())) {
        return exit_status::Failed;
    }
    if (!options.points_csv.empty() && !WritePointsCsv(options.points_csv, ReducedPoints(engine))) {
        return exit_status::Failed;
    }
    return result == 1 ? exit_status::Ok : exit_status::Failed;
}
