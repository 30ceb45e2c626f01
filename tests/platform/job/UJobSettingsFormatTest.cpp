#include <gtest/gtest.h>

#include "platform/job/UJobSettings.h"

using nedit::AngleUnit;
using nedit::LengthUnit;

namespace {

UJobSettings InFeetAndInches(LengthUnit unit, int denominator) {
    UJobSettings job;
    job.SetLengthUnit(unit);
    job.SetFootFormat(UJobSettings::kFeetAndInches);
    job.SetFootInchPrecision(denominator);
    return job;
}

std::wstring Angle(const UJobSettings& job, double degrees) {
    std::wstring text = L"left over";
    ConvertAngleToDisplay(job, degrees, text, 0);
    return text;
}

}  // namespace

TEST(UJobSettingsFormat, DecimalLengthsInTheJobsUnit) {
    UJobSettings job;
    // The report's calls: three decimals, the job's unit, no unit mark.
    EXPECT_EQ(job.LengthToString(-1.23456, false, false, 3, -1, true, false), L"-1.235");
    EXPECT_EQ(job.DistanceToString(35.2144, false, false, 3, -1, false, false), L"35.214");
    EXPECT_EQ(job.UnitLengthToString(0.0, false, false, 3, -1, false), L"0.000");
    // A difference that shows as zero has no sign.
    EXPECT_EQ(job.LengthToString(-0.0004, false, false, 3, -1, true, false), L"0.000");
    EXPECT_EQ(job.LengthToString(0.5, false, true, 3, -1, true, false), L"+0.500");
    EXPECT_EQ(job.LengthToString(-0.5, false, true, 3, -1, true, false), L"-0.500");
    EXPECT_EQ(job.LengthToString(12.3456, true, false, 3, -1, false, false), L"12.346 m");
    job.SetLengthDecimals(2);
    EXPECT_EQ(job.LengthToString(12.3456, false, false, -1, -1, false, false), L"12.35");
    // Lengths are already in the job's unit: no conversion happens in the formatting.
    job.SetLengthUnit(LengthUnit::Feet);
    EXPECT_EQ(job.DistanceToString(100.0, true, false, 3, -1, false, false), L"100.000 ft");
    job.SetLengthUnit(LengthUnit::USFeet);
    EXPECT_EQ(job.UnitLengthToString(100.0, true, false, 1, -1, false), L"100.0 usft");
    // Feet and inches apply to a foot unit only.
    UJobSettings metres = InFeetAndInches(LengthUnit::Metres, 16);
    EXPECT_EQ(metres.LengthToString(10.5, false, false, 3, -1, false, false), L"10.500");
}

TEST(UJobSettingsFormat, FeetAndInches) {
    const UJobSettings sixteenths = InFeetAndInches(LengthUnit::Feet, 16);
    auto show = [&](double feet) {
        return sixteenths.LengthToString(feet, false, false, 3, -1, false, false);
    };
    // 10.5 ft * 192 sixteenths/ft = 2016 = 10 ft + 96/16 in.
    EXPECT_EQ(show(10.5), L"10' 6\"");
    // 3.2604 ft * 192 = 625.9968 -> 626 = 3 ft + 50/16 in = 3 ft 3 2/16 in.
    EXPECT_EQ(show(3.2604), L"3' 3 1/8\"");
    EXPECT_EQ(show(-3.2604), L"-3' 3 1/8\"");
    // 2.276 ft * 192 = 436.992 -> 437 = 2 ft + 53/16 in.
    EXPECT_EQ(show(2.276), L"2' 3 5/16\"");
    // 4.999 ft * 192 = 959.808 -> 960: 11.988 in carry into the next foot.
    EXPECT_EQ(show(4.999), L"5' 0\"");
    // 0.0104 ft * 192 = 1.9968 -> 2/16 in; -0.001 ft * 192 = -0.192 -> nothing, no sign.
    EXPECT_EQ(show(0.0104), L"0' 0 1/8\"");
    EXPECT_EQ(show(-0.001), L"0' 0\"");
    // Decimals and the unit flag change nothing; the inch fraction can be given.
    EXPECT_EQ(sixteenths.DistanceToString(10.5, true, false, 1, -1, false, false), L"10' 6\"");
    // 2.276 ft * 96 eighths/ft = 218.496 -> 218 = 2 ft + 26/8 in.
    EXPECT_EQ(sixteenths.LengthToString(2.276, false, false, 3, 8, false, false), L"2' 3 1/4\"");
    EXPECT_EQ(
        InFeetAndInches(LengthUnit::Feet, 8).UnitLengthToString(2.276, false, false, 3, -1, false),
        L"2' 3 1/4\"");
    EXPECT_EQ(InFeetAndInches(LengthUnit::USFeet, 16)
                  .LengthToString(10.5, false, true, 3, -1, false, false),
              L"+10' 6\"");
}

