#include <gtest/gtest.h>

#include <cmath>

#include "transfer/ArcPieces.h"

using nedit::ReversedArc;
using nedit::SplitArcAt;

namespace {

// tan(90 / 4 degrees) = sqrt(2) - 1: the bulge of a quarter circle.
const double kQuarter = std::sqrt(2.0) - 1.0;

}  // namespace

// A half circle from (0,0) over (5,5) to (10,0) runs clockwise about (5,0): each half of it is
// a quarter circle, bulge +(sqrt 2 - 1); split at its top, the two parts meet there.
TEST(ArcPieces, HalfCircleSplitsIntoTwoClockwiseQuarters) {
    const UWArc half(UWPoint(0, 0), UWPoint(10, 0), UWPoint(5, 5), UWArc::kThirdOnArc);
    EXPECT_NEAR(half.GetBulgeFactor(), 1.0, 1e-12);  // tan(180 / 4)
    UWArc first;
    UWArc second;
    ASSERT_TRUE(SplitArcAt(half, UWPoint(5, 5), first, second));
    EXPECT_NEAR(first.GetBulgeFactor(), kQuarter, 1e-12);
    EXPECT_NEAR(second.GetBulgeFactor(), kQuarter, 1e-12);
    EXPECT_NEAR(first.GetEnd().x, 5.0, 1e-12);
    EXPECT_NEAR(second.GetStart().y, 5.0, 1e-12);
    // Each part passes through the point 45 degrees round: (5 - 5 cos 45, 5 sin 45).
    EXPECT_NEAR(first.GetThird().x, 5.0 - 5.0 * std::sqrt(0.5), 1e-9);
    EXPECT_NEAR(first.GetThird().y, 5.0 * std::sqrt(0.5), 1e-9);
    EXPECT_NEAR(second.GetThird().x, 5.0 + 5.0 * std::sqrt(0.5), 1e-9);
}

// A point off the arc's sweep, and the arc's own ends, as the rule reads them: an end gives
// a part of no length, a point beyond an end is refused.
TEST(ArcPieces, PointBeyondTheSweepIsRefusedAndAnEndIsAccepted) {
    const UWArc quarter(UWPoint(10, 0), UWPoint(20, 10), UWPoint(10, 10), UWArc::kAnticlockwise);
    UWArc first;
    UWArc second;
    EXPECT_FALSE(SplitArcAt(quarter, UWPoint(0, 10), first, second));   // the far side
    EXPECT_FALSE(SplitArcAt(quarter, UWPoint(10, 20), first, second));  // beyond the end
    EXPECT_TRUE(SplitArcAt(quarter, UWPoint(20, 10), first, second));
    EXPECT_NEAR(second.GetBulgeFactor(), 0.0, 1e-9);
}

// Turned round, an anticlockwise quarter runs clockwise: the same bulge, the other sign.
TEST(ArcPieces, ReversedArcKeepsItsSizeAndTurnsItsSense) {
    const UWArc quarter(UWPoint(10, 0), UWPoint(20, 10), UWPoint(10, 10), UWArc::kAnticlockwise);
    EXPECT_NEAR(quarter.GetBulgeFactor(), -kQuarter, 1e-12);
    const UWArc back = ReversedArc(quarter);
    EXPECT_NEAR(back.GetStart().x, 20.0, 1e-12);
    EXPECT_NEAR(back.GetEnd().x, 10.0, 1e-12);
    EXPECT_NEAR(back.GetBulgeFactor(), kQuarter, 1e-9);
}
