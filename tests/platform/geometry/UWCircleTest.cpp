#include <gtest/gtest.h>

#include "platform/geometry/UWCircle.h"

TEST(UWCircle, ThroughThreePoints) {
    // A right angle at the first point puts the centre on the middle of the hypotenuse,
    // (3, 4), radius 5; the centre takes the first point's height.
    const UWCircle right(UWPoint(0.0, 0.0, 4.0), UWPoint(6.0, 0.0), UWPoint(0.0, 8.0));
    ASSERT_TRUE(right.IsValid());
    EXPECT_NEAR(right.GetCentre().x, 3.0, 1e-12);
    EXPECT_NEAR(right.GetCentre().y, 4.0, 1e-12);
    EXPECT_DOUBLE_EQ(right.GetCentre().z, 4.0);
    EXPECT_NEAR(right.GetRadius(), 5.0, 1e-12);

    // The same at grid coordinates of several million metres.
    const double e = 512345.678;
    const double n = 7012345.678;
    const UWCircle far(UWPoint(e, n), UWPoint(e + 6.0, n), UWPoint(e, n + 8.0));
    EXPECT_NEAR(far.GetCentre().x, e + 3.0, 1e-6);
    EXPECT_NEAR(far.GetCentre().y, n + 4.0, 1e-6);
    EXPECT_NEAR(far.GetRadius(), 5.0, 1e-6);
}

TEST(UWCircle, PointsOnALineOrCoincidentMakeNoCircle) {
    EXPECT_FALSE(UWCircle(UWPoint(0.0, 0.0), UWPoint(5.0, 5.0), UWPoint(10.0, 10.0)).IsValid());
    const UWCircle twice(UWPoint(1.0, 1.0), UWPoint(1.0, 1.0), UWPoint(4.0, 5.0));
    EXPECT_FALSE(twice.IsValid());
    EXPECT_EQ(twice.GetRadius(), 0.0);
}
