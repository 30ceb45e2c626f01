#include "platform/geometry/UWArc.h"

#include <cmath>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UAngle.h"
#include "platform/geometry/UWCircle.h"
#include "platform/geometry/UWLine.h"

// What the three points and the type fix, worked out once per query.
struct UWArc::Shape {
    bool valid = false;
    bool clockwise = false;
    UWPoint centre;
    double radius = 0.0;
    double startRadial = 0.0;  // bearing from the centre to the start
    double sweep = 0.0;        // degrees turned from start to end, in [0, 360)
};

UWArc::Shape UWArc::Solve() const {
    Shape shape;
    shape.clockwise = IsClockwise();
    if (IsThreePoint()) {
        const UWCircle circle(start_, third_, end_);
        shape.centre = circle.GetCentre();
        shape.radius = circle.GetRadius();
    } else if (start_ != third_) {
        shape.centre = third_;
        shape.radius = third_.DistanceTo(start_);
    }
    shape.valid = shape.radius > 0.0;
    if (!shape.valid) {
        shape.radius = 0.0;
        shape.centre = UWLine(start_, end_).MidPt();
        return shape;
    }
    shape.startRadial = shape.centre.BearingTo(start_);
    const double endRadial = shape.centre.BearingTo(end_);
    // Bearings grow clockwise, so a clockwise sweep is the growth from start to end.
    shape.sweep = UAngle::ValidateData(shape.clockwise ? endRadial - shape.startRadial
                                                       : shape.startRadial - endRadial);
    return shape;
}

bool UWArc::IsValid() const {
    return Solve().valid;
}

bool UWArc::IsClockwise() const {
    if (!IsThreePoint()) {
        return (type_ & kAnticlockwise) == 0;
    }
    // With x East and y North a negative cross product of the two legs is a right-hand turn.
    const double cross =
        (third_.x - start_.x) * (end_.y - third_.y) - (third_.y - start_.y) * (end_.x - third_.x);
    return cross < 0.0 && UWCircle(start_, third_, end_).IsValid();
}

UWPoint UWArc::ComputeCentre() const {
    return Solve().centre;
}

double UWArc::ComputeRadius() const {
    return Solve().radius;
}

double UWArc::ComputeAngle() const {
    return Solve().sweep;
}

double UWArc::ComputeArcLength() const {
    const Shape shape = Solve();
    if (!shape.valid) {
        return start_.DistanceTo(end_);
    }
    return shape.radius * shape.sweep * kRadiansPerDegree;
}

double UWArc::ComputeSectorArea() const {
    const Shape shape = Solve();
    return shape.radius * shape.radius * shape.sweep * kRadiansPerDegree / 2.0;
}

double UWArc::ComputeStartBrg() const {
    const Shape shape = Solve();
    if (!shape.valid) {
        return ComputeChordBrg();
    }
    // The tangent is square to the radius, on the side towards which the arc turns.
    return UAngle::ValidateData(shape.clockwise ? shape.startRadial + 90.0
                                                : shape.startRadial - 90.0);
}

double UWArc::ComputeEndBrg() const {
    const Shape shape = Solve();
    if (!shape.valid) {
        return ComputeChordBrg();
    }
    return UAngle::ValidateData(shape.clockwise ? shape.startRadial + shape.sweep + 90.0
                                                : shape.startRadial - shape.sweep - 90.0);
}

double UWArc::ComputeChordBrg() const {
    return start_.BearingTo(end_);
}

UWPoint UWArc::MidPt() const {
    return PtOffset(ComputeArcLength() / 2.0, 0.0);
}

UWPoint UWArc::PtOffset(double along, double across) const {
    const Shape shape = Solve();
    if (!shape.valid) {
        return UWLine(start_, end_).PtOffset(along, across);
    }
    const double turned = along / shape.radius / kRadiansPerDegree;
    const double radial =
        (shape.clockwise ? shape.startRadial + turned : shape.startRadial - turned) *
        kRadiansPerDegree;
    // The right of a clockwise traveller is the inside of the circle.
    const double distance = shape.clockwise ? shape.radius - across : shape.radius + across;
    const double length = shape.radius * shape.sweep * kRadiansPerDegree;
    const double fraction = length > 0.0 ? along / length : 0.0;
    return UWPoint(shape.centre.x + distance * std::sin(radial),
                   shape.centre.y + distance * std::cos(radial),
                   UWPoint::HeightBetween(start_, end_, fraction));
}

double UWArc::GetBulgeFactor() const {
    const Shape shape = Solve();
    if (!shape.valid) {
        return 0.0;
    }
    const double size = std::tan(shape.sweep * kRadiansPerDegree / 4.0);
    return shape.clockwise ? size : -size;
}
