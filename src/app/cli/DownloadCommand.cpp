// sxnedit download --instrument NAME --port PORT: records from an instrument on a serial
// port, as they arrive, until the data end, the link closes, nothing comes for the time-out
// or Ctrl-C stops it. What arrived is kept in every case, and the raw data too.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <memory>

#include "Commands.h"
#include "PortOptions.h"
#include "Transfer.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/RawFiles.h"
#include "instruments/UDeviceManager.h"
#include "platform/text/WideText.h"

namespace {

struct DownloadOptions {
    TransferOptions transfer;
    PortOptions link;
    std::string raw;        // --raw: keep the raw data there
    double timeout = 10.0;  // seconds without a record before the link is given up
};

int DownloadRawData(const DownloadOptions& options) {
    if (!CheckTransferFiles(options.transfer,
                            RunFiles().Reads(options.link.port).Writes(options.raw))) {
        return exit_status::Failed;
    }
    TransferTarget target;
    if (const int status = target.Open(options.transfer)) return status;
    UDeviceManager& manager = target.Manager();
    const std::string raw = nedit::TemporaryRawFile();
    if (raw.empty()) {
        std::fprintf(stderr, "sxnedit: there is no folder of yours in the temporary directory\n");
        return exit_status::Failed;
    }
    if (!manager.OpenPort(nedit::FromUtf8(options.link.port), PortSettings(options.link))) {
        std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(manager.GetLastError()).c_str());
        return exit_status::Failed;
    }
    target.Doc().SetDownloadTimeOut(
        std::chrono::milliseconds(static_cast<long long>(options.timeout * 1000.0)));
    UListCtrl& list = target.List();
    int downloaded = 0;
    bool interrupted = false;
    {
        TerminalProgress progress(list, manager);
        target.Doc().SetProgressSink(&progress);
        downloaded = target.Doc().Download(nedit::FromUtf8(raw), &list);
        target.Doc().SetProgressSink(nullptr);
        interrupted = progress.Interrupted();
    }
    manager.ClosePort();
    if (!downloaded) {
        std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(manager.GetLastError()).c_str());
        return exit_status::Failed;
    }
    std::fprintf(stderr, "sxnedit: %d records (%lld bytes) received from %s%s\n",
                 list.GetItemCount(), manager.GetBytesReceived(), options.link.port.c_str(),
                 interrupted ? "; stopped by the user, what arrived is kept" : "");
    bool failed = interrupted || manager.LinkLost();
    if (!options.raw.empty() && !nedit::CopyRawFile(raw, options.raw)) {
        std::fprintf(stderr, "sxnedit: cannot write %s; the raw data are kept in %s\n",
                     options.raw.c_str(), raw.c_str());
        failed = true;
    }
    const int status = target.Deliver(options.transfer, "Downloaded", options.link.port);
    return failed && status == exit_status::Ok ? exit_status::Failed : status;
}

}  // namespace

void AddDownloadCommand(CLI::App& app, CommandRun& run) {
    auto options = std::make_shared<DownloadOptions>();
    CLI::App* download =
        app.add_subcommand("download",
                           "receive records from an instrument on a serial port until\n"
                           "its data end, the link closes, nothing comes for the\n"
                           "time-out or Ctrl-C; what arrived is kept. Port values not\n"
                           "given come from the port's stored settings");
    AddTransferOptions(*download, options->transfer);
    AddPortOptions(*download, options->link)->required();
    download->add_option("--raw", options->raw, "keep the raw data in this file")
        ->option_text("OUT");
    download
        ->add_option("--timeout", options->timeout,
                     "seconds without data before the link is given up (10)")
        ->check(CLI::PositiveNumber)
        ->option_text("SECONDS");
    download->callback([options, &run] { run = [options] { return DownloadRawData(*options); }; });
}
