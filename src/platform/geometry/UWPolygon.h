#pragma once

#include "platform/geometry/UWPolyline.h"

/// A closed figure: the last point joins back to the first. A last point that repeats the
/// first (by UWPoint equality) adds no side.
class UWPolygon : public UWPolyline {
  public:
    /// True when the outline crosses or touches itself: two sides that are not neighbours
    /// meet (an end lying on another side counts, within kCoarseTolerance), or a side folds
    /// back over its neighbour. Repeated consecutive points are skipped. A figure of fewer than
    /// three distinct corners does not cross itself.
    bool IsSelfIntersecting() const;
};
