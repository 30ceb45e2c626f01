#pragma once
// The serial port options that the download and the upload share: the port and the link's
// values, each laid over the port's stored settings when given.

#include <optional>
#include <string>

#include "platform/serial/SerialSettings.h"

namespace CLI {
class App;
class Option;
}  // namespace CLI

struct PortOptions {
    std::string port;
    std::optional<int> baud;
    std::optional<int> dataBits;
    std::optional<nedit::StopBits> stopBits;
    std::optional<nedit::Parity> parity;
    std::optional<nedit::FlowControl> flow;
};

/// Adds --port and the link's values (--baud, --data-bits, --stop-bits, --parity, --flow)
/// to `command`; gives the --port option.
CLI::Option* AddPortOptions(CLI::App& command, PortOptions& options);

/// The port's stored settings with the options laid over them.
nedit::SerialSettings PortSettings(const PortOptions& options);
