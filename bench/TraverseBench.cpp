// Traverses of generated surveys: the route search after a run over surveys of blocks that
// each hold a loop, a spur and a re-occupied station, and the adjustment of one loop of many
// stations by the Compass rule with the side shots reduced again.

#include <benchmark/benchmark.h>

#include <cmath>

#include "BenchSupport.h"
#include "document/UListCtrl.h"
#include "platform/geometry/UAngle.h"
#include "platform/job/UJobSettings.h"
#include "platform/messages/DialogHost.h"
#include "platform/text/Format.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"
#include "traverse/CTraverse.h"
#include "traverse/TraverseRoutes.h"

namespace {

using nedit::Format;

constexpr int kSideShots = 5;
constexpr int kSetUpsPerBlock = 10;

void Add(UListCtrl& list, const std::wstring& row) {
    list.AddRecord(list.GetItemCount(), row);
}

/// One set-up: its station, the back sight, side shots, and the stations it observes onward.
void SetUp(UListCtrl& list, const std::wstring& name, const std::wstring& back,
           std::initializer_list<std::wstring> onward) {
    Add(list, Format(L"STN       ID=%s,HI=1.500", name));
    if (!back.empty()) {
        Add(list, Format(L"BKB       ID=%s,HA=0", back));
        Add(list, Format(L"BS        ID=%s,HA=0,VA=90,SD=50.000,HT=1.500", back));
    }
    for (int k = 0; k < kSideShots; ++k) {
        Add(list, Format(L"SS        ID=%s_%d,HA=%d,VA=89.5,SD=%d.250,HT=1.600,CO=FC01", name, k,
                         37 * k + 11, 5 + k));
    }
    int turn = 0;
    for (const std::wstring& next : onward) {
        Add(list,
            Format(L"SS        ID=%s,HA=%d,VA=90,SD=50.000,HT=1.500", next, 90 + 60 * turn++));
    }
}

/// Blocks of ten set-ups: a loop 0-1-2-3-4 back to 0 with a spur S off 2, then 2 occupied
/// again and carried on by 5, 6 and 7, which ends the block.
void FillBlocks(UListCtrl& list, int setUps) {
    list.Reserve(static_cast<std::size_t>(setUps) * (kSideShots + 4) + 4);
    Add(list, L"#VERSION-1.0 NEUTRAL FILE");
    Add(list, L"UNIT      UL=M,UA=D");
    for (int b = 0; b * kSetUpsPerBlock < setUps; ++b) {
        const auto at = [b](const wchar_t* station) { return Format(L"B%d%s", b, station); };
        SetUp(list, at(L"P0"), L"", {at(L"P1")});
        Add(list, Format(L"XYZ       ID=%s,E=%d.000,N=5000.000,H=50.000", at(L"P0"), 1000 * b));
        SetUp(list, at(L"P1"), at(L"P0"), {at(L"P2")});
        SetUp(list, at(L"P2"), at(L"P1"), {at(L"P3"), at(L"S")});
        SetUp(list, at(L"S"), at(L"P2"), {});
        SetUp(list, at(L"P3"), at(L"P2"), {at(L"P4")});
        SetUp(list, at(L"P4"), at(L"P3"), {at(L"P0")});
        SetUp(list, at(L"P2"), at(L"P4"), {at(L"P5")});
        SetUp(list, at(L"P5"), at(L"P2"), {at(L"P6")});
        SetUp(list, at(L"P6"), at(L"P5"), {at(L"P7")});
        SetUp(list, at(L"P7"), at(L"P6"), {});
    }
}

/// One loop of `stations` set-ups on a circle, each observing the next with a small error in
/// its distance, the last closing on the first.
void FillLoop(UListCtrl& list, int stations) {
    list.Reserve(static_cast<std::size_t>(stations) * (kSideShots + 4) + 4);
    Add(list, L"#VERSION-1.0 NEUTRAL FILE");
    Add(list, L"UNIT      UL=M,UA=D");
    const double radius = stations * 50.0 / (2.0 * M_PI);
    const auto name = [stations](int i) { return Format(L"T%d", (i + stations) % stations); };
    const auto position = [&](int i) {
        const double theta = 2.0 * M_PI * i / stations;
        return UWPoint(radius * std::sin(theta), radius * std::cos(theta), 0.0);
    };
    for (int i = 0; i < stations; ++i) {
        const UWPoint here = position(i), back = position(i - 1), ahead = position(i + 1);
        const double back_bearing = here.BearingTo(back);
        Add(list, Format(L"STN       ID=%s,HI=1.500", name(i)));
        if (i == 0) {
            Add(list, Format(L"XYZ       ID=T0,E=%.4f,N=%.4f,H=50.000", here.x, here.y));
            Add(list, Format(L"BKB       ID=%s,BRG=%.8f,HA=0", name(i - 1), back_bearing));
        } else {
            Add(list, Format(L"BKB       ID=%s,HA=0", name(i - 1)));
        }
        Add(list, Format(L"BS        ID=%s,HA=0,VA=90,SD=%.4f,HT=1.500", name(i - 1),
                         here.DistanceTo(back)));
        for (int k = 0; k < kSideShots; ++k) {
            Add(list, Format(L"SS        ID=%s_%d,HA=%d,VA=89.5,SD=%d.250,HT=1.600,CO=FC01",
                             name(i), k, 37 * k + 11, 5 + k));
        }
        const double angle = UAngle::ValidateData(here.BearingTo(ahead) - back_bearing);
        Add(list, Format(L"SS        ID=%s,HA=%.8f,VA=90,SD=%.4f,HT=1.500", name(i + 1), angle,
                         here.DistanceTo(ahead) + (i % 7 == 0 ? 0.003 : 0.0)));
    }
}

void FindRoutes(benchmark::State& state) {
    UJobSettings settings;
    UNeutralFileFormat format(&settings);
    if (!LoadDefinition(format, state)) return;
    UListCtrl list(&format);
    FillBlocks(list, static_cast<int>(state.range(0)));
    nedit::TraverseRoutes routes(format);
    UNeditDatabase engine(&format, &list, nullptr, nullptr);
    engine.Process();
    int found = 0;
    for (auto _ : state) found = routes.FindTraverse(engine);
    state.SetItemsProcessed(state.iterations() * list.GetItemCount());
    state.counters["set-ups"] = static_cast<double>(state.range(0));
    state.counters["rows"] = list.GetItemCount();
    state.counters["routes"] = found;
}

/// Presses "Coordinates", then OK.
class AdjustingHost : public nedit::DialogHost {
  public:
    int ShowMessage(const std::wstring&, unsigned flags, unsigned) override {
        return nedit::mb::DefaultAnswer(flags);
    }

