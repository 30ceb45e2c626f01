#include "PortOptions.h"

#include <CLI/CLI.hpp>
#include <map>

#include "instruments/UPortSetting.h"
#include "platform/text/WideText.h"

CLI::Option* AddPortOptions(CLI::App& command, PortOptions& options) {
    using nedit::FlowControl;
    using nedit::Parity;
    using nedit::StopBits;
    CLI::Option* port =
        command.add_option("--port", options.port, "the port: COM1..COM8 or a device")
            ->option_text("COM1|DEVICE");
    command.add_option("--baud", options.baud, "bits per second")
        ->check(CLI::PositiveNumber)
        ->option_text("N");
    command.add_option("--data-bits", options.dataBits, "data bits")
        ->check(CLI::Range(5, 8))
        ->option_text("5..8");
    const std::map<std::string, StopBits> stopBits = {
        {"1", StopBits::One}, {"1.5", StopBits::OneAndHalf}, {"2", StopBits::Two}};
    command.add_option("--stop-bits", options.stopBits, "stop bits")
        ->transform(CLI::CheckedTransformer(stopBits))
        ->option_text("1|1.5|2");
    const std::map<std::string, Parity> parities = {{"none", Parity::None},
                                                    {"odd", Parity::Odd},
                                                    {"even", Parity::Even},
                                                    {"mark", Parity::Mark},
                                                    {"space", Parity::Space}};
    command.add_option("--parity", options.parity, "parity")
        ->transform(CLI::CheckedTransformer(parities, CLI::ignore_case))
        ->option_text("none|odd|even|mark|space");
    const std::map<std::string, FlowControl> flows = {{"none", FlowControl::None},
                                                      {"xon/xoff", FlowControl::XonXoff},
                                                      {"xonxoff", FlowControl::XonXoff},
                                                      {"hardware", FlowControl::Hardware}};
    command.add_option("--flow", options.flow, "flow control")
        ->transform(CLI::CheckedTransformer(flows, CLI::ignore_case))
        ->option_text("none|xon/xoff|hardware");
    return port;
}

nedit::SerialSettings PortSettings(const PortOptions& options) {
    nedit::SerialSettings settings = UPortSetting::LoadSettings(nedit::FromUtf8(options.port));
    settings.baud = options.baud.value_or(settings.baud);
    settings.dataBits = options.dataBits.value_or(settings.dataBits);
    settings.stopBits = options.stopBits.value_or(settings.stopBits);
    settings.parity = options.parity.value_or(settings.parity);
    settings.flow = options.flow.value_or(settings.flow);
    return settings;
}
