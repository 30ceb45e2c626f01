// sxnedit instruments [--json]: the instrument drivers found, and those refused.

#include <algorithm>
#include <cstdio>

#include "Commands.h"
#include "Json.h"
#include "instruments/DriverCatalogue.h"
#include "platform/text/WideText.h"

namespace {

struct InstrumentsOptions {
    bool json = false;
};

// The extensions as a JSON list: "gsi,gs8" gives ["gsi", "gs8"].
std::string ExtensionList(const std::wstring& extensions) {
    std::string list;
    for (std::size_t start = 0; start < extensions.size();) {
        const std::size_t comma = std::min(extensions.find(L',', start), extensions.size());
        if (comma > start)
            list +=
                (list.empty() ? "" : ", ") + json::Quote(extensions.substr(start, comma - start));
        start = comma + 1;
    }
    return "[" + list + "]";
}

int ListInstruments(const InstrumentsOptions& options) {
    const nedit::DriverCatalogue drivers(nedit::DriverCatalogue::DefaultDirectory());
    if (options.json) {
        std::printf("{\"directory\": %s,\n \"drivers\": [",
                    json::Quote(nedit::FromUtf8(drivers.Directory())).c_str());
        const char* separator = "";
        for (const nedit::DriverInfo& driver : drivers.Drivers()) {
            std::printf(
                "%s\n  {\"name\": %s, \"description\": %s, \"extensions\": %s, \"file\": %s}",
                separator, json::Quote(driver.name).c_str(),
                json::Quote(driver.description).c_str(), ExtensionList(driver.extensions).c_str(),
                json::Quote(nedit::FromUtf8(driver.path)).c_str());
            separator = ",";
        }
        std::printf("],\n \"refused\": [");
        separator = "";
        for (const nedit::RefusedDriver& refused : drivers.Refused()) {
            std::printf("%s\n  {\"file\": %s, \"reason\": %s}", separator,
                        json::Quote(nedit::FromUtf8(refused.file)).c_str(),
                        json::Quote(nedit::FromUtf8(refused.reason)).c_str());
            separator = ",";
        }
        std::printf("]}\n");
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

int RunInstruments(const std::vector<std::string>& args) {
    InstrumentsOptions options;
    for (const std::string& arg : args) {
        if (arg != "--json") {
            std::fprintf(stderr, "sxnedit: instruments takes only --json (see sxnedit --help)\n");
            return exit_status::Usage;
        }
        options.json = true;
    }
    return ListInstruments(options);
}
