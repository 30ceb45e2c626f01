// The desktop on large surveys: opening a document of a million rows (loading, the first
// reduction, the list and the plan shown), painting and scrolling the record list, and
// drawing, zooming and picking in a plan of 100 000 points. Runs on the offscreen platform
// unless QT_QPA_PLATFORM says otherwise.

#include <benchmark/benchmark.h>

#include <QApplication>
#include <QImage>
#include <QPainter>
#include <QTemporaryDir>
#include <cmath>
#include <fstream>
#include <random>

#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "document/URawDataContainer.h"
#include "platform/job/UJobSettings.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"
#include "ui/CNeditViewPane.h"
#include "ui/PlanPainter.h"
#include "ui/PlanScene.h"
#include "ui/PlanTransform.h"
#include "ui/QtDialogHost.h"
#include "ui/UNeditGraphView.h"
#include "ui/UNeditMainWindow.h"
#include "ui/UNeditView.h"

namespace {

constexpr int kSideShots = 20;

/// A chain of stations, each oriented on the one before, with 20 side shots each: about
/// 24 rows a station.
void WriteSurvey(const std::string& path, int rows) {
    std::ofstream out(path);
    out << "#VERSION-1.0 NEUTRAL FILE\nUNIT      UL=M,UA=D\n";
    const int stations = rows / (kSideShots + 4);
    for (int s = 0; s < stations; ++s) {
        out << "STN       ID=S" << s << ",HI=1.500,CO=STN\n";
        if (s == 0) {
            out << "XYZ       ID=S0,E=100000.000,N=200000.000,H=50.000\n"
                << "BKB       ID=R,BRG=90.0000,HA=0\n";
        } else {
            out << "BKB       ID=S" << s - 1 << ",HA=0\n"
                << "BS        ID=S" << s - 1 << ",HA=0,VA=90,SD=50.000,HT=1.500\n";
        }
        for (int k = 0; k < kSideShots; ++k) {
            out << "SS        ID=P" << s << '_' << k << ",HA=" << std::fmod(17.0 * k + 3.0, 360.0)
                << ",VA=89.5,SD=" << 5.0 + k << ",HT=1.600,CO=FC01\n";
        }
        out << "SS        ID=S" << s + 1 << ",HA=180,VA=90,SD=50.000,HT=1.500\n";
    }
}

/// A host that answers every question with its default, unseen.
std::unique_ptr<nedit::QtDialogHost> QuietHost() {
    auto host = std::make_unique<nedit::QtDialogHost>();
    host->SetUnattended(true);
    return host;
}

void OpenMillionRowDocument(benchmark::State& state) {
    QTemporaryDir dir;
    const std::string neutral = dir.filePath(QStringLiteral("big.neu")).toStdString();
    WriteSurvey(neutral, static_cast<int>(state.range(0)));
    qputenv("SXNEDIT_CONFIG", dir.path().toUtf8());
    for (auto _ : state) {
        state.PauseTiming();
        auto window = std::make_unique<nedit::UNeditMainWindow>(QuietHost());
        window->resize(1400, 900);
        window->show();
        QCoreApplication::processEvents();
        state.ResumeTiming();
        // Loading, the first reduction, and the list and the plan painted once.
        window->OpenPath(QString::fromStdString(neutral));
        nedit::CNeditViewPane* pane = window->CurrentPane();
        pane->GetNeditView()->viewport()->repaint();
        pane->GetGraphView()->repaint();
        state.PauseTiming();
        state.counters["rows"] = pane->GetListCtrl()->GetItemCount();
        state.counters["points"] =
            static_cast<double>(pane->GetDocument()->GetDatabase()->GetPointList().size());
        window.reset();
        state.ResumeTiming();
    }
}

/// A list of `rows` rows of side shots, without an engine.
struct BigList {
    UJobSettings settings;
    UNeutralFileFormat format{&settings};
    UListCtrl list{&format};

