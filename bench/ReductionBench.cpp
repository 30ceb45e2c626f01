// Full reductions of generated surveys: a chain of stations, each oriented on the one
// before, with 20 side shots and a forward observation of the next.

#include <benchmark/benchmark.h>

#include <cmath>

#include "BenchSupport.h"
#include "document/UListCtrl.h"
#include "platform/job/UJobSettings.h"
#include "platform/text/Format.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"

namespace {

constexpr int kSideShots = 20;

void FillSurvey(UListCtrl& list, int stations) {
    using nedit::Format;
    list.Reserve(static_cast<std::size_t>(stations) * (kSideShots + 4) + 4);
    list.AddRecord(0, L"#VERSION-1.0 NEUTRAL FILE");
    list.AddRecord(1, L"UNIT      UL=M,UA=D");
    for (int s = 0; s < stations; ++s) {
        list.AddRecord(list.GetItemCount(), Format(L"STN       ID=S%d,HI=1.500,CO=STN", s));
        if (s == 0) {
            list.AddRecord(list.GetItemCount(),
                           L"XYZ       ID=S0,E=100000.000,N=200000.000,H=50.000");
            list.AddRecord(list.GetItemCount(), L"BKB       ID=R,BRG=90.0000,HA=0");
        } else {
            list.AddRecord(list.GetItemCount(), Format(L"BKB       ID=S%d,HA=0", s - 1));
            list.AddRecord(list.GetItemCount(),
                           Format(L"BS        ID=S%d,HA=0,VA=90,SD=50.000,HT=1.500", s - 1));
        }
        for (int k = 0; k < kSideShots; ++k) {
            list.AddRecord(list.GetItemCount(),
                           Format(L"SS        ID=P%d_%d,HA=%.4f,VA=89.5,SD=%.3f,HT=1.600,CO=FC01",
                                  s, k, std::fmod(17.0 * k + 3.0, 360.0), 5.0 + k));
        }
        list.AddRecord(list.GetItemCount(),
                       Format(L"SS        ID=S%d,HA=180,VA=90,SD=50.000,HT=1.500", s + 1));
    }
}

void ReduceSurvey(benchmark::State& state) {
    UJobSettings settings;
    UNeutralFileFormat format(&settings);
    if (!LoadDefinition(format, state)) return;
    UListCtrl list(&format);
    FillSurvey(list, static_cast<int>(state.range(0)));
    std::size_t points = 0;
    for (auto _ : state) {
        UNeditDatabase engine(&format, &list, nullptr, nullptr);
        benchmark::DoNotOptimize(engine.Process());
        points = engine.GetPointList().size();
    }
    state.SetItemsProcessed(state.iterations() * list.GetItemCount());
    state.counters["rows"] = list.GetItemCount();
    state.counters["points"] = static_cast<double>(points);
}

}  // namespace

BENCHMARK(ReduceSurvey)->Arg(1'000)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);
BENCHMARK_MAIN();
