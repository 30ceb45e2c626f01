// The report's conversions of stored values to output text.

#include <cmath>

#include "ReportFixture.h"
#include "platform/job/USurveyDoc.h"
#include "report/NeditIni.h"
#include "report/OutParamStruct.h"

namespace {
using ReportValues = ReportFixture;
}  // namespace

TEST_F(ReportValues, AnglesInEveryOutputForm) {
    Open("");
    // 10.99999° is 10°59'59.964": the seconds round to 60 and carry into the degrees.
    EXPECT_DOUBLE_EQ(UNeditReport::dms(10.99999), 11.0);
    EXPECT_NEAR(UNeditReport::dms(123.7583333333), 123.4530, 1e-12);
    EXPECT_NEAR(UNeditReport::dms(-0.5), -0.3, 1e-12);
    EXPECT_EQ(report->dmsString(89.55), L" 89 55'00\"");  // 89.55 is held as 89.5499999...
    EXPECT_EQ(report->dmsString(-10.3), L"-10 30'00\"");
    EXPECT_EQ(report->dmsString(359.5960), L"  0 00'00\"");  // 359°59'60" carries round
    EXPECT_EQ(UNeditReport::deg2dmsString(10.5), L"  10 30'00");
    EXPECT_EQ(UNeditReport::deg2dmsString(-10.5), L"- 10 30'00");
    EXPECT_EQ(report->FormatAngle(123.7583333333), L"123 45'30\"");

    // Decimal degrees and gons print their digits two and two, without carries.
    doc->GetOutputParameters().AngularUnit = 1;
    report->UpdateSettings();
    EXPECT_EQ(report->dmsString(123.7583), L"123.7583");
    EXPECT_EQ(report->FormatAngle(123.7583333333), L"123.7583");
    EXPECT_DOUBLE_EQ(report->ConvertToAngleDisplayUnit(90.0), 90.0);
    doc->GetOutputParameters().AngularUnit = 2;
    report->UpdateSettings();
    EXPECT_DOUBLE_EQ(report->ConvertToAngleDisplayUnit(90.0), 100.0);
    EXPECT_EQ(report->FormatAngle(90.0), L"100.0000");
    // A zenith reading of 95 in a nadir file shows as the file reads it: 85.
    FieldMap fields;
    ASSERT_TRUE(doc->LoadNeutralFileDefinition(L"" SXNEDIT_DATA_DIR));
    doc->ProcessRecord(105, L"AMODE HM=A,VM=N", fields);
    EXPECT_NEAR(report->ConvertToDisplayVA(95.0), 85.0 * 400.0 / 360.0, 1e-12);
}

struct FullTurnCase {
    double degrees;
    const wchar_t* shown;
};

class FullTurnReadings : public ReportFixture,
                         public ::testing::WithParamInterface<FullTurnCase> {};

// Seconds are rounded to the whole second: 359°59'59.5" and more is a full turn, which reads
// as 0 as on the instrument's circle; 359.99986° is 359°59'59.496".
TEST_P(FullTurnReadings, AReadingThatRoundsToAFullTurnPrintsAsNought) {
    Open("");
    EXPECT_EQ(report->FormatAngle(GetParam().degrees), GetParam().shown);
}

INSTANTIATE_TEST_SUITE_P(ReportValues, FullTurnReadings,
                         ::testing::Values(FullTurnCase{359.9999999, L"0 00'00\""},
                                           FullTurnCase{359.99987, L"0 00'00\""},
                                           FullTurnCase{359.99986, L"359 59'59\""},
                                           FullTurnCase{360.0, L"0 00'00\""},
                                           FullTurnCase{360.5, L"0 30'00\""},
                                           FullTurnCase{-0.0000001, L"0 00'00\""},
                                           FullTurnCase{-359.9999999, L"0 00'00\""},
                                           FullTurnCase{-10.5, L"-10 30'00\""}));

TEST_F(ReportValues, LengthsAreaAndBearings) {
    Open("");
    // 100 m is 328.084 international feet and 328.083 US survey feet; 20.1168 m is 100 links.
    report->SetOutUL(1);
    EXPECT_EQ(report->ConvertToDistDisplayUnit(100.0, 3), L"328.084");
    EXPECT_NEAR(report->ConvertToAreaDisplayUnit(1.0), 10.7639104, 1e-7);
    report->SetOutUL(2);
    EXPECT_EQ(report->ConvertToDistDisplayUnit(100.0, 3), L"328.083");
    report->SetOutUL(7);  // no such unit: nothing changes
    EXPECT_EQ(report->GetOutUL(), L'U');
    report->SetOutUL(0);
    EXPECT_EQ(report->ConvertToDistDisplayUnit(-0.1234, 2), L"-0.12");

    double bearing = 0.0, distance = 0.0;
    UNeditReport::geo_brgdst(0.0, 0.0, -1.0, -1.0, &bearing, &distance);
    EXPECT_DOUBLE_EQ(bearing, 225.0);
    EXPECT_DOUBLE_EQ(distance, std::sqrt(2.0));
    UNeditReport::geo_brgdst(5.0, 5.0, 2.0, 5.000001, &bearing, &distance);
    EXPECT_DOUBLE_EQ(bearing, 270.0);
    UNeditReport::geo_brgdst(5.0, 5.0, 5.0, 5.0, &bearing, &distance);
    EXPECT_DOUBLE_EQ(bearing, 0.0);
    EXPECT_EQ(UNeditReport::geo_zero(1e-5), 1);
    EXPECT_EQ(UNeditReport::geo_zero(-1.1e-5), 0);
}

