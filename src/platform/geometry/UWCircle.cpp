#include "platform/geometry/UWCircle.h"

#include <cmath>

#include "platform/geometry/Tolerance.h"

UWCircle::UWCircle(const UWPoint& first, const UWPoint& second, const UWPoint& third)
    : centre_(first) {
    if (first == second || first == third || second == third) {
        return;
    }
    // Work relative to the first point: survey coordinates run to millions, and squaring them
    // would spend the precision that the centre needs.
    const double bx = second.x - first.x;
    const double by = second.y - first.y;
    const double cx = third.x - first.x;
    const double cy = third.y - first.y;
    const double cross = bx * cy - by * cx;
    if (Is_Zero(cross / (std::hypot(bx, by) * std::hypot(cx, cy)))) {
        return;
    }
    const double b2 = bx * bx + by * by;
    const double c2 = cx * cx + cy * cy;
    const double ux = (cy * b2 - by * c2) / (2.0 * cross);
    const double uy = (bx * c2 - cx * b2) / (2.0 * cross);
    centre_ = UWPoint(first.x + ux, first.y + uy, first.z);
    radius_ = std::hypot(ux, uy);
}
