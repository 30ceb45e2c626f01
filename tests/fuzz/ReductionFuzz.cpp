// Bytes as a neutral file, through everything a reduction run does: loading, Process, the
// report and the command line's JSON. Stops the fuzzer on JSON that does not parse, a
// coordinate that is no finite number, or output that is not valid UTF-8.

#include <unistd.h>

#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

#include "RecordSession.h"
#include "ReductionOutput.h"
#include "platform/text/WideText.h"

namespace {

std::string input_path;

void Require(bool holds, const char* what) {
    if (holds) return;
    std::fprintf(stderr, "ReductionFuzz: %s\n", what);
    std::abort();
}

bool IsFiniteNumber(const nlohmann::json& value) {
    return value.is_number() && std::isfinite(value.get<double>());
}

}  // namespace

extern "C" int LLVMFuzzerInitialize(int* /*argc*/, char*** /*argv*/) {
    // A folder of its own: the configuration (NEDIT.INI), the input, and the working
    // directory, from which every engine removes DEBUG.DAT.
    char pattern[] = "/tmp/sxnedit-fuzz-XXXXXX";
    const char* folder = mkdtemp(pattern);
    Require(folder != nullptr && chdir(folder) == 0, "no folder for the run");
    setenv("SXNEDIT_CONFIG", folder, 1);
    input_path = std::string(folder) + "/input.neu";
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::ofstream(input_path, std::ios::binary | std::ios::trunc)
        .write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    RecordSession session;
    session.host.SetEcho(false);
    Require(session.Start(), "the record definition could not be loaded");
    UNeditDatabase& engine = session.StartEngine();
    if (!engine.LoadNeFile(nedit::FromUtf8(input_path))) return 0;
    engine.Process();

    std::string report;
    session.report->WriteUtf8([&report](std::string_view piece) {
        report += piece;
        return true;
    });
    Require(nedit::IsValidUtf8(report), "the report is not valid UTF-8");
    std::string text;
    WriteReductionJson(engine, session.host.Messages(), [&text](std::string_view piece) {
        text += piece;
        return true;
    });
    Require(nedit::IsValidUtf8(text), "the JSON is not valid UTF-8");
    const nlohmann::json json = nlohmann::json::parse(text, nullptr, false);
    Require(!json.is_discarded(), "the JSON does not parse");
    for (const nlohmann::json& point : json.at("points")) {
        Require(IsFiniteNumber(point.at("e")) && IsFiniteNumber(point.at("n")),
                "a point's east or north is no finite number");
        Require(point.at("h").is_null() || IsFiniteNumber(point.at("h")),
                "a point's height is neither null nor a finite number");
    }
    for (const nlohmann::json& circle : json.at("circles")) {
        Require(IsFiniteNumber(circle.at("e")) && IsFiniteNumber(circle.at("n")) &&
                    IsFiniteNumber(circle.at("radius")),
                "a circle holds a number that is not finite");
    }
    return 0;
}
