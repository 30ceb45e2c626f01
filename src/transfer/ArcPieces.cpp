#include "transfer/ArcPieces.h"

#include "platform/geometry/Tolerance.h"

namespace nedit {

bool SplitArcAt(const UWArc& arc, const UWPoint& at, UWArc& first, UWArc& second) {
    const double length = arc.ComputeArcLength();
    const double along = at.DistanceAlong(arc);
    if (!Is_Zero(along, false) && !(along > 0.0)) return false;
    if (!Is_Zero(along - length, false) && !(length > along)) return false;
    first = UWArc(arc.GetStart(), at, arc.PtOffset(along * 0.5, 0.0), UWArc::kThirdOnArc);
    second = UWArc(at, arc.GetEnd(), arc.PtOffset((length - along) * 0.5 + along, 0.0),
                   UWArc::kThirdOnArc);
    return true;
}

UWArc ReversedArc(const UWArc& arc) {
    return UWArc(arc.GetEnd(), arc.GetStart(), arc.MidPt(), UWArc::kThirdOnArc);
}

}  // namespace nedit
