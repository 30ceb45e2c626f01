#pragma once

// =================================================================================================
// Conventions of the plane geometry (UWPoint, UWLine, UWArc, UWCircle, polylines, UAngle)
//
//  * x is East, y is North, the plan seen from above. Lengths are in the job's unit.
//  * Bearings are degrees clockwise from North, in [0, 360): a step East is 90, South 180.
//  * TURNING IS POSITIVE CLOCKWISE, the sense in which bearings grow:
//      - UWLine::Rotate by +90 turns a line running North into one running East;
//      - UAngle(from, vertex, to) is positive when the turn from `from` to `to` is clockwise;
//      - UWArc::GetBulgeFactor is positive for a clockwise arc, negative for an anticlockwise
//        one; a clockwise arc has its centre on its right;
//      - UWPolyline::SignedArea is positive when the vertices run clockwise.
//  * AN OFFSET IS POSITIVE TO THE RIGHT of the direction of travel: UWLine::PtOffset,
//    UWArc::PtOffset and UWPoint::DistanceTo(UWLine) all use it, so that
//    line.PtOffset(p.DistanceAlong(line), p.DistanceTo(line)) gives p back.
//  * Heights (z) are carried, never invented: a point made between two points gets a blended
//    height only when both have one, else UWPoint::kNoHeight.
// =================================================================================================

#include "platform/geometry/UAngle.h"
#include "platform/geometry/UWPoint.h"
#include "platform/geometry/UWVector.h"

class UWPolyline;

/// A straight line from a start point to an end point. A line of no length has no direction
/// of its own; it is taken to run North, so every operation still has an answer.
class UWLine {
  public:
    /// IntersectState answers.
    static constexpr int kMeet = 1;         ///< one meeting point, put in the result
    static constexpr int kMeetOutside = 0;  ///< the lines meet, but outside the asked limits
    static constexpr int kParallel = -1;    ///< parallel and apart, or a line of no length
    static constexpr int kCollinear = -2;   ///< the same endless line: no single meeting point

    /// IntersectState limits: which of the two lines count as segments.
    static constexpr int kEndless = -1;      ///< both lines endless
    static constexpr int kBothSegments = 0;  ///< the point must lie on both segments
    static constexpr int kThisSegment = 1;   ///< on this line's segment only
    static constexpr int kOtherSegment = 2;  ///< on the other line's segment only

    UWLine() = default;
    UWLine(const UWPoint& start, const UWPoint& end) : start_(start), end_(end) {}

    const UWPoint& GetStart() const { return start_; }
    const UWPoint& GetEnd() const { return end_; }

    /// Bearing from start to end, degrees in [0, 360); 0 for a line of no length.
    double Bearing() const;

    /// Plan length; with `threeD` the slope length when both ends have a height.
    double Length(bool threeD = false) const;

    /// Unit plan vector from start to end (z 0); North, (0, 1), for a line of no length.
    UWVector Direction() const;

    /// The point half way along, with the blended height.
    UWPoint MidPt() const;

    /// Turns both ends about `centre` by `angle`, clockwise for a positive angle. Heights stay.
    void Rotate(const UWPoint& centre, const UAngle& angle);

    /// The point at chainage `along` from the start, on the endless line: negative values lie
    /// behind the start, values above the length beyond the end. Same as PtOffset(along, 0).
    UWPoint PtAtDistance(double along) const;

    /// The point at chainage `along` and `across` to the side: positive to the right of the
    /// direction of travel, negative to the left. The height is blended along the line.
    UWPoint PtOffset(double along, double across) const;

    /// Where this line meets `other`. `result` is emptied; with kMeet it holds the one meeting
    /// point (height blended along this line). `limits` (kEndless, kBothSegments,
    /// kThisSegment, kOtherSegment) says which lines count only between their ends; with
    /// kEndless both are endless and `includeEnds` has no effect. Otherwise `includeEnds` says
    /// whether a point on a segment's end point (within kCoarseTolerance) lies on the segment.
    /// Answers kMeet, kMeetOutside, kParallel or kCollinear; only kMeet is above 0. Lines are
    /// parallel when the sine of the angle between them is zero by Is_Zero.
    int IntersectState(const UWLine& other, UWPolyline& result, bool includeEnds, int limits) const;

  private:
    UWPoint start_;
    UWPoint end_;
};
