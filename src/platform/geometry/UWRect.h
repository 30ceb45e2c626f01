#pragma once

#include <limits>

#include "platform/geometry/UWPoint.h"

/// An axis-parallel rectangle in plan, such as the extents of a set of points. A rectangle
/// made by the default constructor is empty: it holds no point, and the first point it is
/// extended by makes it that single point (width and height 0, but no longer empty).
class UWRect {
  public:
    UWRect() = default;

    /// The rectangle with corners (x1, y1) and (x2, y2), given in any order.
    UWRect(double x1, double y1, double x2, double y2);

    /// True when nothing has been put in.
    bool IsEmpty() const { return minX_ > maxX_ || minY_ > maxY_; }

    /// Grows the rectangle to take in `point`. A point with an x or y that is not a number is
    /// ignored.
    void Extend(const UWPoint& point);

    /// True when `point` lies inside or on the border. An empty rectangle contains nothing.
    bool Contains(const UWPoint& point) const;

    /// Size East-West and North-South; 0 when empty.
    double Width() const { return IsEmpty() ? 0.0 : maxX_ - minX_; }
    double Height() const { return IsEmpty() ? 0.0 : maxY_ - minY_; }

    /// The borders. For an empty rectangle the minima are +infinity and the maxima -infinity.
    double GetMinX() const { return minX_; }
    double GetMinY() const { return minY_; }
    double GetMaxX() const { return maxX_; }
    double GetMaxY() const { return maxY_; }

  private:
    double minX_ = std::numeric_limits<double>::infinity();
    double minY_ = std::numeric_limits<double>::infinity();
    double maxX_ = -std::numeric_limits<double>::infinity();
    double maxY_ = -std::numeric_limits<double>::infinity();
};
