#include "platform/geometry/UWPolygon.h"

#include <algorithm>
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

/// The box of a side, widened so that sides that touch within kCoarseTolerance overlap.
struct SideBox {
    std::size_t Side;
    double MinX, MaxX, MinY, MaxY;
};

// The boxes of the sides of the closed outline through `corners`, by their western edge.
std::vector<SideBox> SideBoxes(const std::vector<UWPoint>& corners) {
    constexpr double kMargin = 10.0 * kCoarseTolerance;
    std::vector<SideBox> boxes;
    boxes.reserve(corners.size());
    for (std::size_t i = 0; i < corners.size(); ++i) {
        const UWPoint& from = corners[i];
        const UWPoint& to = corners[(i + 1) % corners.size()];
        boxes.push_back({i, std::min(from.x, to.x) - kMargin, std::max(from.x, to.x) + kMargin,
                         std::min(from.y, to.y) - kMargin, std::max(from.y, to.y) + kMargin});
    }
    std::sort(boxes.begin(), boxes.end(),
              [](const SideBox& a, const SideBox& b) { return a.MinX < b.MinX; });
    return boxes;
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
    }
    // Only sides whose boxes overlap can meet: the sides are swept from west to east, and each
    // is tested against those that start before it ends, so that a long outline such as a
    // traverse of thousands of stations is not tested side against every side.
    const std::vector<SideBox> boxes = SideBoxes(corners);
    for (std::size_t a = 0; a < n; ++a) {
        const SideBox& first = boxes[a];
        for (std::size_t b = a + 1; b < n && boxes[b].MinX <= first.MaxX; ++b) {
            const SideBox& second = boxes[b];
            const std::size_t i = std::min(first.Side, second.Side);
            const std::size_t j = std::max(first.Side, second.Side);
            // Neighbours share a corner; the closing side neighbours the first.
            if (j - i < 2 || (i == 0 && j == n - 1)) continue;
            if (second.MinY > first.MaxY || second.MaxY < first.MinY) continue;
            if (SegmentsMeet(UWLine(corner(i), corner(i + 1)), UWLine(corner(j), corner(j + 1)))) {
                return true;
            }
        }
    }
    return false;
}
