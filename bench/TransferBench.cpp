// Save To Survey on a large reduced survey: points, lines that stand alone, and strings of
// lines and arcs that become polylines, into a new job, and again into a job that holds them
// all, every point moved (a question answered "Overwrite" for all) and every polyline
// replaced. Sizes of a tenth and the whole show that the run stays linear.
// Run by hand when the machine is quiet: build/bench/TransferBench

#include <benchmark/benchmark.h>
#include <stdlib.h>
#include <unistd.h>

#include <cmath>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "BenchJob.h"
#include "codes/UNeditArc.h"
#include "codes/UNeditLine.h"
#include "codes/UNeditPt.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/DialogHost.h"
#include "transfer/DuplicatePtsDlg.h"
#include "transfer/PointCodeReader.h"
#include "transfer/TransferRun.h"
#include "transfer/UOverridePolyDlg.h"

namespace {

using nedit::bench::RemoveJob;
using nedit::bench::TempJobPath;

constexpr int kVertices = 20;

// Answers as a surveyor would for a whole run: overwrite every point, replace every string.
class BenchHost : public nedit::DialogHost {
  public:
    BenchHost() {
        SetFace<DuplicatePtsDlg>([](DuplicatePtsDlg& dialog) {
            dialog.ApplyAll = true;
            return static_cast<int>(nedit::mb::IdOk);
        });
        SetFace<UOverridePolyDlg>([](UOverridePolyDlg& dialog) {
            dialog.ApplyAll = true;
            return dialog.OnYes();
        });
    }
    int ShowMessage(const std::wstring&, unsigned flags, unsigned) override {
        return nedit::mb::DefaultAnswer(flags);
    }

  protected:
    int Show(nedit::UDialogLogic& dialog, const Face* face) override {
        return face != nullptr ? (*face)(dialog) : Accept(dialog);
    }
};

/// A reduced survey of `points` points on rows, as many lines between neighbours, and a
/// tenth as many strings of 20 vertices: lines, a three-point arc and an arc about a centre.
struct Survey {
    std::vector<UNeditPt> points;
    std::vector<UNeditLine> lines;
    std::vector<UNeditArc> arcs;

    Survey(int count, double shift) {
        points.reserve(static_cast<std::size_t>(count));
        for (int k = 0; k < count; ++k) {
            points.emplace_back(L"P" + std::to_wstring(k), (k % 1000) * 2.0 + shift,
                                (k / 1000) * 2.0 + 0.3 * std::sin(k), 40.0, L"FN", 0u);
        }
        auto at = [&](int k) -> const UNeditPt& {
            return points[static_cast<std::size_t>(k % count)];
        };
        for (int k = 0; k < count; ++k) {
            lines.emplace_back(at(k), at(k + 1));
            lines.back().SetCode(L"FN");
        }
        for (int s = 0; s < count / 10; ++s) {
            const int first = s * 10;
            const std::wstring name = L"KB" + std::to_wstring(s);
            for (int v = 0; v + 1 < kVertices; ++v) {
                const int k = first + v;
                if (v == 5 || v == 6 || v == 12) continue;  // the arcs' segments
                lines.emplace_back(at(k), at(k + 1));
                lines.back().SetCode(L"KB");
                lines.back().SetStringNo(name);
            }
            arcs.emplace_back(at(first + 5), at(first + 7), at(first + 6), UWArc::kThirdOnArc);
            arcs.back().SetCode(L"KB");
            arcs.back().SetStringNo(name);
            arcs.emplace_back(at(first + 12), at(first + 13), at(first + 500), 0u);
            arcs.back().SetCode(L"KB");
            arcs.back().SetStringNo(name);
        }
    }
};

std::unique_ptr<USurveyDoc> NewJob(const std::string& path) {
    USvyCodeLib codes;
    USvyCode kerb;
    kerb.Code = L"KB";
    kerb.Layer = L"KERB";
    kerb.IsString = 1;
    codes.SetSvyCode(kerb);
    USvyCode fence = kerb;
    fence.Code = L"FN";
    fence.Layer = L"FENCE";
    fence.IsString = 0;
    codes.SetSvyCode(fence);
    auto job = USurveyDoc::CreateJob(path, &codes);
    job->SetSharedCodeLibraryPath(path + ".none");
    return job;
}

int Transfer(USurveyDoc& job, const Survey& survey) {
    BenchHost host;
    const nedit::PointCodeReader codes;
    nedit::TransferRun run(&job, &host, nullptr, codes);
    const int result =
        run.TransferToJob({survey.points, survey.lines, survey.arcs, nullptr, L"BENCH"});
    const nedit::TransferReport& report = run.GetReport();
    if (result != 1 || !report.Left.empty() || !report.Kept) return 0;
    return report.PolylinesAdded + report.PolylinesReplaced;
}

// Into a new job (range(1) 0), or into one that holds the survey already (1).
void BM_SaveToSurvey(benchmark::State& state) {
    const int count = static_cast<int>(state.range(0));
    const bool full = state.range(1) != 0;
    const Survey survey(count, 0.0);
    const Survey moved(count, 0.01);
    setenv("SXNEDIT_CONFIG", "/tmp/sxnedit-bench-config", 1);
    for (auto _ : state) {
        state.PauseTiming();
        const std::string path = TempJobPath();
        auto job = NewJob(path);
        if (full && Transfer(*job, survey) != count / 10) state.SkipWithError("first run failed");
        state.ResumeTiming();
        if (Transfer(*job, full ? moved : survey) != count / 10)
            state.SkipWithError("a string was not written");
        state.PauseTiming();
        job.reset();
        RemoveJob(path);
        state.ResumeTiming();
    }
    state.counters["objects"] =
        static_cast<double>(survey.points.size() + survey.lines.size() + survey.arcs.size());
}
BENCHMARK(BM_SaveToSurvey)
    ->Args({10000, 0})
    ->Args({100000, 0})
    ->Args({10000, 1})
    ->Args({100000, 1})
    ->Unit(benchmark::kMillisecond)
    ->Iterations(1);

}  // namespace

BENCHMARK_MAIN();
