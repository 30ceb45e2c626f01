#include <gtest/gtest.h>

#include <cmath>

#include "platform/geometry/CoordinateGeometry.h"

namespace {

struct BearingCase {
    double e1, n1, e2, n2;
    double bearing;
    double distance;
};

class BearingAndDistance : public ::testing::TestWithParam<BearingCase> {};

}  // namespace

// Bearings worked out as atan2(dE, dN) in degrees, brought into [0, 360).
INSTANTIATE_TEST_SUITE_P(
    Quadrants, BearingAndDistance,
    ::testing::Values(BearingCase{0, 0, 0, 10, 0.0, 10.0}, BearingCase{0, 0, 10, 0, 90.0, 10.0},
                      BearingCase{0, 0, 3, -4, 143.13010235415598, 5.0},
                      BearingCase{0, 0, -1, -1, 225.0, std::sqrt(2.0)},
                      BearingCase{0, 0, -10, 0, 270.0, 10.0},
                      BearingCase{0, 0, -3, 4, 323.13010235415595, 5.0},
                      // A northing difference of 1e-5 or less is none: due West, due East.
                      BearingCase{5, 5, 2, 5.000001, 270.0, std::sqrt(9.0 + 1e-12)},
                      BearingCase{5, 5, 5.000001, 5.000009, 90.0, std::hypot(1e-6, 9e-6)},
                      // Just above it the bearing is the true one, though the step is tiny.
                      BearingCase{0, 0, 1e-6, 2e-5, 2.8624052261117474, std::hypot(1e-6, 2e-5)},
                      BearingCase{5, 5, 5, 5, 0.0, 0.0}));

TEST_P(BearingAndDistance, FollowTheFieldProgramsRule) {
    const BearingCase& c = GetParam();
    double bearing = -1.0, distance = -1.0;
    nedit::geo_brgdst(c.e1, c.n1, c.e2, c.n2, &bearing, &distance);
    EXPECT_NEAR(bearing, c.bearing, 1e-10);
    EXPECT_NEAR(distance, c.distance, 1e-12);
    // Away from the special case, the point at that bearing and distance is the far point.
    if (std::fabs(c.n2 - c.n1) > nedit::kCoordinateZero) {
        double e = 0.0, n = 0.0;
        nedit::geo_coord(c.e1, c.n1, bearing, distance, &e, &n);
        EXPECT_NEAR(e, c.e2, 1e-9);
        EXPECT_NEAR(n, c.n2, 1e-9);
    }
}

TEST(CoordinateGeometry, ZeroIsAHundredthOfAMillimetre) {
    EXPECT_EQ(nedit::geo_zero(1e-5), 1);
    EXPECT_EQ(nedit::geo_zero(-1e-5), 1);
    EXPECT_EQ(nedit::geo_zero(-1.1e-5), 0);
    EXPECT_EQ(nedit::geo_zero(0.0), 1);
}
