#pragma once
// What a check shot gave: where it put the point, where the point is known to be, and the
// differences the report prints.

#include <string>

struct CheckResult {
    std::wstring Station;    ///< the occupied station
    std::wstring Id;         ///< the check shot's own name
    std::wstring KnownName;  ///< the known point: named behind the check code, else Id
    bool Known = false;      ///< the known point's coordinates could be had
    double E = 0.0, N = 0.0, H = 0.0;
    double KnownE = 0.0, KnownN = 0.0, KnownH = 0.0;
    double Bearing = 0.0, KnownBearing = 0.0, BearingDiff = 0.0;
    double Distance = 0.0, KnownDistance = 0.0, DistanceDiff = 0.0;
};