TEST(UJobSettingsFormat, ConvertLengthIntoTheJobsUnit) {
    UJobSettings job;
    job.SetLengthUnit(LengthUnit::Feet);
    EXPECT_NEAR(job.ConvertLength(LengthUnit::Metres, 30.48), 100.0, 1e-12);
    EXPECT_DOUBLE_EQ(job.ConvertLength(LengthUnit::Feet, -12.5), -12.5);
    job.SetLengthUnit(LengthUnit::Metres);
    // 3937 US ft * 1200/3937 m = 1200 m.
    EXPECT_NEAR(job.ConvertLength(LengthUnit::USFeet, 3937.0), 1200.0, 1e-9);
    // The report's route for a length in feet and inches: convert, then a fresh settings
    // object in feet with the foot format copied; 30.48 m = 100 ft exactly.
    const UJobSettings feet = InFeetAndInches(LengthUnit::Feet, 8);
    EXPECT_EQ(feet.UnitLengthToString(feet.ConvertLength(LengthUnit::Metres, 30.48), false, false,
                                      -1, -1, false),
              L"100' 0\"");
}

TEST(UJobSettingsFormat, AnglesInTheJobsDisplay) {
    UJobSettings job;
    // 123.758333° = 123°45'29.9988" -> 123°45'30".
    EXPECT_EQ(Angle(job, 123.758333), L"123.4530");
    EXPECT_EQ(Angle(job, -10.5), L"-10.3000");
    job.SetAngleFormat(UJobSettings::kAngleMarked);
    EXPECT_EQ(Angle(job, 123.758333), L"123\u00B045'30\"");
    EXPECT_EQ(Angle(job, -10.5), L"-10\u00B030'00\"");
    // Marks need seconds: at 2 decimals 10.508° = 10°30'28.8" still shows whole seconds.
    job.SetAngleDecimals(2);
    EXPECT_EQ(Angle(job, 10.508), L"10\u00B030'29\"");
    // 0.0001° = 0.36".
    job.SetAngleDecimals(6);
    EXPECT_EQ(Angle(job, 0.0001), L"0\u00B000'00.36\"");

    job.SetAngleDecimals(4);
    job.SetAngleUnit(AngleUnit::Degrees);
    EXPECT_EQ(Angle(job, 123.758333), L"123.7583\u00B0");
    job.SetAngleUnit(AngleUnit::Gons);
    job.SetAngleDecimals(3);
    // 123.758333° * 400/360 = 137.50926 gon.
    EXPECT_EQ(Angle(job, 123.758333), L"137.509g");
    job.SetAngleFormat(UJobSettings::kAnglePlain);
    EXPECT_EQ(Angle(job, 90.0), L"100.000");
}

TEST(UJobSettingsFormat, AreasFromSquareMetres) {
    UJobSettings job;
    EXPECT_DOUBLE_EQ(ConvertAreaToDisplay(job, 250.5), 250.5);
    // 1 / 0.3048^2 = 10.7639104167 ft2 per m2.
    job.SetLengthUnit(LengthUnit::Feet);
    EXPECT_NEAR(ConvertAreaToDisplay(job, 1.0), 10.7639104167, 1e-9);
    EXPECT_NEAR(ConvertAreaToDisplay(job, 100.0), 1076.39104167, 1e-7);
    // (3937/1200)^2 = 10.7638673611 US ft2 per m2.
    job.SetLengthUnit(LengthUnit::USFeet);
    EXPECT_NEAR(ConvertAreaToDisplay(job, 1.0), 10.7638673611, 1e-9);
}
