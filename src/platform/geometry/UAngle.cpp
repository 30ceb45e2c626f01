#include "platform/geometry/UAngle.h"

#include <cmath>

#include "platform/geometry/UWPoint.h"

UAngle::UAngle(const UWPoint& from, const UWPoint& vertex, const UWPoint& to) {
    if (from == vertex || to == vertex) {
        return;
    }
    const double turn = ValidateData(vertex.BearingTo(to) - vertex.BearingTo(from));
    degrees_ = turn > 180.0 ? turn - 360.0 : turn;
}

double UAngle::ValidateData(double degrees) {
    double turn = std::fmod(degrees, 360.0);
    if (turn < 0.0) {
        turn += 360.0;
    }
    // A tiny negative remainder plus 360 rounds to 360 itself, which is the same direction as 0.
    return turn >= 360.0 ? 0.0 : turn;
}
