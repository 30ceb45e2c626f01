// The exports of a large job: points with lines between neighbours and strings of 20
// vertices with arcs, written as CSV, DXF, GeoPackage, GeoJSON, Shapefile and LandXML. Sizes
// of a tenth and the whole show that each stays linear.
// Run by hand when the machine is quiet: build/bench/ExportBench

#include <benchmark/benchmark.h>

#include <cstdio>
#include <memory>
#include <string>

#include "BenchJob.h"
#include "exports/JobExport.h"
#include "platform/job/USurveyDoc.h"

namespace {

using nedit::ExportFormat;
using nedit::bench::RemoveJob;
using nedit::bench::TempJobPath;

// `points` points on rows of 1,000, a line from each to the next, and a string through every
// 20 of them, each fifth leg an arc.
std::unique_ptr<USurveyDoc> MakeJob(const std::string& path, long points) {
    auto job = USurveyDoc::CreateJob(path, nullptr);
    const std::string n = std::to_string(points);
    job->Database().Execute(
        "BEGIN; INSERT INTO layer (name) VALUES ('SURVEY');"
        "WITH RECURSIVE n(i) AS (SELECT 0 UNION ALL SELECT i + 1 FROM n WHERE i + 1 < " +
        n +
        ") INSERT INTO point (name, east, north, height, code, layer_id) SELECT 'P' || i, "
        "1000 + (i % 1000) * 2.0, 2000 + (i / 1000) * 2.0, 50 + (i % 7), 'FC01', 1 FROM n;"
        "INSERT INTO line (start_id, end_id, layer_id) SELECT id, id + 1, 1 FROM point "
        "WHERE id < (SELECT max(id) FROM point);"
        "WITH RECURSIVE s(k) AS (SELECT 0 UNION ALL SELECT k + 1 FROM s WHERE k + 1 < " +
        n +
        " / 20) INSERT INTO polyline (name, layer_id) SELECT 'S' || k, 1 FROM s;"
        "INSERT INTO polyline_vertex (polyline_id, seq, point_id, bulge) SELECT "
        "(16 << 26) + 1 + (id - (1 << 26) - 1) / 20, (id - (1 << 26) - 1) % 20, id, "
        "CASE WHEN id % 5 = 0 THEN 0.2 ELSE 0 END FROM point WHERE id - (1 << 26) - 1 < " +
        n + " / 20 * 20; COMMIT;");
    return job;
}

void BM_Export(benchmark::State& state) {
    const std::string path = TempJobPath();
    auto job = MakeJob(path, state.range(1));
    const auto format = static_cast<ExportFormat>(state.range(0));
    const std::string folder = path.substr(0, path.rfind('/'));
    nedit::ExportRequest request;
    request.format = format;
    request.output = folder + "/export.out";
    for (auto _ : state) {
        const nedit::ExportResult result = nedit::ExportJob(*job, request);
        if (!result.written) state.SkipWithError("the export was not written");
        for (const std::string& file : result.files) std::remove(file.c_str());
    }
    state.SetLabel(nedit::ExportFormatTitle(format));
    state.SetItemsProcessed(state.iterations() * state.range(1));
    job.reset();
    RemoveJob(path);
}

}  // namespace

BENCHMARK(BM_Export)
    ->ArgsProduct(
        {{static_cast<long>(ExportFormat::Csv), static_cast<long>(ExportFormat::Dxf),
          static_cast<long>(ExportFormat::GeoPackage), static_cast<long>(ExportFormat::GeoJson),
          static_cast<long>(ExportFormat::Shapefile), static_cast<long>(ExportFormat::LandXml)},
         {10000, 100000}})
    ->Unit(benchmark::kMillisecond);

BENCHMARK_MAIN();
