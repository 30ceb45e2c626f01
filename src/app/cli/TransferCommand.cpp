// sxnedit transfer FILE.neu --job JOB: reduce a neutral file and save it to the survey.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <memory>
#include <string>

#include "Commands.h"
#include "RecordSession.h"
#include "RunFiles.h"
#include "SurveyTransfer.h"
#include "platform/text/WideText.h"

namespace {

struct TransferCommandOptions {
    std::string file;
    std::string job;
    SurveyTransferOptions transfer;
};

int Transfer(const TransferCommandOptions& options) {
    if (!RunFiles().Reads(options.file).Reads(options.job).Check()) return exit_status::Failed;
    RecordSession session;
    session.host.SetInteractive(options.transfer.interactive);
    const int started = session.Start(options.job, options.transfer.json);
    if (started != exit_status::Ok) return started;
    if (!session.Load(options.file, options.transfer.json)) return exit_status::Unreadable;
    UNeditDatabase& engine = *session.engine;
    if (engine.Process() != 1) {
        std::fprintf(stderr,
                     "sxnedit: the reduction of %s did not reach its end; nothing was saved to "
                     "the job\n",
                     options.file.c_str());
        return exit_status::Failed;
    }
    return SaveToSurvey(*session.doc, engine, session.host, options.transfer,
                        nedit::FromUtf8(options.file));
}

}  // namespace

void AddTransferCommand(CLI::App& app, CommandRun& run) {
    auto options = std::make_shared<TransferCommandOptions>();
    CLI::App* transfer =
        app.add_subcommand("transfer",
                           "reduce a neutral file and save its points, lines, arcs,\n"
                           "circles and strings to the job (\"Save To Survey\")");
    transfer->add_option("FILE.neu", options->file, "the neutral file")->required();
    transfer->add_option("--job", options->job, "the job to save to")
        ->option_text("JOB")
        ->required();
    AddSurveyTransferOptions(*transfer, options->transfer);
    transfer->callback([options, &run] { run = [options] { return Transfer(*options); }; });
}
