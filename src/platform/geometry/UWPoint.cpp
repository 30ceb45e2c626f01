#include "platform/geometry/UWPoint.h"

#include <algorithm>
#include <cmath>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UAngle.h"
#include "platform/geometry/UWArc.h"
#include "platform/geometry/UWLine.h"
#include "platform/geometry/UWVector.h"

bool UWPoint::HasHeight() const {
    return z > kNoHeight && !Is_Zero(z - kNoHeight);
}

double UWPoint::BearingTo(const UWPoint& to) const {
    // atan2 of (dE, dN) is the angle from North towards East, which is a bearing.
    return UAngle::ValidateData(std::atan2(to.x - x, to.y - y) / kRadiansPerDegree);
}

double UWPoint::DistanceTo(const UWPoint& to, bool threeD) const {
    const double plan = std::hypot(to.x - x, to.y - y);
    if (threeD && HasHeight() && to.HasHeight()) {
        return std::hypot(plan, to.z - z);
    }
    return plan;
}

double UWPoint::DistanceTo(const UWLine& line) const {
    const UWVector along = line.Direction();
    // The right-hand normal of (e, n) is (n, -e): the direction turned clockwise by 90.
    return (x - line.GetStart().x) * along.y - (y - line.GetStart().y) * along.x;
}

double UWPoint::DistanceTo(const UWArc& arc) const {
    if (!arc.IsValid()) {
        const UWLine chord(arc.GetStart(), arc.GetEnd());
        const double along = std::clamp(DistanceAlong(chord), 0.0, chord.Length());
        return DistanceTo(chord.PtAtDistance(along));
    }
    const UWPoint centre = arc.ComputeCentre();
    const double radius = arc.ComputeRadius();
    const double chainage = DistanceAlong(arc);
    if (chainage >= 0.0 && chainage <= arc.ComputeArcLength()) {
        return std::fabs(DistanceTo(centre) - radius);
    }
    return std::min(DistanceTo(arc.PtOffset(0.0, 0.0)),
                    DistanceTo(arc.PtOffset(arc.ComputeArcLength(), 0.0)));
}

double UWPoint::DistanceAlong(const UWLine& line) const {
    const UWVector along = line.Direction();
    return (x - line.GetStart().x) * along.x + (y - line.GetStart().y) * along.y;
}

double UWPoint::DistanceAlong(const UWArc& arc) const {
    if (!arc.IsValid()) {
        return DistanceAlong(UWLine(arc.GetStart(), arc.GetEnd()));
    }
    const UWPoint centre = arc.ComputeCentre();
    if (*this == centre) {
        return 0.0;
    }
    const double startRadial = centre.BearingTo(arc.GetStart());
    const double turn = arc.IsClockwise() ? centre.BearingTo(*this) - startRadial
                                          : startRadial - centre.BearingTo(*this);
    double swept = UAngle::ValidateData(turn);
    // Outside the sweep, the middle of the gap divides "beyond the end" from "before the start".
    const double sweep = arc.ComputeAngle();
    if (swept > sweep + (360.0 - sweep) / 2.0) {
        swept -= 360.0;
    }
    return arc.ComputeRadius() * swept * kRadiansPerDegree;
}

double UWPoint::HeightBetween(const UWPoint& from, const UWPoint& to, double fraction) {
    if (!from.HasHeight() || !to.HasHeight()) {
        return kNoHeight;
    }
    return from.z + (to.z - from.z) * fraction;
}

bool operator==(const UWPoint& a, const UWPoint& b) {
    return Is_Zero(a.x - b.x, true) && Is_Zero(a.y - b.y, true);
}
