#pragma once
// The positions of a traverse route, with the three adjustment rules. Point 0, the start,
// never moves. A height of UWPoint::kNoHeight is no height: no rule treats it as a number,
// and a point without one stays without one.

#include "platform/geometry/UW3DPolyline.h"

class UWTraverse : public UW3DPolyline {
  public:
    /// Spreads `correction` (degrees) over the angles: with n points each of the n - 1 legs
    /// turns by one share correction / n more than the leg before it, and the points are
    /// rebuilt leg by leg from point 0 with their leg lengths; the n-th share belongs to the
    /// closing angle. Every rebuilt point takes point 0's height. False for no points or a
    /// correction that is zero.
    bool AngleAdjustment(double correction, double startBearing);
    /// The Compass (Bowditch) rule: each leg takes the share of the misclose that its length
    /// is of the whole, as running sums, so the last point lands on `fixedEnd`. Heights too
    /// with `adjustZ`, when both ends have one. False for no points or no length.
    bool CompassAdjustment(const UWPoint& fixedEnd, bool adjustZ);
    /// The Transit rule: the easting correction goes by each leg's easting difference, the
    /// northing correction by its northing difference. Heights do not follow the rule: with
    /// `adjustZ` every point after the first is raised by the same misclose / n, n counting
    /// all points, so the last point ends (n - 1) / n of the misclose short of the fixed
    /// height: the adjustment has always treated heights so. False for
    /// no points, or when the legs have neither easting nor northing differences.
    bool TransitAdjustment(const UWPoint& fixedEnd, bool adjustZ);
};
