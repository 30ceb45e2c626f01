#include "exports/BulgeArc.h"

#include <algorithm>
#include <cmath>

namespace nedit {

namespace {

constexpr double kPi = 3.14159265358979323846;
constexpr double kLongestChordSweep = kPi / 8.0;

}  // namespace

BulgeArc::BulgeArc(const UWPoint& from, const UWPoint& to, double bulge)
    : from_(from), to_(to), bulge_(bulge) {
    const double dx = to.x - from.x;
    const double dy = to.y - from.y;
    const double chord = std::hypot(dx, dy);
    if (bulge == 0.0 || chord == 0.0) return;
    arc_ = true;
    sweep_ = 4.0 * std::atan(std::fabs(bulge));
    radius_ = chord / (2.0 * std::sin(sweep_ / 2.0));
    // From the chord's middle to the centre: to the right of travel for a clockwise arc of
    // less than a half circle; the sign of the cotangent turns it over for a larger one.
    const double offset = (chord / 2.0) / std::tan(sweep_ / 2.0) * (bulge > 0.0 ? 1.0 : -1.0);
    const double right_x = dy / chord;
    const double right_y = -dx / chord;
    centre_ =
        UWPoint(from.x + dx / 2.0 + right_x * offset, from.y + dy / 2.0 + right_y * offset, from.z);
}

double BulgeArc::StartAngle() const {
    return std::atan2(from_.y - centre_.y, from_.x - centre_.x);
}

double BulgeArc::EndAngle() const {
    return std::atan2(to_.y - centre_.y, to_.x - centre_.x);
}

UWPoint BulgeArc::PointAt(double fraction) const {
    const double height = UWPoint::HeightBetween(from_, to_, fraction);
    if (!arc_) {
        return UWPoint(from_.x + (to_.x - from_.x) * fraction,
                       from_.y + (to_.y - from_.y) * fraction, height);
    }
    // Clockwise runs against the anticlockwise angles of atan2.
    const double angle = StartAngle() + (IsClockwise() ? -1.0 : 1.0) * sweep_ * fraction;
    return UWPoint(centre_.x + radius_ * std::cos(angle), centre_.y + radius_ * std::sin(angle),
                   height);
}

std::vector<UWPoint> BulgeArc::Densify(double tolerance) const {
    if (!arc_) return {to_};
    const int chords = ChordsFor(sweep_, radius_, tolerance);
    std::vector<UWPoint> points;
    points.reserve(static_cast<std::size_t>(chords));
    for (int i = 1; i < chords; ++i) points.push_back(PointAt(static_cast<double>(i) / chords));
    points.push_back(to_);
    return points;
}

int ChordsFor(double sweep, double radius, double tolerance) {
    // A chord spanning the angle a leaves the arc by r (1 - cos(a / 2)) at its middle.
    double longest = kLongestChordSweep;
    if (tolerance > 0.0 && tolerance < radius)
        longest = std::min(longest, 2.0 * std::acos(1.0 - tolerance / radius));
    return std::max(1, static_cast<int>(std::ceil(sweep / longest - 1e-9)));
}

std::vector<UWPoint> CircleRing(const UWPoint& centre, double radius, double tolerance) {
    const int chords = ChordsFor(2.0 * kPi, radius, tolerance);
    std::vector<UWPoint> ring;
    ring.reserve(static_cast<std::size_t>(chords) + 1);
    for (int i = 0; i < chords; ++i) {
        const double angle = 2.0 * kPi * i / chords;
        ring.emplace_back(centre.x + radius * std::cos(angle), centre.y + radius * std::sin(angle),
                          centre.z);
    }
    ring.push_back(ring.front());
    return ring;
}

}  // namespace nedit
