#pragma once

// A point of the plan. Sign conventions of the whole library: see the top of UWLine.h.

class UWArc;
class UWLine;

/// A point: x is the Easting, y the Northing, z the height, all in the job's length unit.
/// A height of kNoHeight means that the point has none; the library carries z along and
/// only blends heights (HeightBetween) when both ends have one.
class UWPoint {
  public:
    /// The height value that stands for "no height".
    static constexpr double kNoHeight = -10000.0;

    UWPoint() = default;
    UWPoint(double east, double north, double height = 0.0) : x(east), y(north), z(height) {}

    /// False when z is kNoHeight (or below it).
    bool HasHeight() const;

    /// Bearing in degrees, clockwise from North, in [0, 360), from this point to `to`.
    /// A point coincident with this one gives 0.
    double BearingTo(const UWPoint& to) const;

    /// Plan distance to `to`. With `threeD` set the slope distance, when both points have a
    /// height; a point without one gives the plan distance.
    double DistanceTo(const UWPoint& to, bool threeD = false) const;

    /// Signed perpendicular distance in plan from the endless line through `line`:
    /// positive when this point lies to the right of the line's direction of travel, negative
    /// to its left, so that line.PtOffset(DistanceAlong(line), DistanceTo(line)) is this
    /// point. A line of no length runs North (see UWLine).
    double DistanceTo(const UWLine& line) const;

    /// Shortest plan distance from the arc as drawn, never negative: from the circle when this
    /// point lies within the arc's sweep, else from the nearer end. A degenerate arc is its
    /// chord (see UWArc::IsValid).
    double DistanceTo(const UWArc& arc) const;

    /// Chainage along `line` of the foot of the perpendicular from this point: the distance from
    /// the line's start, negative before it and above the length beyond the end.
    double DistanceAlong(const UWLine& line) const;

    /// Arc length from the arc's start, in the arc's direction, to the foot of the radius through
    /// this point. A point within the sweep gives 0 to the arc length; outside it, the nearer
    /// end decides: beyond the end gives more than the arc length, before the start a negative
    /// value. The centre itself gives 0. A degenerate arc is its chord.
    double DistanceAlong(const UWArc& arc) const;

    /// The height at `fraction` of the way from `from` to `to` (0 at `from`, 1 at `to`, beyond
    /// either end linearly), or kNoHeight unless both have a height.
    static double HeightBetween(const UWPoint& from, const UWPoint& to, double fraction);

    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
};

/// Two points are equal when they coincide in plan within kCoarseTolerance (a micrometre) in
/// x and in y. Heights are not compared: a surveyed point and a computed corner at the same
/// place are the same point whatever heights they carry.
bool operator==(const UWPoint& a, const UWPoint& b);
inline bool operator!=(const UWPoint& a, const UWPoint& b) {
    return !(a == b);
}
