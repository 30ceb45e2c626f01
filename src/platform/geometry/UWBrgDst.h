#pragma once

#include "platform/geometry/UWPoint.h"

/// A polar step in plan: a bearing (degrees clockwise from North, [0, 360)) and a distance.
class UWBrgDst {
  public:
    UWBrgDst() = default;
    UWBrgDst(double bearingDeg, double dist) : bearing(bearingDeg), distance(dist) {}

    /// Bearing and plan distance from `from` to `to`; coincident points give (0, 0).
    UWBrgDst(const UWPoint& from, const UWPoint& to)
        : bearing(from.BearingTo(to)), distance(from.DistanceTo(to)) {}

    double bearing = 0.0;
    double distance = 0.0;
};
