#pragma once
// The values of the station the reduction walk is working: its position, its orientation and
// how far the walk has come. The walk (ProcessCoord.cpp) and the check shots (CheckShots.cpp)
// read them.

#include <string>

#include "reduction/UNeditDatabase.h"

/// What lives while one station is worked.
struct UNeditDatabase::StationWork {
    double StnE = 0.0;
    double StnN = 0.0;
    double StnZ = kNoHeight;
    std::wstring StnCodeOut;
    double BackBearing = 0.0;
    double BsReading = 0.0;
    std::size_t StepsDone = 0;
    std::size_t Steps = 1;
    bool HasShots = false;
    bool HeadPrinted = false;
    /// The blocks of stations and targets are written: there is a report, reporting is on,
    /// and the report keeps its text (one that keeps none would only throw them away).
    bool Printing = false;
};
