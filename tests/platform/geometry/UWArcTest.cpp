#include <gtest/gtest.h>

#include "platform/geometry/UWArc.h"

namespace {

// 10 / sqrt(2): the point of a radius-10 circle about the origin at bearing 45 is (kDiag, kDiag).
constexpr double kDiag = 7.0710678118654755;

void ExpectPointNear(const UWPoint& actual, double x, double y, double tolerance = 1e-9) {
    EXPECT_NEAR(actual.x, x, tolerance);
    EXPECT_NEAR(actual.y, y, tolerance);
}

}  // namespace

TEST(UWArc, QuarterCircleThroughThreePoints) {
    // North to East about the origin, radius 10, clockwise through bearing 45:
    //   angle 90, length 10 pi / 2 = 15.7079633, sector 100 pi / 4 = 78.5398163;
    //   tangent East (90) at the start, South (180) at the end, chord South-East (135);
    //   bulge tan(90 / 4) = sqrt(2) - 1 = 0.4142136.
    const UWArc arc(UWPoint(0.0, 10.0, 10.0), UWPoint(10.0, 0.0, 20.0), UWPoint(kDiag, kDiag),
                    UWArc::kThirdOnArc);
    ASSERT_TRUE(arc.IsValid());
    EXPECT_TRUE(arc.IsClockwise());
    ExpectPointNear(arc.ComputeCentre(), 0.0, 0.0);
    EXPECT_NEAR(arc.ComputeRadius(), 10.0, 1e-9);
    EXPECT_NEAR(arc.ComputeAngle(), 90.0, 1e-9);
    EXPECT_NEAR(arc.ComputeArcLength(), 15.7079632679, 1e-9);
    EXPECT_NEAR(arc.ComputeSectorArea(), 78.5398163397, 1e-9);
    EXPECT_NEAR(arc.ComputeStartBrg(), 90.0, 1e-9);
    EXPECT_NEAR(arc.ComputeEndBrg(), 180.0, 1e-9);
    EXPECT_NEAR(arc.ComputeChordBrg(), 135.0, 1e-9);
    EXPECT_NEAR(arc.GetBulgeFactor(), 0.4142135624, 1e-9);
    ExpectPointNear(arc.MidPt(), kDiag, kDiag);
    EXPECT_NEAR(arc.MidPt().z, 15.0, 1e-9);  // half way between the end heights

    // The same arc at grid coordinates keeps its figures.
    const UWPoint o(500000.0, 7000000.0);
    const UWArc far(UWPoint(o.x, o.y + 10.0), UWPoint(o.x + 10.0, o.y),
                    UWPoint(o.x + kDiag, o.y + kDiag), UWArc::kThirdOnArc);
    ExpectPointNear(far.ComputeCentre(), o.x, o.y, 1e-6);
    EXPECT_NEAR(far.ComputeArcLength(), 15.7079632679, 1e-6);
}

TEST(UWArc, SenseOfThreePointArcsFollowsThePoints) {
    // The quarter reversed, East to North: leaves heading North (0), arrives heading West (270).
    const UWArc back(UWPoint(10.0, 0.0), UWPoint(0.0, 10.0), UWPoint(kDiag, kDiag),
                     UWArc::kThirdOnArc);
    EXPECT_FALSE(back.IsClockwise());
    EXPECT_NEAR(back.ComputeAngle(), 90.0, 1e-9);
    EXPECT_NEAR(back.ComputeStartBrg(), 0.0, 1e-9);
    EXPECT_NEAR(back.ComputeEndBrg(), 270.0, 1e-9);
    EXPECT_NEAR(back.GetBulgeFactor(), -0.4142135624, 1e-9);

    // North through South to East runs anticlockwise by West: 270 degrees,
    // 10 * 3 pi / 2 = 47.1238898 long, bulge -tan(67.5) = -(sqrt(2) + 1) = -2.4142136.
    const UWArc major(UWPoint(0.0, 10.0), UWPoint(10.0, 0.0), UWPoint(0.0, -10.0),
                      UWArc::kThirdOnArc);
    EXPECT_FALSE(major.IsClockwise());
    EXPECT_NEAR(major.ComputeAngle(), 270.0, 1e-9);
    EXPECT_NEAR(major.ComputeArcLength(), 47.1238898038, 1e-9);
    EXPECT_NEAR(major.GetBulgeFactor(), -2.4142135624, 1e-9);
}

