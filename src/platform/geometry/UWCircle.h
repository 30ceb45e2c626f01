#pragma once

#include "platform/geometry/UWPoint.h"

/// A circle in plan: a centre and a radius. A radius of 0 means no circle (IsValid false).
class UWCircle {
  public:
    UWCircle() = default;
    UWCircle(const UWPoint& centre, double radius) : centre_(centre), radius_(radius) {}

    /// The circle through three points; the centre takes the first point's height. Points on
    /// one line (the sine of the angle at `first` zero by Is_Zero) or two of them coincident
    /// (by UWPoint equality) fix no circle: radius 0, centre at `first`.
    UWCircle(const UWPoint& first, const UWPoint& second, const UWPoint& third);

    const UWPoint& GetCentre() const { return centre_; }
    double GetRadius() const { return radius_; }
    bool IsValid() const { return radius_ > 0.0; }

  private:
    UWPoint centre_;
    double radius_ = 0.0;
};
