// sxnedit download --instrument NAME --port PORT: records from an instrument on a serial
// port, as they arrive, until the data end, the link closes, nothing comes for the time-out
// or Ctrl-C stops it. What arrived is kept in every case, and the raw data too.

#include <cstdio>
#include <optional>

#include "Commands.h"
#include "Transfer.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/RawFiles.h"
#include "instruments/UDeviceManager.h"
#include "instruments/UPortSetting.h"
#include "platform/text/NumberText.h"
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

template <class Value>
bool Pick(const std::string& word, std::initializer_list<std::pair<const char*, Value>> choices,
          std::optional<Value>& value) {
    const std::wstring wide = nedit::FromUtf8(word);
    for (const auto& [name, choice] : choices) {
        if (nedit::EqualsIgnoreCase(wide, nedit::FromUtf8(name))) {
            value = choice;
            return true;
        }
    }
    return false;
}

bool Number(const std::string& word, std::optional<int>& value) {
    if (word.empty() || word.find_first_not_of("0123456789") != std::string::npos) return false;
    value = nedit::TextToInt(nedit::FromUtf8(word));
    return true;
}

// Takes the download's own option at args[i]; false when it is none or its value is wrong.
bool ParsePortOption(const std::vector<std::string>& args, std::size_t& i,
                     DownloadOptions& options) {
    using nedit::FlowControl;
    using nedit::Parity;
    using nedit::StopBits;
    const std::string& option = args[i];
    if (i + 1 >= args.size()) return false;
    const std::string& value = args[++i];
    if (option == "--port") return !(options.port = value).empty();
    if (option == "--raw") return !(options.raw = value).empty();
    if (option == "--baud") return Number(value, options.baud);
    if (option == "--data-bits") return Number(value, options.dataBits);
    if (option == "--timeout") {
        options.timeout = nedit::TextToDouble(nedit::FromUtf8(value));
        return options.timeout > 0.0;
    }
    if (option == "--stop-bits")
        return Pick(value,
                    {{"1", StopBits::One}, {"1.5", StopBits::OneAndHalf}, {"2", StopBits::Two}},
                    options.stopBits);
    if (option == "--parity")
        return Pick(value,
                    {{"none", Parity::None},
                     {"odd", Parity::Odd},
                     {"even", Parity::Even},
                     {"mark", Parity::Mark},
                     {"space", Parity::Space}},
                    options.parity);
    if (option == "--flow")
        return Pick(value,
                    {{"none", FlowControl::None},
                     {"xon/xoff", FlowControl::XonXoff},
                     {"xonxoff", FlowControl::XonXoff},
                     {"hardware", FlowControl::Hardware}},
                    options.flow);
    return false;
}

bool ParseOptions(const std::vector<std::string>& args, DownloadOptions& options) {
    const auto port = [&options](const std::vector<std::string>& words, std::size_t& i) {
        return ParsePortOption(words, i, options);
    };
    if (!ParseTransferArguments(args, "download", options.transfer, port)) return false;
    if (!options.port.empty()) return true;
    std::fprintf(stderr, "sxnedit: download needs --port COM1|DEVICE (see sxnedit --help)\n");
    return false;
}

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

int RunDownload(const std::vector<std::string>& args) {
    DownloadOptions options;
    if (!ParseOptions(args, options)) return exit_status::Usage;
    return DownloadRawData(options);
}