TEST(UWArc, CentreArcTakesItsSenseFromTheSenseBit) {
    const UWPoint north(0.0, 10.0);
    const UWPoint east(10.0, 0.0);
    const UWPoint centre(0.0, 0.0, 3.0);

    const UWArc clockwise(north, east, centre, 0);
    EXPECT_TRUE(clockwise.IsClockwise());
    EXPECT_DOUBLE_EQ(clockwise.ComputeCentre().z, 3.0);
    EXPECT_NEAR(clockwise.ComputeArcLength(), 15.7079632679, 1e-9);

    // The long way round, by West and South: sector 100 * 3 pi / 4 = 235.6194490, leaving
    // North heading West (270), arriving East heading North (0), half way at bearing 225.
    const UWArc anticlockwise(north, east, centre, UWArc::kAnticlockwise);
    EXPECT_FALSE(anticlockwise.IsClockwise());
    EXPECT_NEAR(anticlockwise.ComputeArcLength(), 47.1238898038, 1e-9);
    EXPECT_NEAR(anticlockwise.ComputeSectorArea(), 235.6194490192, 1e-9);
    EXPECT_NEAR(anticlockwise.GetBulgeFactor(), -2.4142135624, 1e-9);
    EXPECT_NEAR(anticlockwise.ComputeStartBrg(), 270.0, 1e-9);
    EXPECT_NEAR(anticlockwise.ComputeEndBrg(), 0.0, 1e-9);
    ExpectPointNear(anticlockwise.MidPt(), -kDiag, -kDiag);
}

TEST(UWArc, OffsetsAlongTheRadius) {
    // Heading East at North on the clockwise quarter: the right is South, towards the centre.
    const UWArc clockwise(UWPoint(0.0, 10.0), UWPoint(10.0, 0.0), UWPoint(kDiag, kDiag),
                          UWArc::kThirdOnArc);
    ExpectPointNear(clockwise.PtOffset(0.0, 2.0), 0.0, 8.0);
    ExpectPointNear(clockwise.PtOffset(0.0, -2.0), 0.0, 12.0);
    // Heading North at East on the anticlockwise one: the right is East, away from the centre.
    const UWArc anticlockwise(UWPoint(10.0, 0.0), UWPoint(0.0, 10.0), UWPoint(kDiag, kDiag),
                              UWArc::kThirdOnArc);
    ExpectPointNear(anticlockwise.PtOffset(0.0, 2.0), 12.0, 0.0);
}

TEST(UWArc, ChainageAndDistanceOfAPoint) {
    const UWArc arc(UWPoint(0.0, 10.0), UWPoint(10.0, 0.0), UWPoint(kDiag, kDiag),
                    UWArc::kThirdOnArc);
    // (20, 20) is on the radius at 45: 10 pi / 4 = 7.8539816 along, sqrt(800) - 10 = 18.2842712
    // off the circle.
    EXPECT_NEAR(UWPoint(20.0, 20.0).DistanceAlong(arc), 7.8539816340, 1e-9);
    EXPECT_NEAR(UWPoint(20.0, 20.0).DistanceTo(arc), 18.2842712475, 1e-9);
    // Bearing 180 is 180 degrees on, short of the middle of the gap (90 + 270 / 2 = 225), so it
    // counts beyond the end: 10 pi = 31.4159265 along, and the end is sqrt(200) = 14.1421356 away.
    EXPECT_NEAR(UWPoint(0.0, -10.0).DistanceAlong(arc), 31.4159265359, 1e-9);
    EXPECT_NEAR(UWPoint(0.0, -10.0).DistanceTo(arc), 14.1421356237, 1e-9);
    // Bearing 300 is 60 degrees before the start: -10 pi / 3 = -10.4719755; the point
    // (-8.660254, 5) is sqrt(75 + 25) = 10 from the start.
    const UWPoint beforeStart(-8.6602540378, 5.0);
    EXPECT_NEAR(beforeStart.DistanceAlong(arc), -10.4719755120, 1e-9);
    EXPECT_NEAR(beforeStart.DistanceTo(arc), 10.0, 1e-9);
    EXPECT_EQ(UWPoint(0.0, 0.0).DistanceAlong(arc), 0.0);
}

TEST(UWArc, DegenerateArcIsItsChord) {
    const UWArc straight(UWPoint(0.0, 0.0), UWPoint(10.0, 0.0), UWPoint(4.0, 0.0),
                         UWArc::kThirdOnArc);
    EXPECT_FALSE(straight.IsValid());
    EXPECT_FALSE(straight.IsClockwise());
    EXPECT_EQ(straight.ComputeRadius(), 0.0);
    EXPECT_EQ(straight.ComputeAngle(), 0.0);
    EXPECT_EQ(straight.GetBulgeFactor(), 0.0);
    EXPECT_DOUBLE_EQ(straight.ComputeArcLength(), 10.0);
    EXPECT_DOUBLE_EQ(straight.ComputeStartBrg(), 90.0);
    ExpectPointNear(straight.MidPt(), 5.0, 0.0);
    ExpectPointNear(straight.PtOffset(2.0, 1.0), 2.0, -1.0);
    EXPECT_DOUBLE_EQ(UWPoint(3.0, 4.0).DistanceTo(straight), 4.0);
    EXPECT_DOUBLE_EQ(UWPoint(13.0, 4.0).DistanceTo(straight), 5.0);  // from the end, 3-4-5

    const UWArc startOnCentre(UWPoint(1.0, 1.0), UWPoint(5.0, 1.0), UWPoint(1.0, 1.0), 0);
    EXPECT_FALSE(startOnCentre.IsValid());
    EXPECT_DOUBLE_EQ(startOnCentre.ComputeArcLength(), 4.0);
}
