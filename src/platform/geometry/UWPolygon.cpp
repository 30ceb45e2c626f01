#include "platform/geometry/UWPolygon.h"

#include <cstddef>
#include <vector>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UWLine.h"

namespace {

// -1, 0 or 1: the side of `line` on which `point` lies, 0 within kCoarseTolerance of it.
int Side(const UWPoint& point, const UWLine& line) {
    const double offset = point.DistanceTo(line);
    if (Is_Zero(offset, true)) {
        return 0;
    }
    return offset > 0.0 ? 1 : -1;
}

// Whether `point`, known to lie on the endless `line`, lies between its ends.
bool WithinSegment(const UWPoint& point, const UWLine& line) {
    const double along = point.DistanceAlong(line);
    return along >= -kCoarseTolerance && along <= line.Length() + kCoarseTolerance;
}

bool SegmentsMeet(const UWLine& a, const UWLine& b) {
    const int s1 = Side(b.GetStart(), a);
    const int s2 = Side(b.GetEnd(), a);
    const int s3 = Side(a.GetStart(), b);
    const int s4 = Side(a.GetEnd(), b);
    if (s1 * s2 < 0 && s3 * s4 < 0) {
        return true;
    }
    return (s1 == 0 && WithinSegment(b.GetStart(), a)) ||
           (s2 == 0 && WithinSegment(b.GetEnd(), a)) ||
           (s3 == 0 && WithinSegment(a.GetStart(), b)) || (s4 == 0 && WithinSegment(a.GetEnd(), b));
}

// Whether the sides shared - to and shared - from run back over each other.
bool FoldsBack(const UWPoint& to, const UWPoint& shared, const UWPoint& from) {
    const UWLine side(shared, to);
    return Side(from, side) == 0 && from.DistanceAlong(side) > 0.0;
}

}  // namespace

bool UWPolygon::IsSelfIntersecting() const {
    std::vector<UWPoint> corners;
    for (int i = 0; i < GetSize(); ++i) {
        if (corners.empty() || GetAt(i) != corners.back()) {
            corners.push_back(GetAt(i));
        }
    }
    while (corners.size() > 1 && corners.back() == corners.front()) {
        corners.pop_back();
    }
    const std::size_t n = corners.size();
    if (n < 3) {
        return false;
    }
    const auto corner = [&](std::size_t i) -> const UWPoint& { return corners[i % n]; };
    for (std::size_t i = 0; i < n; ++i) {
        // Side i runs from corner i to corner i + 1; its neighbour i + 1 shares corner i + 1.
        if (FoldsBack(corner(i), corner(i + 1), corner(i + 2))) {
            return true;
        }
        for (std::size_t j = i + 2; j < n; ++j) {
            if (i == 0 && j == n - 1) {
                continue;  // the closing side neighbours the first
            }
            if (SegmentsMeet(UWLine(corner(i), corner(i + 1)), UWLine(corner(j), corner(j + 1)))) {
                return true;
            }
        }
    }
    return false;
}
