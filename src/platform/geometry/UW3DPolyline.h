#pragma once

#include "platform/geometry/UWPolyline.h"

/// A polyline whose points carry heights, such as a traverse route.
class UW3DPolyline : public UWPolyline {
  public:
    /// Sum of the leg lengths from the first point to the last. Plan lengths unless `threeD`
    /// is set; then a leg between two points with heights counts its slope length, and a leg
    /// with a point without a height its plan length. The plan sum is what the traverse
    /// adjustment divides by, since its legs are horizontal distances.
    double Length(bool threeD = false) const;
};
