// Full reductions of generated surveys (SurveyGenerator.h). ReduceSurvey observes every
// target once, as the first benchmark always did (100k stations are about 2.1M observations);
// ReduceFieldSurvey is a survey as crews record it, in rounds on both faces with offsets. The
// odd shapes come at two sizes each, so that the ratio of their times shows how they grow:
// stations oriented on back stations that nothing knows, and stations that nothing positions.
// Without a dialog host the run answers every question as an unattended run does.

#include <benchmark/benchmark.h>

#include "BenchSupport.h"
#include "SurveyGenerator.h"
#include "document/UListCtrl.h"
#include "platform/job/UJobSettings.h"
#include "platform/text/WideText.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"

namespace {

void Fill(UListCtrl& list, const nedit::SurveyShape& shape) {
    list.DeleteAllItems();
    nedit::GenerateSurvey(shape, [&list](const std::string& line) {
        list.AddRecord(list.GetItemCount(), nedit::FromUtf8(line));
    });
}

void Reduce(benchmark::State& state, nedit::SurveyShape shape) {
    shape.stations = static_cast<int>(state.range(0));
    UJobSettings settings;
    UNeutralFileFormat format(&settings);
    if (!LoadDefinition(format, state)) return;
    UListCtrl list(&format);
    Fill(list, shape);
    const int rows = list.GetItemCount();
    std::size_t points = 0;
    for (auto _ : state) {
        // A run adds rows for the coordinates it was given; every run starts from the file.
        if (list.GetItemCount() != rows) {
            state.PauseTiming();
            Fill(list, shape);
            state.ResumeTiming();
        }
        UNeditDatabase engine(&format, &list, nullptr, nullptr);
        benchmark::DoNotOptimize(engine.Process());
        points = engine.GetPointList().size();
    }
    state.SetItemsProcessed(state.iterations() * rows);
    state.counters["rows"] = rows;
    state.counters["points"] = static_cast<double>(points);
}

nedit::SurveyShape OneFace() {
    nedit::SurveyShape shape;
    shape.rounds = 1;
    shape.bothFaces = false;
    shape.offsetEvery = 0;
    return shape;
}

void ReduceSurvey(benchmark::State& state) {
    Reduce(state, OneFace());
}

void ReduceFieldSurvey(benchmark::State& state) {
    Reduce(state, nedit::SurveyShape());
}

// The same survey with its side shots coded into strings (second argument: how many) and with
// the plain codes (0): 5,000 stations are 100k coded points. The ratio of the two is the cost
// of the codes; the two sizes show how it grows.
void ReduceCodedStrings(benchmark::State& state) {
    nedit::SurveyShape shape = OneFace();
    shape.strings = static_cast<int>(state.range(1));
    Reduce(state, shape);
}

void ReduceUnknownBackStations(benchmark::State& state) {
    nedit::SurveyShape shape = OneFace();
    shape.unknownBackEvery = 1;
    Reduce(state, shape);
}

void ReduceUnpositionedStations(benchmark::State& state) {
    nedit::SurveyShape shape = OneFace();
    shape.unpositionedEvery = 1;
    Reduce(state, shape);
}

}  // namespace

BENCHMARK(ReduceSurvey)->Arg(1'000)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);
BENCHMARK(ReduceFieldSurvey)->Arg(1'000)->Arg(10'000)->Arg(40'000)->Unit(benchmark::kMillisecond);
BENCHMARK(ReduceCodedStrings)
    ->Args({1'000, 0})
    ->Args({1'000, 1'000})
    ->Args({5'000, 0})
    ->Args({5'000, 1'000})
    ->Unit(benchmark::kMillisecond);
BENCHMARK(ReduceUnknownBackStations)->Arg(2'000)->Arg(4'000)->Unit(benchmark::kMillisecond);
BENCHMARK(ReduceUnpositionedStations)->Arg(2'000)->Arg(4'000)->Unit(benchmark::kMillisecond);
BENCHMARK_MAIN();
