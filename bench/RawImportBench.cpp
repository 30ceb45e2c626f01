// Importing generated Leica GSI-16 files of growing size: through the driver alone, and
// through the document into its record list as the import command does.

#include <benchmark/benchmark.h>
#include <stdlib.h>

#include <cstdio>
#include <fstream>
#include <string>

#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/UDeviceManager.h"

namespace {

// `blocks` measurement blocks as a total station records them: point, Hz and V
// sexagesimal, slope distance, ppm/prism, reflector and instrument height (about 170 bytes).
std::string MakeGsi(long blocks) {
    const std::string path = "/tmp/sxnedit-bench-" + std::to_string(blocks) + ".gsi";
    if (std::ifstream(path)) return path;
    std::ofstream out(path, std::ios::binary);
    char block[256];
    for (long i = 0; i < blocks; ++i) {
        std::snprintf(
            block, sizeof block,
            "*11%04ld+%016ld 21.024+%016ld 22.024+%016ld 31...0+%016ld "
            "51....+000000000017+000 87...0+0000000000001300 88...0+0000000000001324 \r\n",
            i % 10000, i + 1, i % 360 * 100000 + i % 60 * 1000 + i * 7 % 600, 9000000 + i % 59,
            13825 + i % 100000);
        out << block;
    }
    return path;
}

// A document with the build's drivers, its record definition and settings in /tmp.
struct Session {
    Session() {
        setenv("SXNEDIT_CONFIG", "/tmp/sxnedit-bench-config", 1);
        doc.SetDeviceManager(
            std::make_unique<UDeviceManager>(L"", 0, false, SXNEDIT_BENCH_DRIVER_DIR));
        doc.GetDeviceManager()->LoadDLL(L"Leica GSI");
    }
    UNeditDoc doc{nullptr};
    UListCtrl list{&doc};
};

void DriverOnly(benchmark::State& state) {
    const std::string path = MakeGsi(state.range(0));
    Session session;
    UDeviceManager& manager = *session.doc.GetDeviceManager();
    long records = 0;
    for (auto _ : state) {
        records = 0;
        manager.Import(std::wstring(path.begin(), path.end()), 9);
        std::wstring record;
        while (!manager.GetEOF()) {
            if (manager.DataAvailable() && manager.GetData(record) > 1) ++records;
        }
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
    state.counters["records"] = static_cast<double>(records);
}

void IntoTheList(benchmark::State& state) {
    const std::string path = MakeGsi(state.range(0));
    Session session;
    for (auto _ : state) {
        session.list.DeleteAllItems();
        benchmark::DoNotOptimize(
            session.doc.Import(std::wstring(path.begin(), path.end()), &session.list));
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
    state.counters["rows"] = session.list.GetItemCount();
}

}  // namespace

BENCHMARK(DriverOnly)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK(IntoTheList)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK_MAIN();
