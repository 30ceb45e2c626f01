// sxnedit reduce FILE.neu: a full reduction of a neutral file, its points as a table, as
// JSON, or as a CSV file.

#include <CLI/CLI.hpp>
#include <algorithm>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "Commands.h"
#include "RecordSession.h"
#include "ReductionOutput.h"
#include "RunFiles.h"
#include "platform/text/WideText.h"
#include "report/OutParamStruct.h"

namespace {

// The output units of the report, in the order of their indexes.
const std::vector<std::string> kAngleUnits = {"dms", "deg", "gon"};
const std::vector<std::string> kLengthUnits = {"m", "ft", "usft"};

struct ReduceOptions {
    std::string file;
    std::string job;
    std::string points_csv;
    std::string report;  // a file, or "-" for standard output
    std::string angles;  // empty keeps the job's output units
    std::string lengths;
    std::string columns;
    bool columns_given = false;  // else the columns of NEDIT.INI
    bool json = false;
    bool interactive = false;
};

int IndexOf(const std::vector<std::string>& choices, const std::string& word) {
    return static_cast<int>(std::find(choices.begin(), choices.end(), word) - choices.begin());
}

// Column tokens as --columns takes them, separated by commas: empty when they all are known.
std::string CheckColumns(const std::string& columns) {
    std::size_t start = 0;
    while (start <= columns.size()) {
        const std::size_t comma = std::min(columns.find(',', start), columns.size());
        const std::string token = columns.substr(start, comma - start);
        if (!token.empty() && !IsColumnToken(nedit::FromUtf8(token))) {
            return "'" + token + "' is no column (ID,LN,HA,VA,SD,HD,VD,HT,CO,EC,NC,HC)";
        }
        start = comma + 1;
    }
    return {};
}

int Reduce(const ReduceOptions& options) {
    if (!RunFiles()
             .Reads(options.file)
             .Reads(options.job)
             .Writes(options.report)
             .Writes(options.points_csv)
             .Check()) {
        return exit_status::Failed;
    }
    RecordSession session;
    session.host.SetInteractive(options.interactive);
    const int started = session.Start(options.job, options.json);
    if (started != exit_status::Ok) return started;
    OutParamStruct& parameters = session.doc->GetOutputParameters();
    if (!options.angles.empty()) parameters.AngularUnit = IndexOf(kAngleUnits, options.angles);
    if (!options.lengths.empty()) parameters.LinearUnit = IndexOf(kLengthUnits, options.lengths);
    if (options.columns_given) SetFlagsFromOrder(parameters, nedit::FromUtf8(options.columns));

    if (!session.Load(options.file, options.json)) return exit_status::Unreadable;
    UNeditDatabase& engine = *session.engine;
    // A report nobody asked for is still made, since it takes part in the reduction, but its
    // text is not kept.
    session.report->SetKeepText(!options.report.empty());
    const int result = engine.Process();
    ReductionOutputs outputs;
    outputs.report = options.report;
    outputs.points = options.points_csv;
    outputs.json = options.json;
    outputs.decimals = session.doc->GetSettings().GetLengthDecimals();
    const int status = WriteReductionOutput(engine, session.report.get(), outputs, session.host);
    if (status != exit_status::Ok) return status;
    return result == 1 ? exit_status::Ok : exit_status::Failed;
}

}  // namespace

void AddReduceCommand(CLI::App& app, CommandRun& run) {
    auto options = std::make_shared<ReduceOptions>();
    CLI::App* reduce =
        app.add_subcommand("reduce",
                           "reduce the observations to East, North, Height and print\n"
                           "the points; questions are answered as \"Apply to All\"\n"
                           "would (job, else field records, else entered values)");
    reduce->add_option("FILE.neu", options->file, "the neutral file")->required();
    reduce->add_option("--job", options->job, "take known points from this job")
        ->option_text("JOB");
    reduce->add_flag("--json", options->json,
                     "print points, lines, arcs, circles, the error code and\n"
                     "the messages as JSON");
    reduce
        ->add_option("--points", options->points_csv,
                     "write name,east,north,height,code rows that\n"
                     "'job import-points' reads")
        ->option_text("OUT.csv");
    reduce->add_flag("--interactive", options->interactive, "ask the questions on the terminal");
    reduce->add_option("--report", options->report, "write the reduction report; - prints it")
        ->option_text("OUT.txt|-");
    reduce->add_option("--angles", options->angles, "the report's angle unit for this run")
        ->check(CLI::IsMember(kAngleUnits))
        ->option_text("dms|deg|gon");
    reduce->add_option("--lengths", options->lengths, "the report's length unit for this run")
        ->check(CLI::IsMember(kLengthUnits))
        ->option_text("m|ft|usft");
    CLI::Option* columns =
        reduce
            ->add_option("--columns", options->columns,
                         "the columns of the report's observation tables,\n"
                         "of ID,LN,HA,VA,SD,HD,VD,HT,CO,EC,NC,HC")
            ->check(CLI::Validator([](std::string& text) { return CheckColumns(text); }, "COLUMNS"))
            ->option_text("COLUMNS");
    reduce->callback([options, columns, &run] {
        options->columns_given = columns->count() > 0;
        CheckOutputOptions(options->report, options->json);
        run = [options] { return Reduce(*options); };
    });
}