  protected:
    int Show(nedit::UDialogLogic& dialog, const Face*) override {
        dialog.OnInitDialog();
        if (auto* report = dynamic_cast<UMisReportDlg*>(&dialog)) report->OnCoordinateAdjust();
        return nedit::mb::IdOk;
    }
};

void AdjustLoop(benchmark::State& state) {
    UJobSettings settings;
    UNeutralFileFormat format(&settings);
    if (!LoadDefinition(format, state)) return;
    UListCtrl list(&format);
    const int stations = static_cast<int>(state.range(0));
    FillLoop(list, stations);
    AdjustingHost host;
    UNeditDatabase engine(&format, &list, nullptr, &host);
    engine.Process();
    std::wstring names;
    for (int i = 0; i <= stations; ++i) names += Format(L"T%d,", i % stations);
    TraverseParams params;
    const STNSTRUCT* start = engine.searchSTN(L"T0");
    params.StartX = params.FixedX = start->East;
    params.StartY = params.FixedY = start->North;
    params.StartZ = params.FixedZ = 50.0;
    params.StartBearing = start->BkBearing;
    params.FixedPt = L"T0";
    int result = 0;
    for (auto _ : state) {
        CTraverse traverse(&engine);
        traverse.CreateStnList(names);
        result = traverse.Compute(params, nullptr);
    }
    state.SetItemsProcessed(state.iterations() * stations);
    state.counters["stations"] = stations;
    state.counters["result"] = result;
}

}  // namespace

BENCHMARK(FindRoutes)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);
BENCHMARK(AdjustLoop)->Arg(1'000)->Arg(10'000)->Unit(benchmark::kMillisecond);
BENCHMARK_MAIN();
