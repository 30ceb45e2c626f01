// Job database: writing a large transfer in one transaction, and finding every point by name.
// Run by hand when the machine is quiet: build/bench/JobBench

#include <benchmark/benchmark.h>
#include <stdlib.h>
#include <unistd.h>

#include <cstdio>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include "BenchJob.h"
#include "platform/job/UDBLine.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/UDBPolyLine.h"
#include "platform/job/UDBSQLiteTransaction.h"
#include "platform/job/USurveyDoc.h"

namespace {

using nedit::bench::RemoveJob;
using nedit::bench::TempJobPath;

constexpr int kPoints = 100000;
constexpr int kLines = 100000;
constexpr int kPolylines = 10000;
constexpr int kVerticesPerPolyline = 10;

std::wstring PointName(int i) {
    return L"P" + std::to_wstring(i);
}

// Writes the points, lines and polylines through the job's classes, as a transfer does.
void Fill(USurveyDoc& job, std::vector<long>& ids) {
    UDBSQLiteTransaction transaction(&job);
    UDBPoint point(&job);
    ids.resize(kPoints);
    for (int i = 0; i < kPoints; ++i) {
        point.ReInit();
        point.SetName(PointName(i));
        point.SetEast(1000.0 + (i % 1000) * 1.5);
        point.SetNorth(5000.0 + (i / 1000) * 1.5);
        point.SetHeight(i % 7 == 0 ? UWPoint::kNoHeight : 40.0 + (i % 100) * 0.01);
        point.SetCode(L"FNC01");
        if (!point.Save()) throw std::runtime_error("point not saved");
        ids[static_cast<std::size_t>(i)] = point.GetId();
    }
    UDBLine line(&job);
    for (int i = 0; i < kLines; ++i) {
        line = UDBLine(&job);
        line.SetPoints(ids[static_cast<std::size_t>(i)],
                       ids[static_cast<std::size_t>((i + 1) % kPoints)]);
        if (!line.Save()) throw std::runtime_error("line not saved");
    }
    for (int i = 0; i < kPolylines; ++i) {
        UDBPolyLine poly(&job);
        poly.SetName(L"S" + std::to_wstring(i));
        for (int v = 0; v < kVerticesPerPolyline; ++v) {
            poly.Add({v % 3 == 0 ? 0.2 : 0.0,
                      ids[static_cast<std::size_t>((i * kVerticesPerPolyline + v) % kPoints)]});
        }
        if (!poly.Save()) throw std::runtime_error("polyline not saved");
    }
    transaction.Commit();
}

void BM_InsertPointsLinesPolylinesInOneTransaction(benchmark::State& state) {
    for (auto _ : state) {
        state.PauseTiming();
        const std::string path = TempJobPath();
        auto job = USurveyDoc::CreateJob(path, nullptr);
        std::vector<long> ids;
        state.ResumeTiming();
        Fill(*job, ids);
        state.PauseTiming();
        job.reset();
        RemoveJob(path);
        state.ResumeTiming();
    }
    state.counters["objects"] = kPoints + kLines + kPolylines;
}
BENCHMARK(BM_InsertPointsLinesPolylinesInOneTransaction)
    ->Unit(benchmark::kMillisecond)
    ->Iterations(3);

// Each look-up on its own, as the reduction asks for a station's coordinates (`inTransaction`
// 0), or all inside one transaction, as a transfer runs (1): outside one, every statement
// takes and drops the job's read lock.
void BM_LookUpEveryPointByName(benchmark::State& state) {
    const std::string path = TempJobPath();
    std::vector<long> ids;
    {
        auto job = USurveyDoc::CreateJob(path, nullptr);
        Fill(*job, ids);
    }
    auto job = USurveyDoc::OpenJob(path);
    std::vector<UPointNumber> names;
    for (int i = 0; i < kPoints; ++i) names.emplace_back(PointName(i));
    for (auto _ : state) {
        std::unique_ptr<UDBSQLiteTransaction> transaction;
        if (state.range(0) != 0) transaction = std::make_unique<UDBSQLiteTransaction>(job.get());
        long found = 0;
        for (const UPointNumber& name : names) found += job->GetPointId(name) != 0 ? 1 : 0;
        if (found != kPoints) state.SkipWithError("a point was not found");
        benchmark::DoNotOptimize(found);
    }
    state.counters["points"] = kPoints;
    job.reset();
    RemoveJob(path);
}
BENCHMARK(BM_LookUpEveryPointByName)->Arg(0)->Arg(1)->Unit(benchmark::kMillisecond)->Iterations(3);

}  // namespace

BENCHMARK_MAIN();
