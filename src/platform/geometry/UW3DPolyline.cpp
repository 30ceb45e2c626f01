#include "platform/geometry/UW3DPolyline.h"

double UW3DPolyline::Length(bool threeD) const {
    double length = 0.0;
    for (int i = 1; i < GetSize(); ++i) {
        length += GetAt(i - 1).DistanceTo(GetAt(i), threeD);
    }
    return length;
}
