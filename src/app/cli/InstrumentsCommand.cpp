// sxnedit instruments [--json]: the instrument drivers found, and those refused.

#include <CLI/CLI.hpp>
#include <algorithm>
#include <cstdio>
#include <memory>
#include <vector>

#include "Commands.h"
#include "JsonLayout.h"
#include "instruments/DriverCatalogue.h"
#include "platform/text/WideText.h"

namespace {

struct InstrumentsOptions {
    bool json = false;
};

// The extensions as a JSON list: "gsi,gs8" gives ["gsi", "gs8"].
json::Value ExtensionList(const std::wstring& extensions) {
    json::Value list = json::Value::array();
    for (std::size_t start = 0; start < extensions.size();) {
        const std::size_t comma = std::min(extensions.find(L',', start), extensions.size());
        if (comma > start) list.push_back(json::Text(extensions.substr(start, comma - start)));
        start = comma + 1;
    }
    return list;
}

void PrintJson(const nedit::DriverCatalogue& drivers) {
    std::vector<json::Value> found;
    for (const nedit::DriverInfo& driver : drivers.Drivers()) {
        found.push_back({{"name", json::Text(driver.name)},
                         {"description", json::Text(driver.description)},
                         {"extensions", ExtensionList(driver.extensions)},
                         {"file", driver.path}});
    }
    std::vector<json::Value> refused;
    for (const nedit::RefusedDriver& driver : drivers.Refused()) {
        refused.push_back({{"file", driver.file}, {"reason", driver.reason}});
    }
    std::printf("%s\n", json::Members({{"directory", json::Inline(drivers.Directory())},
                                       {"drivers", json::Rows(found, 2)},
                                       {"refused", json::Rows(refused, 2)}})
                            .c_str());
}

int ListInstruments(const InstrumentsOptions& options) {
    const nedit::DriverCatalogue drivers(nedit::DriverCatalogue::DefaultDirectory());
    if (options.json) {
        PrintJson(drivers);
    } else {
        // The names in a column as wide as the longest of them.
        int width = 0;
        for (const nedit::DriverInfo& driver : drivers.Drivers())
            width = std::max(width, static_cast<int>(nedit::ToUtf8(driver.name).size()));
        for (const nedit::DriverInfo& driver : drivers.Drivers()) {
            std::printf("%-*s %s (%s)\n", width, nedit::ToUtf8(driver.name).c_str(),
                        nedit::ToUtf8(driver.description).c_str(),
                        nedit::ToUtf8(driver.extensions).c_str());
        }
    }
    for (const nedit::RefusedDriver& refused : drivers.Refused()) {
        std::fprintf(stderr, "sxnedit: the driver %s was refused: %s\n", refused.file.c_str(),
                     refused.reason.c_str());
    }
    if (!drivers.Drivers().empty()) return exit_status::Ok;
    std::fprintf(stderr, "sxnedit: no instrument drivers in %s\n", drivers.Directory().c_str());
    return exit_status::Failed;
}

}  // namespace

void AddInstrumentsCommand(CLI::App& app, CommandRun& run) {
    auto options = std::make_shared<InstrumentsOptions>();
    CLI::App* instruments =
        app.add_subcommand("instruments",
                           "the instrument drivers found, with their descriptions\n"
                           "and raw file extensions; drivers that were refused, and why");
    instruments->add_flag("--json", options->json, "print them as JSON");
    instruments->callback(
        [options, &run] { run = [options] { return ListInstruments(*options); }; });
}
