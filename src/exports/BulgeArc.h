#pragma once
// The arc between two points that a bulge describes, as the job keeps bulges: tan(sweep / 4),
// positive for a clockwise arc (see UWLine.h), 0 for a straight leg. Formats that know arcs
// take its centre and angles; formats that do not take its points, close enough that no
// chord strays from the arc by more than a tolerance.

#include <vector>

#include "platform/geometry/UWPoint.h"

namespace nedit {

class BulgeArc {
  public:
    BulgeArc(const UWPoint& from, const UWPoint& to, double bulge);

    /// False for a straight leg (bulge 0, or two points that coincide).
    bool IsArc() const { return arc_; }
    bool IsClockwise() const { return bulge_ > 0.0; }
    const UWPoint& Centre() const { return centre_; }
    double Radius() const { return radius_; }
    /// The angle swept from start to end, radians, in (0, 2 pi).
    double Sweep() const { return sweep_; }
    /// Directions from the centre to the start and to the end, radians anticlockwise from
    /// East, as CAD and GIS measure angles.
    double StartAngle() const;
    double EndAngle() const;

    /// The point at `fraction` of the way along the arc (0 the start, 1 the end); its height
    /// blended by the fraction when both ends have one.
    UWPoint PointAt(double fraction) const;

    /// The points after the start up to and including the end, so that no chord between
    /// them leaves the arc by more than `tolerance`, and no chord spans more than 22.5
    /// degrees; a straight leg gives its end alone.
    std::vector<UWPoint> Densify(double tolerance) const;

  private:
    UWPoint from_;
    UWPoint to_;
    double bulge_;
    bool arc_ = false;
    UWPoint centre_;
    double radius_ = 0.0;
    double sweep_ = 0.0;
};

/// How many chords a sweep of `sweep` radians on a circle of `radius` needs so that none
/// leaves the circle by more than `tolerance` nor spans more than 22.5 degrees; at least 1.
int ChordsFor(double sweep, double radius, double tolerance);

/// A whole circle as a closed ring: its first point (due East of the centre) again at the
/// end, the points running anticlockwise, the ring's chords within `tolerance` as above.
std::vector<UWPoint> CircleRing(const UWPoint& centre, double radius, double tolerance);

}  // namespace nedit
