#include "platform/geometry/UWLine.h"

#include <cmath>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UWPolyline.h"

namespace {

// The point of `point` turned clockwise by `angle` about `centre`; the height stays.
UWPoint Turned(const UWPoint& point, const UWPoint& centre, const UAngle& angle) {
    const double c = std::cos(angle.Radians());
    const double s = std::sin(angle.Radians());
    const double dx = point.x - centre.x;
    const double dy = point.y - centre.y;
    return UWPoint(centre.x + dx * c + dy * s, centre.y - dx * s + dy * c, point.z);
}

// Whether chainage `along` lies on a segment of `length`, its ends included or not.
bool OnSegment(double along, double length, bool includeEnds) {
    if (includeEnds) {
        return along >= -kCoarseTolerance && along <= length + kCoarseTolerance;
    }
    return along > kCoarseTolerance && along < length - kCoarseTolerance;
}

}  // namespace

double UWLine::Bearing() const {
    return start_.BearingTo(end_);
}

double UWLine::Length(bool threeD) const {
    return start_.DistanceTo(end_, threeD);
}

UWVector UWLine::Direction() const {
    const double length = Length();
    if (length == 0.0) {
        return UWVector(0.0, 1.0);
    }
    return UWVector((end_.x - start_.x) / length, (end_.y - start_.y) / length);
}

UWPoint UWLine::MidPt() const {
    return UWPoint((start_.x + end_.x) / 2.0, (start_.y + end_.y) / 2.0,
                   UWPoint::HeightBetween(start_, end_, 0.5));
}

void UWLine::Rotate(const UWPoint& centre, const UAngle& angle) {
    start_ = Turned(start_, centre, angle);
    end_ = Turned(end_, centre, angle);
}

UWPoint UWLine::PtAtDistance(double along) const {
    return PtOffset(along, 0.0);
}

UWPoint UWLine::PtOffset(double along, double across) const {
    const UWVector unit = Direction();
    const double length = Length();
    const double fraction = length > 0.0 ? along / length : 0.0;
    // To the right of (e, n) is (n, -e).
    return UWPoint(start_.x + along * unit.x + across * unit.y,
                   start_.y + along * unit.y - across * unit.x,
                   UWPoint::HeightBetween(start_, end_, fraction));
}

int UWLine::IntersectState(const UWLine& other, UWPolyline& result, bool includeEnds,
                           int limits) const {
    result.RemoveAll();
    const double length = Length();
    const double otherLength = other.Length();
    if (Is_Zero(length, true) || Is_Zero(otherLength, true)) {
        return kParallel;
    }
    const double dx = end_.x - start_.x;
    const double dy = end_.y - start_.y;
    const double odx = other.end_.x - other.start_.x;
    const double ody = other.end_.y - other.start_.y;
    const double cross = dx * ody - dy * odx;
    if (Is_Zero(cross / (length * otherLength))) {
        return Is_Zero(other.start_.DistanceTo(*this), true) ? kCollinear : kParallel;
    }
    // Solve start + t (dx, dy) = other.start + u (odx, ody) for the fractions t and u.
    const double wx = other.start_.x - start_.x;
    const double wy = other.start_.y - start_.y;
    const double t = (wx * ody - wy * odx) / cross;
    const double u = (wx * dy - wy * dx) / cross;
    const bool onThis = OnSegment(t * length, length, includeEnds);
    const bool onOther = OnSegment(u * otherLength, otherLength, includeEnds);
    if ((limits == kBothSegments && !(onThis && onOther)) || (limits == kThisSegment && !onThis) ||
        (limits == kOtherSegment && !onOther)) {
        return kMeetOutside;
    }
    result.Add(PtAtDistance(t * length));
    return kMeet;
}
