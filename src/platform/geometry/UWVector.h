#pragma once

#include <cmath>

#include "platform/geometry/UAngle.h"
#include "platform/geometry/UWBrgDst.h"
#include "platform/geometry/UWPoint.h"

/// A displacement: x East, y North, z up.
class UWVector {
  public:
    UWVector() = default;
    UWVector(double dEast, double dNorth, double dHeight = 0.0) : x(dEast), y(dNorth), z(dHeight) {}

    /// The plan step of a bearing and distance: (d sin b, d cos b, 0).
    explicit UWVector(const UWBrgDst& step)
        : x(step.distance * std::sin(step.bearing * kRadiansPerDegree)),
          y(step.distance * std::cos(step.bearing * kRadiansPerDegree)) {}

    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
};

/// The point moved by `step`. The height is added as it stands: a point without a height moved
/// by a plan step (z 0) keeps UWPoint::kNoHeight.
inline UWPoint operator+(const UWPoint& point, const UWVector& step) {
    return UWPoint(point.x + step.x, point.y + step.y, point.z + step.z);
}
