#include <gtest/gtest.h>

#include "platform/geometry/UWLine.h"
#include "platform/geometry/UWPoint.h"

TEST(UWPoint, BearingInEveryQuadrantAndOnTheAxes) {
    const UWPoint from(1000.0, 2000.0);
    const double steps[][3] = {{0, 1, 0},    {1, 1, 45},    {1, 0, 90},   {1, -1, 135},
                               {0, -1, 180}, {-1, -1, 225}, {-1, 0, 270}, {-1, 1, 315}};
    for (const auto& step : steps) {
        EXPECT_NEAR(from.BearingTo(UWPoint(from.x + step[0], from.y + step[1])), step[2], 1e-12);
    }
    // atan(3/4) = 36.8698976 degrees; the step reversed adds 180.
    EXPECT_NEAR(from.BearingTo(UWPoint(1003.0, 2004.0)), 36.8698976458, 1e-9);
    EXPECT_NEAR(from.BearingTo(UWPoint(997.0, 1996.0)), 216.8698976458, 1e-9);
    EXPECT_EQ(from.BearingTo(from), 0.0);
    // A hair West of North: 360 minus 6e-16 rounds to 360.0, which must come back as 0.
    EXPECT_EQ(UWPoint(0.0, 0.0).BearingTo(UWPoint(-1e-17, 1.0)), 0.0);
}

TEST(UWPoint, PlanAndSlopeDistance) {
    const UWPoint a(0.0, 0.0, 10.0);
    EXPECT_DOUBLE_EQ(a.DistanceTo(UWPoint(3.0, 4.0, 22.0)), 5.0);         // 3-4-5 in plan
    EXPECT_DOUBLE_EQ(a.DistanceTo(UWPoint(3.0, 4.0, 22.0), true), 13.0);  // 5-12-13, rise 12
    EXPECT_DOUBLE_EQ(a.DistanceTo(UWPoint(3.0, 4.0, UWPoint::kNoHeight), true), 5.0);
}

TEST(UWPoint, SignedDistanceAndChainageFromALine) {
    const UWLine north(UWPoint(0.0, 0.0), UWPoint(0.0, 10.0));
    EXPECT_DOUBLE_EQ(UWPoint(3.0, 4.0).DistanceTo(north), 3.0);  // East is right of North
    EXPECT_DOUBLE_EQ(UWPoint(3.0, 4.0).DistanceAlong(north), 4.0);
    EXPECT_DOUBLE_EQ(UWPoint(-2.0, 12.0).DistanceTo(north), -2.0);
    EXPECT_DOUBLE_EQ(UWPoint(-2.0, 12.0).DistanceAlong(north), 12.0);  // beyond the end
    EXPECT_DOUBLE_EQ(UWPoint(1.0, -5.0).DistanceAlong(north), -5.0);   // behind the start

    // Running North-East at grid coordinates, a point 10 East of the start lies on the right,
    // 10 / sqrt(2) = 7.0710678 off and as far along.
    const UWLine diagonal(UWPoint(500000.0, 7000000.0), UWPoint(500010.0, 7000010.0));
    EXPECT_NEAR(UWPoint(500010.0, 7000000.0).DistanceTo(diagonal), 7.0710678119, 1e-8);
    EXPECT_NEAR(UWPoint(500010.0, 7000000.0).DistanceAlong(diagonal), 7.0710678119, 1e-8);
}

TEST(UWPoint, EqualityIsInPlanWithinAMicrometre) {
    EXPECT_EQ(UWPoint(1.0, 2.0, 3.0), UWPoint(1.0, 2.0, 99.0));
    EXPECT_EQ(UWPoint(1.0, 2.0), UWPoint(1.0 + 5e-7, 2.0 - 5e-7));
    EXPECT_NE(UWPoint(1.0, 2.0), UWPoint(1.0 + 2e-6, 2.0));
    EXPECT_NE(UWPoint(1.0, 2.0), UWPoint(1.0, 2.0 - 2e-6));
}
