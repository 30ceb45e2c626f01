#include "traverse/UWTraverse.h"

#include <cmath>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UWBrgDst.h"
#include "platform/geometry/UWVector.h"

namespace {

/// The misclose from `last` to `fixedEnd`; its height part only when both have a height.
struct Misclose {
    Misclose(const UWPoint& last, const UWPoint& fixedEnd)
        : East(fixedEnd.x - last.x),
          North(fixedEnd.y - last.y),
          HasHeight(fixedEnd.z > UWPoint::kNoHeight && last.z > UWPoint::kNoHeight),
          Height(HasHeight ? fixedEnd.z - last.z : 0.0) {}
    double East;
    double North;
    bool HasHeight;
    double Height;
};

double Turn(double degrees) {
    if (degrees < 0.0) degrees += 360.0;
    return std::fmod(degrees, 360.0);
}

}  // namespace

bool UWTraverse::AngleAdjustment(double correction, double startBearing) {
    const int n = GetSize();
    if (n == 0 || Is_Zero(correction, false)) return false;
    const double share = correction / n;
    double back_old = startBearing;
    double back_new = startBearing;
    UWPoint prev_old = GetAt(0);
    UWPoint prev_new = GetAt(0);
    for (int i = 1; i < n; ++i) {
        const UWPoint cur = GetAt(i);
        const UWBrgDst leg(prev_old.BearingTo(cur), prev_old.DistanceTo(cur, false));
        const double turned = Turn(leg.bearing - back_old + share);
        const double new_bearing = std::fmod(turned + back_new, 360.0);
        const UWPoint rebuilt = prev_new + UWVector(UWBrgDst(new_bearing, leg.distance));
        SetAt(i, rebuilt);
        back_old = cur.BearingTo(prev_old);
        back_new = std::fmod(new_bearing + 180.0, 360.0);
        prev_old = cur;
        prev_new = rebuilt;
    }
    return true;
}

bool UWTraverse::CompassAdjustment(const UWPoint& fixedEnd, bool adjustZ) {
    const int n = GetSize();
    if (n == 0) return false;
    const double total = Length(false);
    if (Is_Zero(total, false)) return false;
    const Misclose misclose(GetAt(n - 1), fixedEnd);
    double ce = 0.0, cn = 0.0, cz = 0.0;
    UWPoint prev = GetAt(0);
    for (int i = 1; i < n; ++i) {
        UWPoint cur = GetAt(i);
        const double leg = prev.DistanceTo(cur, false);
        ce += leg * misclose.East / total;
        cn += leg * misclose.North / total;
        if (misclose.HasHeight) cz += leg * misclose.Height / total;
        prev = cur;
        cur.x += ce;
        cur.y += cn;
        if (adjustZ && cur.z > UWPoint::kNoHeight) cur.z += cz;
        SetAt(i, cur);
    }
    return true;
}

bool UWTraverse::TransitAdjustment(const UWPoint& fixedEnd, bool adjustZ) {
    const int n = GetSize();
    if (n == 0) return false;
    const Misclose misclose(GetAt(n - 1), fixedEnd);
    double sum_e = 0.0, sum_n = 0.0;
    for (int i = 1; i < n; ++i) {
        sum_e += std::fabs(GetAt(i).x - GetAt(i - 1).x);
        sum_n += std::fabs(GetAt(i).y - GetAt(i - 1).y);
    }
    if (Is_Zero(sum_e, false) && Is_Zero(sum_n, false)) return false;
    const double z_share = misclose.Height / n;
    double ce = 0.0, cn = 0.0;
    UWPoint prev = GetAt(0);
    for (int i = 1; i < n; ++i) {
        UWPoint cur = GetAt(i);
        if (!Is_Zero(sum_e, false)) ce += std::fabs(cur.x - prev.x) * misclose.East / sum_e;
        if (!Is_Zero(sum_n, false)) cn += std::fabs(cur.y - prev.y) * misclose.North / sum_n;
        prev = cur;
        cur.x += ce;
        cur.y += cn;
        if (adjustZ && cur.z > UWPoint::kNoHeight && misclose.HasHeight) cur.z += z_share;
        SetAt(i, cur);
    }
    return true;
}
