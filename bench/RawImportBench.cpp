// Importing generated raw files of growing size: Leica GSI-16 through the driver alone and
// through the document into its record list as the import command does, and Carlson RW5
// (a line-based driver) through the driver alone.

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

// A set-up and `shots` side shots on both faces as an RW5 file writes them (about 60 bytes
// a line).
std::string MakeRw5(long shots) {
    const std::string path = "/tmp/sxnedit-bench-" + std::to_string(shots) + ".rw5";
    if (std::ifstream(path)) return path;
    std::ofstream out(path, std::ios::binary);
    out << "MO,AD0,UN1,SF1.00000000,EC0,EO0.0,AU0\r\nOC,OP1,N 1000.000,E 2000.000,EL50.000\r\n"
           "LS,HI1.500,HR1.800\r\nBK,OP1,BP2,BS,BC0.0000\r\n";
    char line[128];
    for (long i = 0; i < shots; ++i) {
        std::snprintf(line, sizeof line,
                      "%s,OP1,FP%ld,AR%ld.%02ld%02ld,ZE%ld.%02ld%02ld,SD%ld.%03ld,--TREE\r\n",
                      i % 2 == 0 ? "FD" : "FR", i / 2 + 3, i % 360, i % 60, i * 7 % 60,
                      i % 2 == 0 ? 89L : 270L, i % 60, i * 3 % 60, 10 + i % 500, i % 1000);
        out << line;
    }
    return path;
}

// A document with the build's drivers, its record definition and settings in /tmp.
struct Session {
    explicit Session(const wchar_t* driver = L"Leica GSI") {
        setenv("SXNEDIT_CONFIG", "/tmp/sxnedit-bench-config", 1);
        doc.SetDeviceManager(
            std::make_unique<UDeviceManager>(L"", 0, false, SXNEDIT_BENCH_DRIVER_DIR));
        doc.GetDeviceManager()->LoadDLL(driver);
    }
    UNeditDoc doc{nullptr};
    UListCtrl list{&doc};
};

// The records of the raw file `path` through the driver `driver` alone.
void ThroughTheDriver(benchmark::State& state, const std::string& path, const wchar_t* driver) {
    Session session(driver);
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

void DriverOnly(benchmark::State& state) {
    ThroughTheDriver(state, MakeGsi(state.range(0)), L"Leica GSI");
}

void Rw5DriverOnly(benchmark::State& state) {
    ThroughTheDriver(state, MakeRw5(state.range(0)), L"Carlson RW5");
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
BENCHMARK(Rw5DriverOnly)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK(IntoTheList)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK_MAIN();
