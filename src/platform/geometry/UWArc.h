#pragma once

// Arcs. Sign conventions (clockwise positive, offsets to the right): see the top of UWLine.h.

#include "platform/geometry/UWPoint.h"

/// How the third point of an arc is read, and the sense of a centre arc.
///  bit 0 (UWArc::kThirdOnArc) set: the third point lies on the arc between start and end, and
///        the three points fix centre, radius and sense; the sense bit is not read.
///  bit 0 clear: the third point is the centre. The radius is the distance from the centre to
///        the start; the end fixes only the direction in which the arc stops.
///  bit 1 (UWArc::kAnticlockwise), read for centre arcs only: clear, the arc runs clockwise
///        from start to end about the centre; set, anticlockwise.
using ArcType = unsigned int;

/// A circular arc from a start point to an end point, defined by three points and an ArcType.
///
/// An arc is degenerate (IsValid false) when its points fix no circle: a three-point arc whose
/// points lie on one line or coincide, or a centre arc whose start is on the centre. A
/// degenerate arc is taken as its straight chord: radius 0, angle 0, area 0, bulge 0, length,
/// bearings and points those of the line from start to end, centre the chord's mid point.
class UWArc {
  public:
    static constexpr ArcType kThirdOnArc = 1;
    static constexpr ArcType kAnticlockwise = 2;

    UWArc() = default;
    UWArc(const UWPoint& start, const UWPoint& end, const UWPoint& third, ArcType type)
        : start_(start), end_(end), third_(third), type_(type) {}

    const UWPoint& GetStart() const { return start_; }
    const UWPoint& GetEnd() const { return end_; }
    const UWPoint& GetThird() const { return third_; }
    ArcType GetArcType() const { return type_; }
    bool IsThreePoint() const { return (type_ & kThirdOnArc) != 0; }

    /// True when the points fix a circle of positive radius.
    bool IsValid() const;

    /// True when the arc runs clockwise from start to end. A three-point arc decides by the turn
    /// start, third, end (a straight one is not clockwise); a centre arc by the sense bit.
    bool IsClockwise() const;

    /// Centre of the arc's circle: the third point of a centre arc; for a three-point arc the
    /// circle's centre, with the start's height.
    UWPoint ComputeCentre() const;
    double ComputeRadius() const;

    /// Angle swept from start to end about the centre, degrees, in [0, 360). A centre arc whose
    /// end lies in the direction of its start sweeps 0, not a whole turn.
    double ComputeAngle() const;

    /// Length along the arc.
    double ComputeArcLength() const;

    /// Area of the sector between the two radii and the arc: r * r * angle / 2.
    double ComputeSectorArea() const;

    /// Bearings of the tangent in the direction of travel at the start and at the end, and of
    /// the chord from start to end, degrees in [0, 360).
    double ComputeStartBrg() const;
    double ComputeEndBrg() const;
    double ComputeChordBrg() const;

    /// The point half way along the arc.
    UWPoint MidPt() const;

    /// The point at arc length `along` from the start in the direction of travel (the circle
    /// continued beyond either end), moved `across` along the radius: positive to the right of
    /// the direction of travel, which is towards the centre of a clockwise arc and away from
    /// that of an anticlockwise one. The height is blended between start and end by arc length.
    UWPoint PtOffset(double along, double across) const;

    /// tan(angle / 4): positive for a clockwise arc, negative for an anticlockwise one, 0 for a
    /// degenerate arc. A half circle gives +-1, a larger arc more than 1 in size.
    double GetBulgeFactor() const;

  private:
    struct Shape;
    Shape Solve() const;

    UWPoint start_;
    UWPoint end_;
    UWPoint third_;
    ArcType type_ = 0;
};
