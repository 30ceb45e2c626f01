// Loading generated neutral files of growing size through LoadNeFile.

#include <benchmark/benchmark.h>

#include <cstdio>
#include <fstream>
#include <string>

#include "BenchSupport.h"
#include "document/UListCtrl.h"
#include "platform/job/UJobSettings.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"

namespace {

// A survey of `rows` records: a station every 21 rows, each with 20 side shots (about 60
// bytes a row, as field files are).
std::string MakeSurvey(long rows) {
    const std::string path = "/tmp/sxnedit-bench-" + std::to_string(rows) + ".neu";
    std::ifstream existing(path);
    if (existing) return path;
    std::ofstream out(path);
    out << "#VERSION-1.0 NEUTRAL FILE\nUNIT      UL=M,UA=S\n";
    for (long row = 2; row < rows; ++row) {
        if (row % 21 == 2) {
            out << "STN       ID=S" << row << ",HI=1.550,CO=STN\n";
        } else {
            out << "SS        ID=P" << row
                << ",HA=123.4530,VA=89.5500,SD=35.214,HT=1.600,CO=FC01\n";
        }
    }
    return path;
}

void LoadNeutralFile(benchmark::State& state) {
    const std::string path = MakeSurvey(state.range(0));
    UJobSettings settings;
    UNeutralFileFormat format(&settings);
    if (!LoadDefinition(format, state)) return;
    UListCtrl list(&format);
    UNeditDatabase engine(&format, &list, nullptr, nullptr);
    const std::wstring wide_path(path.begin(), path.end());
    for (auto _ : state) {
        benchmark::DoNotOptimize(engine.LoadNeFile(wide_path));
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
    state.counters["rows"] = list.GetItemCount();
}

}  // namespace

BENCHMARK(LoadNeutralFile)
    ->Arg(10'000)
    ->Arg(100'000)
    ->Arg(1'000'000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK_MAIN();
