#include "platform/geometry/UWRect.h"

#include <algorithm>
#include <cmath>

UWRect::UWRect(double x1, double y1, double x2, double y2)
    : minX_(std::min(x1, x2)),
      minY_(std::min(y1, y2)),
      maxX_(std::max(x1, x2)),
      maxY_(std::max(y1, y2)) {}

void UWRect::Extend(const UWPoint& point) {
    if (std::isnan(point.x) || std::isnan(point.y)) {
        return;
    }
    minX_ = std::min(minX_, point.x);
    minY_ = std::min(minY_, point.y);
    maxX_ = std::max(maxX_, point.x);
    maxY_ = std::max(maxY_, point.y);
}

bool UWRect::Contains(const UWPoint& point) const {
    return point.x >= minX_ && point.x <= maxX_ && point.y >= minY_ && point.y <= maxY_;
}
