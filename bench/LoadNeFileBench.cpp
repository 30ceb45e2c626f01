// Loading generated surveys (SurveyGenerator.h) through LoadNeFile: about 10k, 100k and 1M
// rows, in rounds on both faces with offsets, about 60 bytes a row as field files are.

#include <benchmark/benchmark.h>

#include <cstdio>
#include <fstream>
#include <string>

#include "BenchSupport.h"
#include "SurveyGenerator.h"
#include "document/UListCtrl.h"
#include "platform/job/UJobSettings.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"

namespace {

// The survey of `stations` set-ups as a file in the temporary folder.
std::string SurveyFile(int stations) {
    const std::string path = "/tmp/sxnedit-bench-survey-" + std::to_string(stations) + ".neu";
    nedit::SurveyShape shape;
    shape.stations = stations;
    nedit::WriteSurvey(shape, path);
    return path;
}

void LoadNeutralFile(benchmark::State& state) {
    const std::string path = SurveyFile(static_cast<int>(state.range(0)));
    UJobSettings settings;
    UNeutralFileFormat format(&settings);
    if (!LoadDefinition(format, state)) return;
    UListCtrl list(&format);
    UNeditDatabase engine(&format, &list, nullptr, nullptr);
    const std::wstring wide_path(path.begin(), path.end());
    for (auto _ : state) {
        benchmark::DoNotOptimize(engine.LoadNeFile(wide_path));
    }
    const auto bytes = static_cast<std::int64_t>(std::ifstream(path, std::ios::ate).tellg());
    state.SetBytesProcessed(state.iterations() * bytes);
    state.counters["rows"] = list.GetItemCount();
    std::remove(path.c_str());
}

}  // namespace

BENCHMARK(LoadNeutralFile)->Arg(200)->Arg(2'000)->Arg(20'000)->Unit(benchmark::kMillisecond);
BENCHMARK_MAIN();
