#include <gtest/gtest.h>

#include <cmath>
#include <initializer_list>
#include <stdexcept>

#include "platform/geometry/UW3DPolyline.h"
#include "platform/geometry/UWPolygon.h"
#include "platform/geometry/UWPolyline.h"

namespace {

template <typename Figure>
Figure Make(std::initializer_list<UWPoint> points) {
    Figure figure;
    for (const UWPoint& point : points) {
        figure.Add(point);
    }
    return figure;
}

}  // namespace

TEST(UWPolyline, AreaOfARectangleEitherWayRound) {
    // 30 by 40 = 1200, walked North first (clockwise), then the other way round.
    const auto clockwise = Make<UWPolyline>({UWPoint(1000.0, 2000.0), UWPoint(1000.0, 2040.0),
                                             UWPoint(1030.0, 2040.0), UWPoint(1030.0, 2000.0)});
    EXPECT_DOUBLE_EQ(clockwise.SignedArea(), 1200.0);
    EXPECT_DOUBLE_EQ(clockwise.Area(), 1200.0);
    const auto anticlockwise = Make<UWPolyline>({UWPoint(1030.0, 2000.0), UWPoint(1030.0, 2040.0),
                                                 UWPoint(1000.0, 2040.0), UWPoint(1000.0, 2000.0)});
    EXPECT_DOUBLE_EQ(anticlockwise.SignedArea(), -1200.0);
    EXPECT_DOUBLE_EQ(anticlockwise.Area(), 1200.0);

    // The same at grid coordinates loses nothing to the size of the numbers.
    const auto far =
        Make<UWPolyline>({UWPoint(512345.678, 7012345.678), UWPoint(512345.678, 7012385.678),
                          UWPoint(512375.678, 7012385.678), UWPoint(512375.678, 7012345.678)});
    EXPECT_NEAR(far.Area(), 1200.0, 1e-6);
    EXPECT_EQ(Make<UWPolyline>({UWPoint(0.0, 0.0), UWPoint(4.0, 0.0)}).Area(), 0.0);
}

TEST(UWPolyline, ArrayOperationsAndPlaneLength) {
    UWPolyline line;
    EXPECT_EQ(line.Add(UWPoint(0.0, 0.0)), 0);
    EXPECT_EQ(line.Add(UWPoint(3.0, 4.0)), 1);
    EXPECT_EQ(line.Add(UWPoint(3.0, 9.0)), 2);
    EXPECT_DOUBLE_EQ(line.PlaneLength(), 10.0);  // 5 + 5, not closed back to the start
    line.SetAt(2, UWPoint(3.0, 10.0));
    line[1].x = 0.0;
    // (0, 0), (0, 4), (3, 10): 4, then sqrt(9 + 36) = 6.7082039.
    EXPECT_NEAR(line.PlaneLength(), 10.7082039325, 1e-9);
    EXPECT_THROW(line.GetAt(3), std::out_of_range);
}

TEST(UW3DPolyline, LengthIsInPlanUnlessSlopeIsAskedFor) {
    // Legs of 5 in plan rising 12 (slope 13), then 6 in plan to a point without a height.
    const auto route = Make<UW3DPolyline>(
        {UWPoint(0.0, 0.0, 0.0), UWPoint(3.0, 4.0, 12.0), UWPoint(3.0, 10.0, UWPoint::kNoHeight)});
    EXPECT_DOUBLE_EQ(route.Length(), 11.0);
    EXPECT_DOUBLE_EQ(route.Length(true), 19.0);
}

TEST(UWPolygon, CrossingAndTouchingOutlines) {
    auto square = Make<UWPolygon>(
        {UWPoint(0.0, 0.0), UWPoint(0.0, 10.0), UWPoint(10.0, 10.0), UWPoint(10.0, 0.0)});
    EXPECT_FALSE(square.IsSelfIntersecting());
    square.Add(UWPoint(0.0, 0.0));  // a closing point that repeats the first adds no side
    EXPECT_FALSE(square.IsSelfIntersecting());
    EXPECT_DOUBLE_EQ(square.Area(), 100.0);

    // An L of a 20 m square less a 10 m corner: 400 - 100 = 300, and no crossing.
    const auto concave =
        Make<UWPolygon>({UWPoint(0.0, 0.0), UWPoint(0.0, 20.0), UWPoint(10.0, 20.0),
                         UWPoint(10.0, 10.0), UWPoint(20.0, 10.0), UWPoint(20.0, 0.0)});
    EXPECT_FALSE(concave.IsSelfIntersecting());
    EXPECT_DOUBLE_EQ(concave.Area(), 300.0);

    EXPECT_TRUE(Make<UWPolygon>({UWPoint(0.0, 0.0), UWPoint(10.0, 10.0), UWPoint(10.0, 0.0),
                                 UWPoint(0.0, 10.0)})
                    .IsSelfIntersecting());
    // The same bow-tie started at another corner: now the closing side does the crossing.
    EXPECT_TRUE(Make<UWPolygon>({UWPoint(0.0, 10.0), UWPoint(0.0, 0.0), UWPoint(10.0, 10.0),
                                 UWPoint(10.0, 0.0)})
                    .IsSelfIntersecting());
    // A corner resting on a side that is not its neighbour.
    EXPECT_TRUE(Make<UWPolygon>({UWPoint(0.0, 0.0), UWPoint(0.0, 10.0), UWPoint(10.0, 10.0),
                                 UWPoint(10.0, 0.0), UWPoint(5.0, 10.0)})
                    .IsSelfIntersecting());
    // A flat triangle has only neighbouring sides, and its outline runs back over itself.
    EXPECT_TRUE(Make<UWPolygon>({UWPoint(0.0, 0.0), UWPoint(10.0, 0.0), UWPoint(4.0, 0.0)})
                    .IsSelfIntersecting());
    // Two distinct corners make no figure.
    EXPECT_FALSE(Make<UWPolygon>({UWPoint(0.0, 0.0), UWPoint(4.0, 0.0), UWPoint(4.0, 0.0)})
                     .IsSelfIntersecting());
}

TEST(UWPolygon, ALongOutlineCrossesItselfOnlyWhereItDoes) {
    // A traverse of 5,000 stations on a circle, as a loop closes: no crossing, and then one
    // corner moved across the far side of the figure.
    constexpr int kCorners = 5000;
    UWPolygon circle;
    for (int i = 0; i < kCorners; ++i) {
        const double theta = 2.0 * 3.14159265358979323846 * i / kCorners;
        circle.Add(UWPoint(1000.0 * std::sin(theta), 1000.0 * std::cos(theta)));
    }
    EXPECT_FALSE(circle.IsSelfIntersecting());
    UWPolygon crossed = circle;
    crossed.SetAt(1200, UWPoint(-1200.0, 0.0));  // beyond the western side
    EXPECT_TRUE(crossed.IsSelfIntersecting());
}
