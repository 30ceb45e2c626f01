// Whole report blocks compared with text written out from the report's formats.

#include "ReportFixture.h"
#include "platform/job/USurveyDoc.h"
#include "report/OutParamStruct.h"

namespace {

using Report = ReportFixture;

}  // namespace

TEST_F(Report, StationBlockWithTwoRoundsAndOffsets) {
    Open(std::string("[OUTPUT]\nORDER=ID LN HA VA SD HT EC NC HC CO\n") + kTitles);
    // The back sight read 0°00'00" and, face 2, 180°00'10".
    const std::vector<double> back_readings = {0.0, 180.0 + 10.0 / 3600.0};
    report->PrintOccStnBlk(back_readings, L"A", 1000.0, 2000.0, 50.0, L"STN", 1.55, 1.0, L"B", 45.0,
                           5.0 / 3600.0);
    report->PrintSSHead();
    // Two rounds of P1, face 1 and face 2, printed as read, then their mean and its offsets.
    report->PrintSSLine(L"P1", 90.0, 85.0, 100.000, 1.6, 0, 0, 0, L"", 0, false);
    report->PrintSSLine(L"P1", 270.0 + 10.0 / 3600.0, 275.0, 100.004, 1.6, 0, 0, 0, L"", 0, false);
    report->PrintSSLine(L"*P1", 90.0 + 5.0 / 3600.0, 85.0, 100.002, 1.6, 1099.619, 2000.0, 58.716,
                        L"FC", 7, true);
    report->PrintOffset(1.0, 2.0, 0.5);
    const std::vector<std::wstring> expected = {
        L"",
        L"",
        L"",
        L"Occupied Station              : A",
        L"Coordinates                   : E 1000.000   N 2000.000   H 50.000",
        L"Scale Factor                  : 1.00000000     ",
        L"Code                          : STN",
        L"Instrument Height             : 1.550          ",
        L"Back Station                  : B",
        L"Back Bearing                  :  45 00'00\"",
        L"Back Sight Obs                :   0 00'00\"",
        L"                              : 180 00'10\"",
        L"Back Sight Angle              :   0 00'05\"",
        L"",
        L"PointID Line    Horiz        Vert      SDist   HTar      East         North       Height "
        L"     Code",
        L"",
        L"     P1         90 00'00\"    85 00'00\" 100.000  1.600",
        L"     P1        270 00'10\"   275 00'00\" 100.004  1.600",
        L"    *P1    7    90 00'05\"    85 00'00\" 100.002  1.600      1099.619      2000.000    "
        L"58.716 FC",
        L"OFFSETS                                            R     1.000   T     2.000 V   0.500",
    };
    EXPECT_EQ(Lines(), expected);
}

TEST_F(Report, SideShotTableWithColumnsSwitchedOff) {
    Open("[OUTPUT]\nORDER=id ha co\n");
    report->PrintSSHead();
    report->PrintSSLine(L"P7", 12.5, 90.0, 20.0, 1.5, 1.0, 2.0, -10000.0, L"TREE", 3, true);
    // Only the name, the horizontal angle and the code are on.
    const std::vector<std::wstring> expected = {
        L"",
        L"PointID    Horiz       Code",
        L"",
        L"     P7    12 30'00\" TREE",
    };
    EXPECT_EQ(Lines(), expected);

    // All columns off: two empty lines and no head.
    Open("[OUTPUT]\nORDER=\n");
    report->PrintSSHead();
    EXPECT_EQ(report->GetText(), L"\n\n");
}

TEST_F(Report, CheckBlockWithNorthingFirst) {
    Open("");
    report->SetXYFLAG(0);
    report->PrintChkStnBlk(L"A", L"CHK1", 1000.010, 2000.020, 50.003, 1000.0, 2000.0, 50.0,
                           45.0 + 30.0 / 3600.0, 45.0, 30.0 / 3600.0, 141.428, 141.421, 0.007);
    // Four characters of name leave an indent of three.
    const std::vector<std::wstring> expected = {
        L"   *********************** CHECK POINT ****************************",
        L"                           Observed         Known        Difference",
        L"   Northing                2000.020        2000.000           0.020",
        L"   Easting                 1000.010        1000.000           0.010",
        L"   Height                    50.003          50.000           0.003",
        L"   Bearing                45 00'30\"       45 00'00\"        0 00'30\"",
        L"   Distance                 141.428         141.421           0.007",
        L"   ****************************************************************",
    };
    EXPECT_EQ(Lines(), expected);
}

TEST_F(Report, TraverseSummaryInFeet) {
    // The summary follows the job's settings: a job kept in feet, angles in ddd.mmss.
    auto job = USurveyDoc::CreateJob(config.File("feet.job"), nullptr);
    job->GetSettings().SetLengthUnit(nedit::LengthUnit::Feet);
    Open("", job.get());
    // An area of 1000 ft² computed from coordinates in feet shows as 1000.000.
    report->PrintTraverseInfo(0.012, -0.034, 0.005, 160.5, 0.036, 1000.0, 1234.567, 6, L"1:34000",
                              true, true, 9.0 / 3600.0, 2.0 / 3600.0, 45.0, 45.0 + 9.0 / 3600.0);
    const std::vector<std::wstring> expected = {
        L"",
        L"",
        L"                               East Diff            North Diff           Elev Diff",
        L"Coordinate Misclose            0.012                -0.034               0.005           "
        L"    ",
        L"",
        L"Misclose Bearing               160.3000             Distance             0.036           "
        L"    ",
        L"Enclosed Area                  1000.000             Traverse Length      1234.567        "
        L"    ",
        L"No  of Setups                  6                    Accuracy             1:34000         "
        L"    ",
        L"Elevation Error                0.005               ",
        L"",
        L"Known Bearing                  45.0000              Observed Bearing     45.0009         "
        L"    ",
        L"Angular Error                  0.0009               PerStation           0.0002          "
        L"    ",
    };
    EXPECT_EQ(Lines(), expected);
}
