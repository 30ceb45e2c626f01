#pragma once
// Set-up shared by the benchmarks.

#include <benchmark/benchmark.h>

#include "records/UNeutralFileFormat.h"

/// Loads the shipped record definition; marks the benchmark skipped when it cannot.
inline bool LoadDefinition(UNeutralFileFormat& format, benchmark::State& state) {
    if (format.LoadNeutralFileDefinition(L"" SXNEDIT_DATA_DIR)) return true;
    state.SkipWithError("record definition missing");
    return false;
}