TEST_F(ReportValues, FeetAndInchesFollowTheJob) {
    auto job = USurveyDoc::CreateJob(config.File("inches.job"), nullptr);
    job->GetSettings().SetFootFormat(UJobSettings::kFeetAndInches);
    job->GetSettings().SetFootInchPrecision(8);
    Open("", job.get());
    report->SetOutUL(1);
    // 1 m = 3.2808399 ft = 3' 3.37", which is 3' 3 3/8" to the nearest eighth; decimals do not
    // count.
    EXPECT_EQ(report->ConvertToDistDisplayUnit(1.0, 3), L"3' 3 3/8\"");
    EXPECT_EQ(report->ConvertToDistDisplayUnit(1.0, 0), L"3' 3 3/8\"");
}

TEST_F(ReportValues, LabelsAndUnitNamesComeFromNeditIni) {
    const std::string long_value(10000, 'x');
    Open("[TITLE]\nOCCSTN=Station\nCOLID=   \nWIDE=" + long_value + "\n[DISTUNIT]\nF=Feet\n");
    EXPECT_EQ(report->GetTitleText(L"OCCSTN"), L"Station");
    EXPECT_EQ(report->GetTitleText(L"COLID"), L"   ");  // blanks are a value
    EXPECT_EQ(report->GetTitleText(L"COLHA"), L"Horiz    ");
    EXPECT_EQ(report->GetTitleText(L"BACKSTN"), L"");
    EXPECT_EQ(report->GetTitleText(L"WIDE").size(), 255u);
    EXPECT_EQ(report->Unit_Text(L"DISTUNIT", L'I'), L"Feet");
    EXPECT_EQ(report->Unit_Text(L"DISTUNIT", L'U'), L"");
    // Without the file the defaults stand, and the head lines print their keys.
    std::remove(config.File("NEDIT.INI").c_str());
    report->Init(doc.get(), L"t");
    report->SetPageLength(0);
    EXPECT_EQ(report->GetTitleText(L"MSGHC"), L"No Height");
    report->PrintHeadDVal(L"PRISM", 0.035);
    EXPECT_EQ(report->Lines().front(), L"PRISM                         : 0.035          ");
}

TEST(ReportParameters, TheOrderKeyTurnsColumnsOnByToken) {
    OutParamStruct parameters;
    SetFlagsFromOrder(parameters, L"ln id");
    EXPECT_EQ(GetCheckOn(parameters, opt::ID), 1);
    EXPECT_EQ(GetCheckOn(parameters, opt::LN), 1);
    EXPECT_EQ(GetCheckOn(parameters, opt::HA), 0);
    EXPECT_EQ(OrderText(parameters), L"ID LN ");
    SetFlagsFromOrder(parameters, L"");
    EXPECT_EQ(OrderText(parameters), L"");
    parameters.AngularUnit = 2;
    parameters.LinearUnit = 1;
    EXPECT_EQ(GetCheckOn(parameters, opt::AngleGons), 2);
    EXPECT_EQ(GetCheckOn(parameters, opt::LengthFeet), 1);
    EXPECT_EQ(GetCheckOn(parameters, 1018), 0);
    EXPECT_EQ(GetCheckOn(parameters, 2000), 0);
}

TEST_F(ReportValues, AnglesOfOneHeadShareOneUnit) {
    Open("");
    // The parameters change after the head took its units: every angle of the block stays in
    // the units of the head, until the next head takes the new ones.
    doc->GetOutputParameters().AngularUnit = 2;
    EXPECT_EQ(report->FormatAngle(90.0), L"90 00'00\"");
    EXPECT_DOUBLE_EQ(report->ConvertToAngleDisplayUnit(90.0), 90.0);
    EXPECT_EQ(report->dmsString(report->ConvertToAngleDisplayUnit(90.0)), L" 90 00'00\"");
    report->UpdateSettings();
    EXPECT_EQ(report->FormatAngle(90.0), L"100.0000");
    EXPECT_EQ(report->dmsString(report->ConvertToAngleDisplayUnit(90.0)), L"100.0000");
}
