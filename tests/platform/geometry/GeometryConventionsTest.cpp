// The sign conventions that several classes must share.

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UAngle.h"
#include "platform/geometry/UWArc.h"
#include "platform/geometry/UWLine.h"
#include "platform/geometry/UWPolyline.h"

TEST(GeometryTolerance, IsZero) {
    EXPECT_TRUE(Is_Zero(0.0, false));
    EXPECT_TRUE(Is_Zero(1e-11, false));
    EXPECT_TRUE(Is_Zero(-1e-11, false));
    EXPECT_FALSE(Is_Zero(1e-9, false));
    EXPECT_TRUE(Is_Zero(5e-7, true));
    EXPECT_FALSE(Is_Zero(-2e-6, true));
    EXPECT_FALSE(Is_Zero(std::numeric_limits<double>::quiet_NaN(), false));
    EXPECT_FALSE(Is_Zero(std::numeric_limits<double>::quiet_NaN(), true));
}

TEST(GeometryConventions, OffsetAndPerpendicularDistanceAgree) {
    // Base from R to Q, 50 long with direction (0.6, 0.8); its right-hand normal is (0.8, -0.6).
    // A third point 12 square off Q lies at Q + 12 (0.8, -0.6) = (1039.6, 2032.8) on the right,
    // or at (1020.4, 2047.2) on the left. Its distance from the base, handed to PtOffset as
    // the width, must land on it again from either side.
    const UWLine base(UWPoint(1000.0, 2000.0), UWPoint(1030.0, 2040.0));
    const UWPoint right(1039.6, 2032.8);
    const UWPoint left(1020.4, 2047.2);
    EXPECT_NEAR(right.DistanceTo(base), 12.0, 1e-9);
    EXPECT_NEAR(left.DistanceTo(base), -12.0, 1e-9);
    EXPECT_EQ(base.PtOffset(base.Length(), right.DistanceTo(base)), right);
    EXPECT_EQ(base.PtOffset(base.Length(), left.DistanceTo(base)), left);
    // The corner behind R on the same side: R + 12 (0.8, -0.6) = (1009.6, 1992.8).
    EXPECT_EQ(base.PtOffset(0.0, right.DistanceTo(base)), UWPoint(1009.6, 1992.8));
}

TEST(GeometryConventions, TurningSenseAgreesAcrossClasses) {
    const UWPoint centre(0.0, 0.0);
    const UWPoint north(0.0, 10.0);
    const UWPoint east(10.0, 0.0);
    const UWPoint onArc(7.0710678118654755, 7.0710678118654755);

    // North to East is a clockwise turn of +90, and rotating by it carries North onto East.
    EXPECT_NEAR(UAngle(north, centre, east).Degrees(), 90.0, 1e-12);
    UWLine ray(centre, north);
    ray.Rotate(centre, UAngle(90.0));
    EXPECT_EQ(ray.GetEnd(), east);

    // A centre arc takes the sense bit when the angle at its centre, start to end, is negative.
    const auto senseOf = [&](const UWPoint& start, const UWPoint& end) -> ArcType {
        return UAngle(start, centre, end).Degrees() < 0.0 ? UWArc::kAnticlockwise : 0;
    };
    const UWArc clockwise(north, east, centre, senseOf(north, east));
    const UWArc anticlockwise(east, north, centre, senseOf(east, north));
    EXPECT_TRUE(clockwise.IsClockwise());
    EXPECT_FALSE(anticlockwise.IsClockwise());
    // Both run the short way, as the same arcs given by a point on them do.
    EXPECT_NEAR(clockwise.ComputeAngle(), 90.0, 1e-9);
    EXPECT_NEAR(anticlockwise.ComputeAngle(), 90.0, 1e-9);
    const UWArc clockwiseByPoint(north, east, onArc, UWArc::kThirdOnArc);
    const UWArc anticlockwiseByPoint(east, north, onArc, UWArc::kThirdOnArc);
    EXPECT_TRUE(clockwiseByPoint.IsClockwise());
    EXPECT_FALSE(anticlockwiseByPoint.IsClockwise());
    EXPECT_NEAR(clockwise.GetBulgeFactor(), clockwiseByPoint.GetBulgeFactor(), 1e-12);
    EXPECT_NEAR(anticlockwise.GetBulgeFactor(), anticlockwiseByPoint.GetBulgeFactor(), 1e-12);
    EXPECT_GT(clockwise.GetBulgeFactor(), 0.0);
    EXPECT_LT(anticlockwise.GetBulgeFactor(), 0.0);

    // The triangle centre, North, East runs clockwise: positive area, 10 * 10 / 2 = 50.
    UWPolyline triangle;
    triangle.Add(centre);
    triangle.Add(north);
    triangle.Add(east);
    EXPECT_DOUBLE_EQ(triangle.SignedArea(), 50.0);
}
