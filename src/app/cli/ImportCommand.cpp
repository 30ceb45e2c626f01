// sxnedit import RAWFILE --instrument NAME: a raw file through its driver into neutral
// records, on standard output, in a file or in a new document of a job.

#include <cstdio>

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

bool ParseOptions(const std::vector<std::string>& args, ImportOptions& options) {
    const auto file = [&options](const std::vector<std::string>& words, std::size_t& i) {
        if (words[i].empty() || words[i][0] == '-' || !options.file.empty()) return false;
        options.file = words[i];
        return true;
    };
    if (!ParseTransferArguments(args, "import", options.transfer, file)) return false;
    if (!options.file.empty()) return true;
    std::fprintf(stderr, "sxnedit: import needs a raw file (see sxnedit --help)\n");
    return false;
}

int ImportRawFile(const ImportOptions& options) {
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

int RunImport(const std::vector<std::string>& args) {
    ImportOptions options;
    if (!ParseOptions(args, options)) return exit_status::Usage;
    return ImportRawFile(options);
}
