#include <gtest/gtest.h>

#include "platform/units/Units.h"

using namespace nedit;

TEST(Units, SexagesimalAnglesBothWays) {
    // 123°45'30" = 123 + 45/60 + 30/3600 = 123.758333...
    EXPECT_NEAR(DmsToDegrees(123.4530), 123.7583333333, 1e-9);
    EXPECT_NEAR(DmsToDegrees(-0.3000), -0.5, 1e-12);
    EXPECT_NEAR(DmsToDegrees(358.06239), 358.0 + 6.0 / 60 + 23.9 / 3600, 1e-9);
    EXPECT_NEAR(DmsToDegrees(0.0001), 1.0 / 3600, 1e-12);
    EXPECT_NEAR(DegreesToDms(123.7583333333333), 123.4530, 1e-10);
    EXPECT_NEAR(DegreesToDms(-0.5), -0.3, 1e-12);
    // 359°59'59.99999999" rounds into the full turn rather than showing 60 seconds.
    EXPECT_NEAR(DegreesToDms(360.0 - 1e-11), 360.0, 1e-12);
    EXPECT_NEAR(DegreesToDms(10.0 + 59.0 / 60 + 59.99999999 / 3600), 11.0, 1e-12);
}

TEST(Units, GonsAndDecimalDegrees) {
    EXPECT_DOUBLE_EQ(ToDegrees(100.0, AngleUnit::Gons), 90.0);
    EXPECT_DOUBLE_EQ(ToDegrees(400.0, AngleUnit::Gons), 360.0);
    EXPECT_DOUBLE_EQ(FromDegrees(180.0, AngleUnit::Gons), 200.0);
    EXPECT_DOUBLE_EQ(ToDegrees(12.5, AngleUnit::Degrees), 12.5);
    EXPECT_NEAR(ToDegrees(90.3000, AngleUnit::DegMinSec), 90.5, 1e-12);
}

TEST(Units, LengthsAndLetters) {
    EXPECT_NEAR(ConvertLength(100.0, LengthUnit::Feet, LengthUnit::Metres), 30.48, 1e-12);
    // The US survey foot is 1200/3937 m = 0.3048006096... m.
    EXPECT_NEAR(ConvertLength(1000.0, LengthUnit::USFeet, LengthUnit::Metres), 304.8006096012,
                1e-9);
    EXPECT_NEAR(ConvertLength(30.48, LengthUnit::Metres, LengthUnit::Feet), 100.0, 1e-12);
    EXPECT_EQ(LengthUnitFromLetter(L'1'), LengthUnit::Feet);
    EXPECT_EQ(LengthUnitFromLetter(L'U'), LengthUnit::USFeet);
    EXPECT_EQ(LengthUnitFromLetter(L'X'), LengthUnit::Metres);
    EXPECT_EQ(AngleUnitFromLetter(L'2'), AngleUnit::Gons);
    EXPECT_EQ(AngleUnitFromLetter(L'd'), AngleUnit::Degrees);
    EXPECT_EQ(AngleUnitFromLetter(L'S'), AngleUnit::DegMinSec);
    EXPECT_EQ(LetterOf(AngleUnit::Gons), L'G');
    EXPECT_EQ(LetterOf(LengthUnit::USFeet), L'U');
}
