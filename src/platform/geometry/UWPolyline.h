#pragma once

#include <vector>

#include "platform/geometry/UWPoint.h"

/// An ordered list of points in plan, the base of the 3D polyline and of the polygon. Indices
/// run from 0; an index out of range throws std::out_of_range.
class UWPolyline {
  public:
    UWPolyline() = default;
    UWPolyline(const UWPolyline&) = default;
    UWPolyline(UWPolyline&&) = default;
    UWPolyline& operator=(const UWPolyline&) = default;
    UWPolyline& operator=(UWPolyline&&) = default;
    // The traverse's working copy derives from the 3D polyline and is handled by the base.
    virtual ~UWPolyline() = default;

    /// Appends `point` and gives its index.
    int Add(const UWPoint& point);
    const UWPoint& GetAt(int index) const;
    void SetAt(int index, const UWPoint& point);
    UWPoint& operator[](int index);
    const UWPoint& operator[](int index) const;
    int GetSize() const { return static_cast<int>(points_.size()); }
    bool IsEmpty() const { return points_.empty(); }
    void RemoveAll() { points_.clear(); }

    /// Sum of the plan lengths of the legs from the first point to the last (not closed).
    double PlaneLength() const;

    /// Area of the figure closed from the last point back to the first, positive when the
    /// points run clockwise and negative when anticlockwise. 0 with fewer than 3 points. A
    /// figure that crosses itself gives the difference of its lobes.
    double SignedArea() const;

    /// Size of SignedArea: the area enclosed, whichever way the points run.
    double Area() const;

  private:
    std::vector<UWPoint> points_;
};
