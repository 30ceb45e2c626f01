// sxnedit download --instrument NAME --port PORT: records from an instrument on a serial
// port, as they arrive, until the data end, the link closes, nothing comes for the time-out
// or Ctrl-C stops it. What arrived is kept in every case, and the raw data too.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <map>
#include <memory>
#include <optional>

#include "Commands.h"
#include "Transfer.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/RawFiles.h"
#include "instruments/UDeviceManager.h"
#include "instruments/UPortSetting.h"
#include "platform/text/WideText.h"

namespace {

struct DownloadOptions {
    TransferOptions transfer;
    std::string port;
    std::optional<int> baud;
    std::optional<int> dataBits;
    std::optional<nedit::StopBits> stopBits;
    std::optional<nedit::Parity> parity;
    std::optional<nedit::FlowControl> flow;
    std::string raw;        // --raw: keep the raw data there
    double timeout = 10.0;  // seconds without a record before the link is given up
};

// The port's stored settings with the options laid over them.
nedit::SerialSettings PortSettings(const DownloadOptions& options) {
    nedit::SerialSettings settings = UPortSetting::LoadSettings(nedit::FromUtf8(options.port));
    settings.baud = options.baud.value_or(settings.baud);
    settings.dataBits = options.dataBits.value_or(settings.dataBits);
    settings.stopBits = options.stopBits.value_or(settings.stopBits);
    settings.parity = options.parity.value_or(settings.parity);
    settings.flow = options.flow.value_or(settings.flow);
    return settings;
}

int DownloadRawData(const DownloadOptions& options) {
    if (!CheckTransferFiles(options.transfer, RunFiles().Reads(options.port).Writes(options.raw))) {
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
    if (!manager.OpenPort(nedit::FromUtf8(options.port), PortSettings(options))) {
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
                 list.GetItemCount(), manager.GetBytesReceived(), options.port.c_str(),
                 interrupted ? "; stopped by the user, what arrived is kept" : "");
    bool failed = interrupted || manager.LinkLost();
    if (!options.raw.empty() && !nedit::CopyRawFile(raw, options.raw)) {
        std::fprintf(stderr, "sxnedit: cannot write %s; the raw data are kept in %s\n",
                     options.raw.c_str(), raw.c_str());
        failed = true;
    }
    const int status = target.Deliver(options.transfer, "Downloaded", options.port);
    return failed && status == exit_status::Ok ? exit_status::Failed : status;
}

}  // namespace

void AddDownloadCommand(CLI::App& app, CommandRun& run) {
    using nedit::FlowControl;
    using nedit::Parity;
    using nedit::StopBits;
    auto options = std::make_shared<DownloadOptions>();
    CLI::App* download =
        app.add_subcommand("download",
                           "receive records from an instrument on a serial port until\n"
                           "its data end, the link closes, nothing comes for the\n"
                           "time-out or Ctrl-C; what arrived is kept. Port values not\n"
                           "given come from the port's stored settings");
    AddTransferOptions(*download, options->transfer);
    download->add_option("--port", options->port, "the port: COM1..COM8 or a device")
        ->required()
        ->option_text("COM1|DEVICE");
    download->add_option("--baud", options->baud, "bits per second")
        ->check(CLI::PositiveNumber)
        ->option_text("N");
    download->add_option("--data-bits", options->dataBits, "data bits")
        ->check(CLI::Range(5, 8))
        ->option_text("5..8");
    const std::map<std::string, StopBits> stopBits = {
        {"1", StopBits::One}, {"1.5", StopBits::OneAndHalf}, {"2", StopBits::Two}};
    download->add_option("--stop-bits", options->stopBits, "stop bits")
        ->transform(CLI::CheckedTransformer(stopBits))
        ->option_text("1|1.5|2");
    const std::map<std::string, Parity> parities = {{"none", Parity::None},
                                                    {"odd", Parity::Odd},
                                                    {"even", Parity::Even},
                                                    {"mark", Parity::Mark},
                                                    {"space", Parity::Space}};
    download->add_option("--parity", options->parity, "parity")
        ->transform(CLI::CheckedTransformer(parities, CLI::ignore_case))
        ->option_text("none|odd|even|mark|space");
    const std::map<std::string, FlowControl> flows = {{"none", FlowControl::None},
                                                      {"xon/xoff", FlowControl::XonXoff},
                                                      {"xonxoff", FlowControl::XonXoff},
                                                      {"hardware", FlowControl::Hardware}};
    download->add_option("--flow", options->flow, "flow control")
        ->transform(CLI::CheckedTransformer(flows, CLI::ignore_case))
        ->option_text("none|xon/xoff|hardware");
    download->add_option("--raw", options->raw, "keep the raw data in this file")
        ->option_text("OUT");
    download
        ->add_option("--timeout", options->timeout,
                     "seconds without data before the link is given up (10)")
        ->check(CLI::PositiveNumber)
        ->option_text("SECONDS");
    download->callback([options, &run] { run = [options] { return DownloadRawData(*options); }; });
}
