// sxnedit traverse routes|adjust FILE.neu: the routes that a reduction finds among the
// set-ups, and the adjustment of one of them.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <memory>
#include <string>

#include "Commands.h"
#include "JsonLayout.h"
#include "RecordSession.h"
#include "ReductionOutput.h"
#include "RunFiles.h"
#include "TraverseOptions.h"
#include "TraverseRun.h"
#include "platform/text/WideText.h"
#include "traverse/CTraverse.h"
#include "traverse/TraverseRoutes.h"

namespace {

struct FileOptions {
    std::string file;
    std::string job;
    bool json = false;
    TraverseOptions traverse;
};

/// The session reduced from the file: Ok, Failed for a run that did not reach its end, or the
/// status of a job or file that could not be read.
int Reduce(const FileOptions& options, RecordSession& session, bool quiet) {
    const int started = session.Start(options.job, quiet);
    if (started != exit_status::Ok) return started;
    if (!session.Load(options.file, quiet)) return exit_status::Unreadable;
    return session.engine->Process() ? exit_status::Ok : exit_status::Failed;
}

int Routes(const FileOptions& options) {
    if (!RunFiles().Reads(options.file).Reads(options.job).Check()) return exit_status::Failed;
    RecordSession session;
    const int reduced = Reduce(options, session, options.json);
    if (reduced == exit_status::Unreadable || !session.engine) return reduced;
    const auto& routes = session.doc->GetTraverseRoutes().GetTraverseList();
    if (options.json) {
        json::Value all = json::Value::array();
        for (const nedit::NameList* route : routes) {
            json::Value names = json::Value::array();
            for (const nedit::NameEntry& entry : *route) names.push_back(json::Text(entry.Key));
            all.push_back(names);
        }
        std::printf("{\"routes\": %s}\n", json::Inline(all).c_str());
    } else {
        for (const nedit::NameList* route : routes)
            std::printf("%s\n", nedit::ToUtf8(nedit::RouteText(*route)).c_str());
    }
    return reduced;
}

int Adjust(const FileOptions& options) {
    const TraverseOptions& traverse = options.traverse;
    if (!RunFiles()
             .Reads(options.file)
             .Reads(options.job)
             .Reads(traverse.params)
             .Writes(traverse.report)
             .Writes(traverse.save)
             .Check()) {
        return exit_status::Failed;
    }
    TraverseRequest request;
    if (!ReadRequest(traverse, request)) return exit_status::Unreadable;
    RecordSession session;
    const int reduced = Reduce(options, session, traverse.json);
    if (reduced == exit_status::Unreadable || !session.engine) return reduced;
    UNeditDatabase& engine = *session.engine;
    const TraverseOutcome outcome =
        RunTraverse(engine, session.doc->GetTraverseRoutes(), session.host, request);
    const int status = WriteTraverseOutput(outcome, session.report.get(), traverse, session.host,
                                           session.doc->GetSettings().GetLengthDecimals());
    if (!traverse.save.empty()) {
        if (outcome.result != CTraverse::kDone) {
            std::fprintf(stderr, "sxnedit: %s is not written: the traverse was not adjusted\n",
                         traverse.save.c_str());
            return exit_status::Failed;
        }
        // What saving does to the rows before it stores them.
        engine.SaveAdjustedPt2CtrlList(session.list.get());
        if (!session.doc->Save(nedit::FromUtf8(traverse.save), session.list.get())) {
            std::fprintf(stderr, "sxnedit: cannot write %s\n", traverse.save.c_str());
            return exit_status::Failed;
        }
    }
    return status;
}

}  // namespace

void AddTraverseCommands(CLI::App& app, CommandRun& run) {
    CLI::App* traverse = app.add_subcommand("traverse", "the traverses among the set-ups");
    traverse->require_subcommand(1);

    auto listing = std::make_shared<FileOptions>();
    CLI::App* routes =
        traverse->add_subcommand("routes",
                                 "reduce the file and print the routes found among its\n"
                                 "set-ups, in the order found, one a line (\"A,B,C,D,\")");
    routes->add_option("FILE.neu", listing->file, "the neutral file")->required();
    routes->add_option("--job", listing->job, "take known points from this job")
        ->option_text("JOB");
    routes->add_flag("--json", listing->json, "print {\"routes\": [[\"A\", \"B\"], ...]}");
    routes->callback([listing, &run] { run = [listing] { return Routes(*listing); }; });

    auto adjusting = std::make_shared<FileOptions>();
    CLI::App* adjust =
        traverse->add_subcommand("adjust",
                                 "reduce the file and adjust a traverse; a value not given\n"
                                 "takes the route dialog's default from the reduced data,\n"
                                 "and the messages tell every value used");
    adjust->add_option("FILE.neu", adjusting->file, "the neutral file")->required();
    adjust->add_option("--job", adjusting->job, "take known points from this job")
        ->option_text("JOB");
    AddTraverseOptions(*adjust, adjusting->traverse);
    adjust->callback([adjusting, &run] {
        CheckOutputOptions(adjusting->traverse.report, adjusting->traverse.json);
        run = [adjusting] { return Adjust(*adjusting); };
    });
}
