#include <gtest/gtest.h>

#include "platform/geometry/UWLine.h"
#include "platform/geometry/UWPolyline.h"

namespace {

void ExpectPointNear(const UWPoint& actual, double x, double y) {
    EXPECT_NEAR(actual.x, x, 1e-9);
    EXPECT_NEAR(actual.y, y, 1e-9);
}

}  // namespace

TEST(UWLine, BearingLengthAndMidPoint) {
    // A step of (-3, -4) rising 8: bearing 180 + atan(3/4) = 216.8698976, 5 in plan,
    // sqrt(25 + 64) = 9.4339811 on the slope.
    const UWLine line(UWPoint(100.0, 100.0, 10.0), UWPoint(97.0, 96.0, 18.0));
    EXPECT_NEAR(line.Bearing(), 216.8698976458, 1e-9);
    EXPECT_DOUBLE_EQ(line.Length(), 5.0);
    EXPECT_NEAR(line.Length(true), 9.4339811321, 1e-9);
    ExpectPointNear(line.MidPt(), 98.5, 98.0);
    EXPECT_DOUBLE_EQ(line.MidPt().z, 14.0);

    // With one end without a height there is no slope and no blended height.
    const UWLine flat(UWPoint(0.0, 0.0, UWPoint::kNoHeight), UWPoint(0.0, 4.0, 3.0));
    EXPECT_DOUBLE_EQ(flat.Length(true), 4.0);
    EXPECT_EQ(flat.MidPt().z, UWPoint::kNoHeight);
}

TEST(UWLine, RotateTurnsClockwiseForAPositiveAngle) {
    UWLine line(UWPoint(0.0, 0.0, 5.0), UWPoint(0.0, 10.0, 7.0));
    line.Rotate(UWPoint(0.0, 0.0), UAngle(90.0));
    ExpectPointNear(line.GetEnd(), 10.0, 0.0);  // North turned clockwise is East
    EXPECT_DOUBLE_EQ(line.GetEnd().z, 7.0);

    // About (5, 5) by -90: the start, (-5, -5) from the centre, goes to (5, -5) from it.
    line.Rotate(UWPoint(5.0, 5.0), UAngle(-90.0));
    ExpectPointNear(line.GetStart(), 10.0, 0.0);
    ExpectPointNear(line.GetEnd(), 10.0, 10.0);
}

TEST(UWLine, PointsAlongAndBeside) {
    // Length 50, direction (0.6, 0.8), right-hand normal (0.8, -0.6), rising 10.
    const UWLine line(UWPoint(0.0, 0.0, 0.0), UWPoint(30.0, 40.0, 10.0));
    ExpectPointNear(line.PtAtDistance(25.0), 15.0, 20.0);
    EXPECT_DOUBLE_EQ(line.PtAtDistance(25.0).z, 5.0);
    ExpectPointNear(line.PtAtDistance(-10.0), -6.0, -8.0);
    ExpectPointNear(line.PtOffset(50.0, 5.0), 34.0, 37.0);  // right
    ExpectPointNear(line.PtOffset(0.0, -5.0), -4.0, 3.0);   // left

    // A line of no length runs North: along is northward, across eastward.
    ExpectPointNear(UWLine(UWPoint(1.0, 1.0), UWPoint(1.0, 1.0)).PtOffset(2.0, 3.0), 4.0, 3.0);
}

TEST(UWLine, IntersectionOfEndlessAndLimitedLines) {
    UWPolyline result;
    result.Add(UWPoint(99.0, 99.0));  // a stale entry must not survive

    // The diagonals of a 10 m square meet at its middle; heights blend along this line.
    const UWLine a(UWPoint(0.0, 0.0, 0.0), UWPoint(10.0, 10.0, 10.0));
    const UWLine b(UWPoint(0.0, 10.0), UWPoint(10.0, 0.0));
    ASSERT_EQ(a.IntersectState(b, result, false, UWLine::kBothSegments), UWLine::kMeet);
    ASSERT_EQ(result.GetSize(), 1);
    ExpectPointNear(result.GetAt(0), 5.0, 5.0);
    EXPECT_DOUBLE_EQ(result.GetAt(0).z, 5.0);

    // Short pieces of y = x and x + y = 10 stop short; their endless lines meet at (5, 5).
    const UWLine c(UWPoint(0.0, 0.0), UWPoint(1.0, 1.0));
    const UWLine d(UWPoint(10.0, 0.0), UWPoint(9.0, 1.0));
    for (bool flag : {false, true}) {
        ASSERT_EQ(c.IntersectState(d, result, flag, UWLine::kEndless), UWLine::kMeet);
        ExpectPointNear(result.GetAt(0), 5.0, 5.0);
    }
    EXPECT_EQ(c.IntersectState(d, result, true, UWLine::kBothSegments), UWLine::kMeetOutside);
    EXPECT_TRUE(result.IsEmpty());

    // Meeting on an end point counts only when ends are included.
    const UWLine base(UWPoint(0.0, 0.0), UWPoint(10.0, 0.0));
    const UWLine post(UWPoint(10.0, -5.0), UWPoint(10.0, 5.0));
    EXPECT_EQ(base.IntersectState(post, result, true, UWLine::kBothSegments), UWLine::kMeet);
    EXPECT_EQ(base.IntersectState(post, result, false, UWLine::kBothSegments),
              UWLine::kMeetOutside);
    EXPECT_EQ(base.IntersectState(post, result, false, UWLine::kOtherSegment), UWLine::kMeet);

    // Parallel, collinear, and a line of no length: no single meeting point.
    const UWLine parallel(UWPoint(0.0, 5.0), UWPoint(10.0, 5.0));
    EXPECT_EQ(base.IntersectState(parallel, result, false, UWLine::kEndless), UWLine::kParallel);
    const UWLine further(UWPoint(30.0, 0.0), UWPoint(20.0, 0.0));
    EXPECT_EQ(base.IntersectState(further, result, false, UWLine::kEndless), UWLine::kCollinear);
    const UWLine dot(UWPoint(3.0, 3.0), UWPoint(3.0, 3.0));
    EXPECT_EQ(base.IntersectState(dot, result, false, UWLine::kEndless), UWLine::kParallel);
    EXPECT_TRUE(result.IsEmpty());
}