    explicit BigList(int rows) {
        format.LoadNeutralFileDefinition(nedit::FromUtf8(SXNEDIT_DATA_DIR));
        list.Reserve(static_cast<std::size_t>(rows));
        for (int i = 0; i < rows; ++i) {
            list.AddRecord(i, nedit::Format(L"SS        ID=P%d,HA=%.4f,VA=89.5,SD=12.345,HT=1.6", i,
                                            std::fmod(i * 7.3, 360.0)));
        }
    }
};

void ScrollRecordList(benchmark::State& state) {
    BigList rows(static_cast<int>(state.range(0)));
    nedit::UNeditView view;
    view.resize(700, 800);
    view.show();
    view.SetList(&rows.list);
    QCoreApplication::processEvents();
    std::mt19937 random(3);
    std::uniform_int_distribution<int> anywhere(0, rows.list.GetItemCount() - 1);
    for (auto _ : state) {
        // A jump anywhere in the list, a row selected there, and the page painted.
        const int row = anywhere(random);
        rows.list.SelectRow(row);
        view.viewport()->repaint();
    }
    state.SetItemsProcessed(state.iterations());
}

/// Stores of `points` points on a grid, every point joined to the one before by a line.
struct BigPlan {
    UJobSettings settings;
    UNeutralFileFormat format{&settings};
    UNeditDatabase engine{&format, nullptr, nullptr, nullptr};
    nedit::PlanScene scene;

    explicit BigPlan(int points) {
        const int side = static_cast<int>(std::sqrt(points));
        for (int i = 0; i < points; ++i) {
            const unsigned index = engine.SavePoint(nedit::Format(L"P%d", i), (i % side) * 2.0,
                                                    (i / side) * 2.0, 50.0, L"FC01", 0, 0, 0);
            if (i > 0 && i % side != 0) engine.SaveLine(index - 1, index, 0);
        }
        engine.SetMinMaxCoord();
        scene.Build(&engine);
    }
};

void DrawPlan(benchmark::State& state) {
    BigPlan plan(static_cast<int>(state.range(0)));
    nedit::PlanTransform transform;
    transform.SetViewSize(1200, 800);
    transform.ZoomTo(plan.scene.Extents());
    // range(1): 1 for the whole survey, else how many times closer.
    if (state.range(1) > 1) transform.ZoomAbout({600, 400}, static_cast<double>(state.range(1)));
    nedit::PlanStyle style;
    style.pointNumbers = true;
    QImage image(1200, 800, QImage::Format_ARGB32_Premultiplied);
    for (auto _ : state) {
        QPainter painter(&image);
        nedit::PlanPainter(plan.scene, transform, style).Paint(painter);
    }
}

void BuildPlanIndex(benchmark::State& state) {
    BigPlan plan(static_cast<int>(state.range(0)));
    for (auto _ : state) plan.scene.Build(&plan.engine);
}

void PickInPlan(benchmark::State& state) {
    BigPlan plan(static_cast<int>(state.range(0)));
    std::mt19937 random(5);
    const UWRect extents = plan.scene.Extents();
    std::uniform_real_distribution<double> east(extents.GetMinX(), extents.GetMaxX());
    std::uniform_real_distribution<double> north(extents.GetMinY(), extents.GetMaxY());
    for (auto _ : state)
        benchmark::DoNotOptimize(plan.scene.Pick(UWPoint(east(random), north(random)), 0.5));
}

}  // namespace

BENCHMARK(OpenMillionRowDocument)->Arg(1'000'000)->Iterations(1)->Unit(benchmark::kMillisecond);
BENCHMARK(ScrollRecordList)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK(DrawPlan)
    ->Args({100'000, 1})
    ->Args({100'000, 10})
    ->Args({100'000, 100})
    ->Unit(benchmark::kMillisecond);
BENCHMARK(BuildPlanIndex)->Arg(100'000)->Unit(benchmark::kMillisecond);
BENCHMARK(PickInPlan)->Arg(100'000)->Unit(benchmark::kMicrosecond);

int main(int argc, char** argv) {
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
