#include "platform/geometry/CoordinateGeometry.h"

#include <cmath>

#include "platform/geometry/UAngle.h"

namespace nedit {

void geo_brgdst(double e1, double n1, double e2, double n2, double* brg, double* dst) {
    const double de = e2 - e1;
    const double dn = n2 - n1;
    *dst = std::sqrt(dn * dn + de * de);
    if (std::fabs(dn) <= kCoordinateZero) {
        *brg = de < 0.0 ? 270.0 : de > 0.0 ? 90.0 : 0.0;
        return;
    }
    *brg = std::atan2(de, dn) * kDegreesPerRadian;
    if (*brg < 0.0) *brg += 360.0;
}

int geo_zero(double value) {
    return std::fabs(value) <= kCoordinateZero ? 1 : 0;
}

void geo_coord(double e, double n, double bearing, double dist, double* eOut, double* nOut) {
    const double b = bearing * kRadiansPerDegree;
    *eOut = std::sin(b) * dist + e;
    *nOut = std::cos(b) * dist + n;
}

}  // namespace nedit
