#include <gtest/gtest.h>

#include "platform/format/UFormatAngle.h"
#include "platform/text/Format.h"

namespace {

// The angle as the callers hand it over: decimal degrees written by "%f".
std::wstring Show(int type, int decimals, double degrees) {
    return UFormatAngle(type, decimals, 0).ConvertToDisplayString(nedit::Format(L"%f", degrees));
}

}  // namespace

TEST(UFormatAngle, SexagesimalRoundsAndCarries) {
    // 123.758333° * 3600 = 445529.9988" -> 445530" = 123°45'30".
    EXPECT_EQ(Show(0, 4, 123.758333), L"123.4530");
    // 10.99999° = 39599.964" -> 39600" = 11°00'00": the seconds carry through the minutes.
    EXPECT_EQ(Show(0, 4, 10.99999), L"11.0000");
    // 359.999999° = 1295999.9964" -> 1296000": a full turn, not brought back to 0.
    EXPECT_EQ(Show(0, 4, 359.999999), L"360.0000");
    EXPECT_EQ(Show(0, 4, -10.5), L"-10.3000");
    // 0.000001° = 0.0036" and -0.00001° = -0.036" both show as zero, without a sign.
    EXPECT_EQ(Show(0, 4, 0.000001), L"0.0000");
    EXPECT_EQ(Show(0, 4, -0.00001), L"0.0000");
    // 0.0001° = 0.36": tenths 3.6 -> 0.4", hundredths 0.36".
    EXPECT_EQ(Show(0, 5, 0.0001), L"0.00004");
    EXPECT_EQ(Show(0, 6, 0.0001), L"0.000036");
    // Whole minutes: 10.508° = 10°30.48' -> 10°30'; 10.995° = 10°59.7' -> 11°00'.
    EXPECT_EQ(Show(0, 2, 10.508), L"10.30");
    EXPECT_EQ(Show(0, 2, 10.995), L"11.00");
    EXPECT_EQ(Show(0, 0, 10.6), L"11");
    // An unknown type is sexagesimal; text without a number is 0.
    EXPECT_EQ(Show(7, 4, 45.5), L"45.3000");
    EXPECT_EQ(UFormatAngle(0, 4, 0).ConvertToDisplayString(L"north"), L"0.0000");
}

TEST(UFormatAngle, DecimalDegreesAndGons) {
    EXPECT_EQ(Show(1, 4, 123.758333), L"123.7583");
    EXPECT_EQ(Show(1, 4, 359.99999), L"360.0000");
    EXPECT_EQ(Show(1, 4, -0.00001), L"0.0000");
    EXPECT_EQ(Show(1, 2, -12.345), L"-12.35");  // -12.345000000000001 as a double
    // 123.758333° * 400/360 = 137.5092589 gon.
    EXPECT_EQ(Show(2, 4, 123.758333), L"137.5093");
    EXPECT_EQ(Show(2, 4, 90.0), L"100.0000");
    EXPECT_EQ(Show(2, 3, -45.0), L"-50.000");
}
