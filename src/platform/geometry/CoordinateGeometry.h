#pragma once
// Coordinate geometry on plain East, North pairs, with the rules the field programs have
// always applied. Bearings are degrees clockwise from North.

namespace nedit {

/// Below this size a coordinate difference counts as none in geo_brgdst and geo_zero.
inline constexpr double kCoordinateZero = 1e-5;

/// Bearing (degrees, [0, 360)) and plan distance from (e1, n1) to (e2, n2). A northing
/// difference of kCoordinateZero or less counts as none: the bearing is then 90 or 270 by
/// the sign of the easting difference, and 0 when that is 0 as well.
void geo_brgdst(double e1, double n1, double e2, double n2, double* brg, double* dst);

/// 1 when the size of `value` is kCoordinateZero or less, else 0.
int geo_zero(double value);

/// The point `dist` from (e, n) on `bearing` (degrees).
void geo_coord(double e, double n, double bearing, double dist, double* eOut, double* nOut);

}  // namespace nedit
