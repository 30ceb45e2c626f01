#include <gtest/gtest.h>

#include <limits>

#include "platform/geometry/UWRect.h"

TEST(UWRect, GrowsFromEmptyByPoints) {
    UWRect rect;
    EXPECT_TRUE(rect.IsEmpty());
    EXPECT_EQ(rect.Width(), 0.0);
    EXPECT_FALSE(rect.Contains(UWPoint(0.0, 0.0)));

    rect.Extend(UWPoint(3.0, 4.0));
    EXPECT_FALSE(rect.IsEmpty());  // a single point is not nothing
    EXPECT_TRUE(rect.Contains(UWPoint(3.0, 4.0)));

    rect.Extend(UWPoint(-1.0, 10.0));
    rect.Extend(UWPoint(std::numeric_limits<double>::quiet_NaN(), 1000.0));  // ignored
    EXPECT_DOUBLE_EQ(rect.Width(), 4.0);
    EXPECT_DOUBLE_EQ(rect.Height(), 6.0);
    EXPECT_TRUE(rect.Contains(UWPoint(-1.0, 4.0)));  // on the border
    EXPECT_FALSE(rect.Contains(UWPoint(3.001, 4.0)));
    EXPECT_FALSE(rect.Contains(UWPoint(1.0, 3.999)));

    // Corners may come in any order.
    const UWRect given(100.0, 100.0, 0.0, 0.0);
    EXPECT_DOUBLE_EQ(given.GetMinX(), 0.0);
    EXPECT_DOUBLE_EQ(given.GetMaxY(), 100.0);
    EXPECT_DOUBLE_EQ(given.Width(), 100.0);
}
