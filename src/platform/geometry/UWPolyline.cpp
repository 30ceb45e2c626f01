#include "platform/geometry/UWPolyline.h"

#include <cmath>

int UWPolyline::Add(const UWPoint& point) {
    points_.push_back(point);
    return GetSize() - 1;
}

const UWPoint& UWPolyline::GetAt(int index) const {
    return points_.at(static_cast<std::size_t>(index));
}

void UWPolyline::SetAt(int index, const UWPoint& point) {
    points_.at(static_cast<std::size_t>(index)) = point;
}

UWPoint& UWPolyline::operator[](int index) {
    return points_.at(static_cast<std::size_t>(index));
}

const UWPoint& UWPolyline::operator[](int index) const {
    return points_.at(static_cast<std::size_t>(index));
}

double UWPolyline::PlaneLength() const {
    double length = 0.0;
    for (std::size_t i = 1; i < points_.size(); ++i) {
        length += points_[i - 1].DistanceTo(points_[i]);
    }
    return length;
}

double UWPolyline::SignedArea() const {
    if (points_.size() < 3) {
        return 0.0;
    }
    // Shoelace about the first point, so that large coordinates do not swamp the products.
    const UWPoint& origin = points_.front();
    double twice = 0.0;
    for (std::size_t i = 1; i + 1 < points_.size(); ++i) {
        const double ax = points_[i].x - origin.x;
        const double ay = points_[i].y - origin.y;
        const double bx = points_[i + 1].x - origin.x;
        const double by = points_[i + 1].y - origin.y;
        twice += ax * by - ay * bx;
    }
    // The shoelace sum is positive anticlockwise; the library counts clockwise as positive.
    return -twice / 2.0;
}

double UWPolyline::Area() const {
    return std::fabs(SignedArea());
}
