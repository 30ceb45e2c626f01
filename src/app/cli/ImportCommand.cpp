// sxnedit import RAWFILE --instrument NAME: a raw file through its driver into neutral
// records, on standard output, in a file or in a new document of a job.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <memory>

#include "Commands.h"
#include "Transfer.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/UDeviceManager.h"
#include "platform/text/WideText.h"

namespace {

struct ImportOptions {
    std::string file;
    TransferOptions transfer;
};

int ImportRawFile(const ImportOptions& options) {
    if (!CheckTransferFiles(options.transfer, RunFiles().Reads(options.file))) {
        return exit_status::Failed;
    }
    TransferTarget target;
    if (const int status = target.Open(options.transfer)) return status;
    TerminalProgress progress(target.List(), target.Manager());
    target.Doc().SetProgressSink(&progress);
    const int imported = target.Doc().Import(nedit::FromUtf8(options.file), &target.List());
    target.Doc().SetProgressSink(nullptr);
    if (!imported) {
        std::fprintf(stderr, "sxnedit: %s\n",
                     nedit::ToUtf8(target.Manager().GetLastError()).c_str());
        return exit_status::Unreadable;
    }
    if (target.List().GetItemCount() == 0) {
        std::fprintf(stderr, "sxnedit: %s gave no records\n", options.file.c_str());
        return exit_status::Unreadable;
    }
    if (progress.Interrupted()) {
        std::fprintf(stderr, "sxnedit: import stopped; the %d records read are kept\n",
                     target.List().GetItemCount());
    }
    const int status = target.Deliver(options.transfer, "Imported", options.file);
    return progress.Interrupted() && status == exit_status::Ok ? exit_status::Failed : status;
}

}  // namespace

void AddImportCommand(CLI::App& app, CommandRun& run) {
    auto options = std::make_shared<ImportOptions>();
    CLI::App* import =
        app.add_subcommand("import",
                           "translate an instrument's raw file into neutral records,\n"
                           "on standard output, into OUT.neu or into a new document\n"
                           "of JOB; the units are the job's unless given");
    import->add_option("RAWFILE", options->file, "the instrument's raw file")->required();
    AddTransferOptions(*import, options->transfer);
    import->callback([options, &run] { run = [options] { return ImportRawFile(*options);
};
});
}
