#include <gtest/gtest.h>

#include <cmath>

#include "exports/BulgeArc.h"

namespace nedit {
namespace {

constexpr double kPi = 3.14159265358979323846;

// Each arc worked by hand: the bulge is tan(sweep / 4), positive clockwise.
struct ArcCase {
    const char* name;
    UWPoint from;
    UWPoint to;
    double bulge;
    UWPoint centre;
    double radius;
    double sweepDegrees;
    UWPoint middle;  // the point half way along
};

// A case prints as its name, so that the names of the tests do not carry its bytes.
void PrintTo(const ArcCase& arc, std::ostream* out) {
    *out << arc.name;
}

class BulgeArcCases : public ::testing::TestWithParam<ArcCase> {};

TEST_P(BulgeArcCases, CentreRadiusSweepAndMiddle) {
    const ArcCase& c = GetParam();
    const BulgeArc arc(c.from, c.to, c.bulge);
    ASSERT_TRUE(arc.IsArc());
    EXPECT_NEAR(arc.Centre().x, c.centre.x, 1e-9);
    EXPECT_NEAR(arc.Centre().y, c.centre.y, 1e-9);
    EXPECT_NEAR(arc.Radius(), c.radius, 1e-9);
    EXPECT_NEAR(arc.Sweep() * 180.0 / kPi, c.sweepDegrees, 1e-9);
    const UWPoint middle = arc.PointAt(0.5);
    EXPECT_NEAR(middle.x, c.middle.x, 1e-9);
    EXPECT_NEAR(middle.y, c.middle.y, 1e-9);
    const UWPoint end = arc.PointAt(1.0);
    EXPECT_NEAR(end.x, c.to.x, 1e-9);
    EXPECT_NEAR(end.y, c.to.y, 1e-9);
}

const double kHalfRoot2 = std::sqrt(0.5) * 10.0;

INSTANTIATE_TEST_SUITE_P(ByHand, BulgeArcCases,
                         ::testing::Values(ArcCase{"QuarterClockwiseNorthToEast",
                                                   {0, 10},
                                                   {10, 0},
                                                   0.41421356237309503,
                                                   {0, 0},
                                                   10,
                                                   90,
                                                   {kHalfRoot2, kHalfRoot2}},
                                           ArcCase{"HalfAnticlockwiseBulgingEast",
                                                   {1010, 2000},
                                                   {1010, 2010},
                                                   -1.0,
                                                   {1010, 2005},
                                                   5,
                                                   180,
                                                   {1015, 2005}},
                                           ArcCase{"ThreeQuartersClockwiseThroughSouthWest",
                                                   {10, 0},
                                                   {0, 10},
                                                   2.414213562373095,
                                                   {0, 0},
                                                   10,
                                                   270,
                                                   {-kHalfRoot2, -kHalfRoot2}},
                                           ArcCase{"SixtyDegreesAnticlockwise",
                                                   {10, 0},
                                                   {5, 8.660254037844387},
                                                   -0.2679491924311227,
                                                   {0, 0},
                                                   10,
                                                   60,
                                                   {8.660254037844387, 5}}),
                         [](const auto& test) { return std::string(test.param.name); });

TEST(BulgeArc, AStraightLegIsNoArcAndDensifiesToItsEnd) {
    const BulgeArc leg(UWPoint(0, 0), UWPoint(3, 4), 0.0);
    EXPECT_FALSE(leg.IsArc());
    const auto points = leg.Densify(0.001);
    ASSERT_EQ(points.size(), 1u);
    EXPECT_EQ(points[0].x, 3.0);
    EXPECT_FALSE(BulgeArc(UWPoint(1, 1), UWPoint(1, 1), 0.5).IsArc());
}

// Chord counts: 2 acos(1 - tol / r) is the widest chord within the tolerance.
TEST(BulgeArc, DensifiedChordsKeepWithinTheTolerance) {
    const BulgeArc quarter(UWPoint(0, 10, 5), UWPoint(10, 0, 7), 0.41421356237309503);
    const auto points = quarter.Densify(0.001);
    ASSERT_EQ(points.size(), 56u);
    UWPoint previous(0, 10, 5);
    for (const UWPoint& p : points) {
        EXPECT_NEAR(std::hypot(p.x, p.y), 10.0, 1e-9);
        const double mx = (p.x + previous.x) / 2.0;
        const double my = (p.y + previous.y) / 2.0;
        EXPECT_LE(10.0 - std::hypot(mx, my), 0.001);
        previous = p;
    }
    EXPECT_EQ(points.back().x, 10.0);
    EXPECT_NEAR(points[27].z, 5.0 + 2.0 * 28.0 / 56.0, 1e-9);  // heights blend along the arc
    EXPECT_EQ(ChordsFor(kPi / 2.0, 1000.0, 0.001), 556);
    EXPECT_EQ(ChordsFor(kPi / 2.0, 0.0005, 0.001), 4);  // never wider than 22.5 degrees
}

TEST(BulgeArc, CircleRingIsClosedAndRunsAnticlockwiseFromEast) {
    const auto ring = CircleRing(UWPoint(1010, 2010), 2.5, 0.001);
    ASSERT_EQ(ring.size(), 113u);
    EXPECT_EQ(ring.front().x, 1012.5);
    EXPECT_EQ(ring.front().x, ring.back().x);
    EXPECT_EQ(ring.front().y, ring.back().y);
    EXPECT_GT(ring[1].y, 2010.0);
}

}  // namespace
}  // namespace nedit
