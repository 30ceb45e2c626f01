// The adjustment rules on positions, against figures worked by hand in
// tests/data/generate_traverse_surveys.py: a loop A, B, C, D back to A that misses its start by
// E -0.012765, N 0.030275, H 0.009782 over 411.771 m.

#include <gtest/gtest.h>

#include <cmath>
#include <vector>

#include "platform/geometry/UAngle.h"
#include "traverse/UWTraverse.h"

namespace {

UWTraverse Loop() {
    UWTraverse loop;
    for (const UWPoint& point : {UWPoint(1000.000000, 2000.000000, 50.000000),
                                 UWPoint(1080.524022, 2060.217965, 51.300000),
                                 UWPoint(1150.304822, 1990.727381, 49.782812),
                                 UWPoint(1070.091090, 1920.420295, 50.582812),
                                 UWPoint(999.987235, 2000.030275, 49.990218)}) {
        loop.Add(point);
    }
    return loop;
}

const UWPoint kStart(1000.0, 2000.0, 50.0);

void ExpectPoints(const UWTraverse& traverse, const std::vector<UWPoint>& expected) {
    ASSERT_EQ(traverse.GetSize(), static_cast<int>(expected.size()));
    for (int i = 0; i < traverse.GetSize(); ++i) {
        const UWPoint& want = expected[static_cast<std::size_t>(i)];
        EXPECT_NEAR(traverse[i].x, want.x, 2e-6) << "East of point " << i;
        EXPECT_NEAR(traverse[i].y, want.y, 2e-6) << "North of point " << i;
        EXPECT_NEAR(traverse[i].z, want.z, 2e-6) << "Height of point " << i;
    }
}

}  // namespace

TEST(UWTraverse, CompassRuleSharesTheMiscloseByLegLength) {
    UWTraverse loop = Loop();
    ASSERT_TRUE(loop.CompassAdjustment(kStart, true));
    ExpectPoints(loop, {{1000.000000, 2000.000000, 50.000000},
                        {1080.527139, 2060.210572, 51.302389},
                        {1150.310992, 1990.712747, 49.787540},
                        {1070.100567, 1920.397819, 50.590074},
                        {1000.000000, 2000.000000, 50.000000}});
}

TEST(UWTraverse, TransitRuleSharesByLatitudesAndDeparturesAndHeightsEvenly) {
    UWTraverse loop = Loop();
    ASSERT_TRUE(loop.TransitAdjustment(kStart, true));
    // Each point after the first rises by a fifth of the height misclose, so the last one
    // ends four fifths of it short.
    ExpectPoints(loop, {{1000.000000, 2000.000000, 50.000000},
                        {1080.527442, 2060.211445, 51.301956},
                        {1150.311204, 1990.713337, 49.784768},
                        {1070.100878, 1920.398639, 50.584768},
                        {1000.000000, 2000.000000, 49.992174}});
}

TEST(UWTraverse, HeightsStayWithoutAskingOrWithoutAHeight) {
    for (const bool transit : {false, true}) {
        UWTraverse loop = Loop();
        transit ? loop.TransitAdjustment(kStart, false) : loop.CompassAdjustment(kStart, false);
        EXPECT_DOUBLE_EQ(loop[2].z, 49.782812);
        EXPECT_DOUBLE_EQ(loop[4].z, 49.990218);
        // A point without a height keeps none; an end without one gives no height misclose.
        UWTraverse unheighted = Loop();
        unheighted[2].z = UWPoint::kNoHeight;
        const UWPoint plan_fix(1000.0, 2000.0, UWPoint::kNoHeight);
        transit ? unheighted.TransitAdjustment(plan_fix, true)
                : unheighted.CompassAdjustment(plan_fix, true);
        EXPECT_EQ(unheighted[2].z, UWPoint::kNoHeight);
        EXPECT_DOUBLE_EQ(unheighted[3].z, 50.582812);
        EXPECT_DOUBLE_EQ(unheighted[4].x, 1000.0);
    }
}

TEST(UWTraverse, TwoPointsMoveTheEndOntoTheFixedPoint) {
    UWTraverse leg;
    leg.Add(UWPoint(0.0, 0.0, 10.0));
    leg.Add(UWPoint(3.0, 4.0, 11.0));
    ASSERT_TRUE(leg.CompassAdjustment(UWPoint(3.1, 4.2, 11.5), true));
    EXPECT_DOUBLE_EQ(leg[0].x, 0.0);
    EXPECT_NEAR(leg[1].x, 3.1, 1e-12);
    EXPECT_NEAR(leg[1].y, 4.2, 1e-12);
    EXPECT_NEAR(leg[1].z, 11.5, 1e-12);
}

TEST(UWTraverse, AngleAdjustmentTurnsEachLegByOneShareMore) {
    // North 100 m, then East 100 m, the start sighting back due South; three points share a
    // correction of 3 degrees: the first leg turns by 1, the second by 2.
    UWTraverse traverse;
    traverse.Add(UWPoint(0.0, 0.0, 5.0));
    traverse.Add(UWPoint(0.0, 100.0, 7.0));
    traverse.Add(UWPoint(100.0, 100.0, 9.0));
    ASSERT_TRUE(traverse.AngleAdjustment(3.0, 180.0));
    const double rad = kRadiansPerDegree;
    const double e1 = 100.0 * std::sin(1.0 * rad), n1 = 100.0 * std::cos(1.0 * rad);
    ExpectPoints(traverse,
                 {{0.0, 0.0, 5.0},
                  {e1, n1, 5.0},
                  {e1 + 100.0 * std::sin(92.0 * rad), n1 + 100.0 * std::cos(92.0 * rad), 5.0}});
}

TEST(UWTraverse, DegenerateTraversesAreRefusedUnchanged) {
    UWTraverse empty;
    EXPECT_FALSE(empty.AngleAdjustment(1.0, 0.0));
    EXPECT_FALSE(empty.CompassAdjustment(kStart, true));
    EXPECT_FALSE(empty.TransitAdjustment(kStart, true));

    UWTraverse loop = Loop();
    EXPECT_FALSE(loop.AngleAdjustment(0.0, 0.0));
    // A zero-length traverse has nothing to share the misclose by.
    UWTraverse stacked;
    stacked.Add(UWPoint(5.0, 5.0, 1.0));
    stacked.Add(UWPoint(5.0, 5.0, 1.0));
    EXPECT_FALSE(stacked.CompassAdjustment(UWPoint(6.0, 6.0, 1.0), true));
    EXPECT_FALSE(stacked.TransitAdjustment(UWPoint(6.0, 6.0, 1.0), true));
    EXPECT_DOUBLE_EQ(stacked[1].x, 5.0);
    EXPECT_DOUBLE_EQ(stacked[1].y, 5.0);
}

TEST(UWTraverse, TransitDueNorthCorrectsTheNorthingOnly) {
    UWTraverse north;
    north.Add(UWPoint(0.0, 0.0, 0.0));
    north.Add(UWPoint(0.0, 50.0, 0.0));
    north.Add(UWPoint(0.0, 100.0, 0.0));
    ASSERT_TRUE(north.TransitAdjustment(UWPoint(0.2, 100.1, 0.0), false));
    EXPECT_DOUBLE_EQ(north[2].x, 0.0);
    EXPECT_NEAR(north[1].y, 50.05, 1e-12);
    EXPECT_NEAR(north[2].y, 100.1, 1e-12);
}
