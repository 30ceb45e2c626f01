#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "platform/geometry/UAngle.h"
#include "platform/geometry/UWPoint.h"

namespace {

struct TurnCase {
    double degrees;
    double expected;
};

class ValidateData : public ::testing::TestWithParam<TurnCase> {};

}  // namespace

INSTANTIATE_TEST_SUITE_P(Angles, ValidateData,
                         ::testing::Values(TurnCase{-90.0, 270.0}, TurnCase{360.0, 0.0},
                                           TurnCase{725.0, 5.0},  // two turns and 5
                                           TurnCase{-720.0, 0.0}, TurnCase{359.5, 359.5},
                                           TurnCase{0.0, 0.0},
                                           // -1e-15 + 360 rounds to 360.0 itself; the answer must
                                           // still lie below one turn.
                                           TurnCase{-1e-15, 0.0}));

TEST_P(ValidateData, BringsDegreesIntoOneTurn) {
    EXPECT_DOUBLE_EQ(UAngle::ValidateData(GetParam().degrees), GetParam().expected);
}

TEST(UAngle, ValidateDataHasNoTurnForWhatIsNoNumber) {
    EXPECT_TRUE(std::isnan(UAngle::ValidateData(std::numeric_limits<double>::quiet_NaN())));
    EXPECT_TRUE(std::isnan(UAngle::ValidateData(std::numeric_limits<double>::infinity())));
}

TEST(UAngle, AngleAtAVertexIsPositiveClockwise) {
    const UWPoint vertex(100.0, 100.0);
    const UWPoint north(100.0, 110.0);
    const UWPoint east(110.0, 100.0);
    const UWPoint south(100.0, 90.0);
    const UWPoint west(90.0, 100.0);
    const UWPoint northEast(110.0, 110.0);

    EXPECT_NEAR(UAngle(north, vertex, east).Degrees(), 90.0, 1e-12);
    EXPECT_NEAR(UAngle(east, vertex, north).Degrees(), -90.0, 1e-12);
    EXPECT_NEAR(UAngle(north, vertex, west).Degrees(), -90.0, 1e-12);
    EXPECT_NEAR(UAngle(northEast, vertex, north).Degrees(), -45.0, 1e-12);
    // A half turn is +180 from either side, never -180.
    EXPECT_NEAR(UAngle(north, vertex, south).Degrees(), 180.0, 1e-12);
    EXPECT_NEAR(UAngle(south, vertex, north).Degrees(), 180.0, 1e-12);
    // A ray of no length has no direction.
    EXPECT_EQ(UAngle(vertex, vertex, east).Degrees(), 0.0);

    // 90 degrees is pi / 2 = 1.5707963 radians.
    EXPECT_NEAR(UAngle(90.0).Radians(), 1.5707963268, 1e-10);
}
