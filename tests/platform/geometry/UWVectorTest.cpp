#include <gtest/gtest.h>

#include "platform/geometry/UWBrgDst.h"
#include "platform/geometry/UWVector.h"

TEST(UWVector, PolarStepsAndBack) {
    // From (1000, 2000) to (1003, 2004): atan(3/4) = 36.8698976 degrees and 5.
    const UWBrgDst step(UWPoint(1000.0, 2000.0), UWPoint(1003.0, 2004.0));
    EXPECT_NEAR(step.bearing, 36.8698976458, 1e-9);
    EXPECT_DOUBLE_EQ(step.distance, 5.0);

    // Bearing 30, 10: (10 sin 30, 10 cos 30) = (5, 8.6602540), added to a point with height 50.
    const UWPoint moved = UWPoint(1000.0, 2000.0, 50.0) + UWVector(UWBrgDst(30.0, 10.0));
    EXPECT_NEAR(moved.x, 1005.0, 1e-9);
    EXPECT_NEAR(moved.y, 2008.6602540378, 1e-9);
    EXPECT_DOUBLE_EQ(moved.z, 50.0);

    // Stepping out a point's bearing and distance to another lands on it, in every quadrant;
    // a point without a height keeps none.
    const UWPoint from(512345.678, 7012345.678, UWPoint::kNoHeight);
    for (const UWVector& offset : {UWVector(12.3, 45.6), UWVector(78.9, -0.12),
                                   UWVector(-34.5, -67.8), UWVector(-9.87, 6.54)}) {
        const UWPoint to = from + offset;
        const UWPoint back = from + UWVector(UWBrgDst(from, to));
        EXPECT_EQ(back, to);
        EXPECT_EQ(back.z, UWPoint::kNoHeight);
    }
}
