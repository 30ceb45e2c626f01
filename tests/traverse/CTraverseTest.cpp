// Traverses computed and adjusted on reduced surveys, against figures worked by hand from the
// same observations in tests/data/generate_traverse_surveys.py (bearings carried by the
// observed angles, latitudes and departures, the misclose shared by the Compass or the Transit
// rule, angles balanced a share per angle).

#include <gtest/gtest.h>

#include "TraverseFixture.h"
#include "platform/messages/Translate.h"

namespace {

constexpr double kLoopStartBearing = 138.63113549;

TraverseParams LoopParams() {
    TraverseParams params;
    params.StartX = 1000.0;
    params.StartY = 2000.0;
    params.StartZ = 50.0;
    params.StartBearing = kLoopStartBearing;
    params.FixedPt = L"A";
    params.FixedX = 1000.0;
    params.FixedY = 2000.0;
    params.FixedZ = 50.0;
    return params;
}

TraverseParams LinkParams(const std::wstring& fixed, double e, double n, double h) {
    TraverseParams params;
    params.StartX = 1000.0;
    params.StartY = 2000.0;
    params.StartZ = 50.0;
    params.StartBearing = 315.0;
    params.FixedPt = fixed;
    params.FixedX = e;
    params.FixedY = n;
    params.FixedZ = h;
    return params;
}

}  // namespace

class LoopTraverse : public TraverseFixture {
  protected:
    void SetUp() override {
        TraverseFixture::SetUp();
        Load("traverse_loop.neu");
    }
};

TEST_F(LoopTraverse, UnadjustedMiscloseOfTheLoop) {
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,D,A,"));
    Watch(traverse);
    host.SetFace<UMisReportDlg>([](UMisReportDlg&) { return nedit::mb::IdCancel; });
    TraverseParams params = LoopParams();
    EXPECT_EQ(traverse.Compute(params, nullptr), CTraverse::kGivenUp);
    const MiscloseFigures& unadjusted = figures.at(CTraverse::kUnadjusted);
    EXPECT_NEAR(unadjusted.DiffE, 0.012765, 2e-6);
    EXPECT_NEAR(unadjusted.DiffN, -0.030275, 2e-6);
    EXPECT_NEAR(unadjusted.DiffH, 0.009782, 2e-6);
    EXPECT_NEAR(unadjusted.MiscloseDist, 0.032856, 2e-6);
    EXPECT_NEAR(unadjusted.TraverseLength, 411.771467, 2e-6);
    EXPECT_EQ(unadjusted.Accuracy, L"1:12532");
    EXPECT_EQ(unadjusted.Setups, 4);
    // The closing A misses the first, so it is a fifth corner of the figure; lying across the
    // first leg, it makes the figure cross itself, which has no area.
    EXPECT_EQ(unadjusted.EnclosedArea, 0.0);
    ExpectAt(positions.at(CTraverse::kUnadjusted), 4, 999.987235, 2000.030275, 49.990218);
    // Cancel leaves the stations where the run put them.
    EXPECT_NEAR(engine.searchSTN(L"C")->East, 1150.304822, 2e-6);
}

TEST_F(LoopTraverse, CompassRuleThenTheSideShotsAgain) {
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,D,A,"));
    ASSERT_EQ(traverse.CheckBackSights(), 1);
    Watch(traverse);
    PressOnMisclose(false, true);
    TraverseParams params = LoopParams();
    ASSERT_EQ(traverse.Compute(params, nullptr), CTraverse::kDone);
    EXPECT_EQ(traverse.GetMethod(), CTraverse::kCompass);
    const std::vector<CTravStn>& adjusted = positions.at(CTraverse::kAfterCoordinates);
    ExpectAt(adjusted, 0, 1000.000000, 2000.000000, 50.000000);
    ExpectAt(adjusted, 1, 1080.527139, 2060.210572, 51.302389);
    ExpectAt(adjusted, 2, 1150.310992, 1990.712747, 49.787540);
    ExpectAt(adjusted, 3, 1070.100567, 1920.397819, 50.590074);
    ExpectAt(adjusted, 4, 1000.000000, 2000.000000, 50.000000);
    const MiscloseFigures& closed = figures.at(CTraverse::kAfterCoordinates);
    EXPECT_NEAR(closed.MiscloseDist, 0.0, 1e-9);
    EXPECT_EQ(closed.Accuracy, L"");
    EXPECT_NEAR(closed.EnclosedArea, 10556.113905, 1e-3);

    // The stations take the adjusted positions, and the side shots are reduced from them,
    // each oriented on its adjusted back sight.
    EXPECT_NEAR(engine.searchSTN(L"D")->North, 1920.397819, 2e-6);
    EXPECT_TRUE(engine.IsTraversePoint(L"b"));
    ExpectPoint(L"S1", 1090.028672, 2080.009833, 51.002389, 2e-6);
    ExpectPoint(L"S2", 1160.012924, 2010.011780, 49.987540, 2e-6);

    for (const wchar_t* block :
         {L"Unadjusted traverse", L"Results after coordinate adjustment (Compass Rule)",
          L"Elev Adjustment", L"Adjusted sideshots"}) {
        EXPECT_TRUE(ReportHas(block)) << std::string(block, block + wcslen(block));
    }
}

TEST_F(LoopTraverse, TransitRuleMovesHeightsByAShareEach) {
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,D,A,"));
    Watch(traverse);
    PressOnMisclose(false, true);
    TraverseParams params = LoopParams();
    params.Transit = 1;
    ASSERT_EQ(traverse.Compute(params, nullptr), CTraverse::kDone);
    EXPECT_EQ(traverse.GetMethod(), CTraverse::kTransit);
    const std::vector<CTravStn>& adjusted = positions.at(CTraverse::kAfterCoordinates);
    ExpectAt(adjusted, 1, 1080.527442, 2060.211445, 51.301956);
    ExpectAt(adjusted, 2, 1150.311204, 1990.713337, 49.784768);
    ExpectAt(adjusted, 3, 1070.100878, 1920.398639, 50.584768);
    ExpectAt(adjusted, 4, 1000.000000, 2000.000000, 49.992174);
    EXPECT_TRUE(ReportHas(L"Results after coordinate adjustment (Transit Rule)"));
}

TEST_F(LoopTraverse, OkWithoutButtonsAsksThenAdjusts) {
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,D,A,"));
    bool closed = false;
    traverse.SetCloseDialog([&closed] { closed = true; });
    TraverseParams params = LoopParams();
    // No face: the dialog is accepted as it stands, and the question is answered No first.
    host.QueueAnswer(nedit::mb::IdNo);
    EXPECT_EQ(traverse.Compute(params, nullptr), CTraverse::kGivenUp);
    EXPECT_FALSE(closed);
    EXPECT_EQ(host.Messages().back().text, L"Adjust Traverse ?");
    EXPECT_EQ(host.Messages().back().flags, 36u);

    CTraverse again(&engine);
    ASSERT_TRUE(again.CreateStnList(L"A,B,C,D,A,"));
    again.SetCloseDialog([&closed] { closed = true; });
    EXPECT_EQ(again.Compute(params, nullptr), CTraverse::kDone);
    EXPECT_TRUE(closed);
    EXPECT_TRUE(again.IsCoordAdjusted());
    EXPECT_NEAR(engine.searchSTN(L"B")->East, 1080.527139, 2e-6);
}

TEST_F(LoopTraverse, RoutesThatCannotBeComputed) {
    CTraverse traverse(&engine);
    EXPECT_FALSE(traverse.CreateStnList(L""));
    EXPECT_FALSE(traverse.CreateStnList(L"A,"));       // one name
    EXPECT_FALSE(traverse.CreateStnList(L"A,B"));      // text after the last comma is no name
    EXPECT_FALSE(traverse.CreateStnList(L"A,S1,B,"));  // S1 is no set-up
    EXPECT_FALSE(traverse.CreateStnList(L"A,C,D,"));   // A did not observe C
    EXPECT_TRUE(traverse.GetRoute().empty());
    TraverseParams params = LoopParams();
    EXPECT_EQ(traverse.Compute(params, nullptr), CTraverse::kGivenUp);
    EXPECT_EQ(host.Messages().back().text, L"Invalid or empty traverse route !");

    // An angle check on a point the closing station did not observe.
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,D,"));
    params.AdjustAngle = 1;
    params.ChkPt = L"ZZ";
    EXPECT_EQ(traverse.Compute(params, nullptr), CTraverse::kInvalidCheckPoint);
    EXPECT_EQ(host.Messages().back().text, L"Invalid angle-checking point !");
}

TEST_F(LoopTraverse, AFixedPointThatDoesNotExistIsAdjustedTo) {
    // The dialog finds no coordinates for it and gives zeros; the traverse is pulled there.
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,D,A,"));
    PressOnMisclose(false, false);
    Watch(traverse);
    TraverseParams params = LoopParams();
    params.FixedPt = L"NOWHERE";
    params.FixedX = params.FixedY = 0.0;
    params.FixedZ = kNoHeight;
    EXPECT_EQ(traverse.Compute(params, nullptr), CTraverse::kDone);
    ExpectAt(positions.at(CTraverse::kAfterCoordinates), 4, 0.0, 0.0, 49.990218);
    EXPECT_EQ(figures.at(CTraverse::kUnadjusted).EnclosedArea, 0.0);  // no closed figure
}

class LinkTraverse : public TraverseFixture {
  protected:
    void SetUp() override {
        TraverseFixture::SetUp();
        Load("traverse_link.neu");
    }
};

TEST_F(LinkTraverse, AngleCheckBalancesTheAnglesThenCompass) {
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,E,"));
    Watch(traverse);
    PressOnMisclose(true, false);
    TraverseParams params = LinkParams(L"E", 1300.0, 2080.0, 52.0);
    params.AdjustAngle = 1;
    params.ChkPt = L"F";
    params.CloseBearing = 48.81407483;
    ASSERT_EQ(traverse.Compute(params, nullptr), CTraverse::kDone);
    // The four angles at A, B, C and E share the closing error of 0.002 degrees.
    EXPECT_NEAR(figures.at(CTraverse::kUnadjusted).AngularError, -0.00200001, 1e-7);
    EXPECT_NEAR(figures.at(CTraverse::kUnadjusted).PerStation, -0.0005, 1e-7);
    EXPECT_NEAR(figures.at(CTraverse::kAfterAngles).AngularError, 0.0, 1e-7);
    const std::vector<CTravStn>& angled = positions.at(CTraverse::kAfterAngles);
    ExpectAt(angled, 1, 1100.010297, 2050.006240, 51.0);
    ExpectAt(angled, 2, 1210.001380, 2010.005135, 50.5);
    ExpectAt(angled, 3, 1300.008665, 2080.012062, 52.0);
    const std::vector<CTravStn>& adjusted = positions.at(CTraverse::kAfterCoordinates);
    ExpectAt(adjusted, 1, 1100.007472, 2050.002306, 51.0);
    ExpectAt(adjusted, 2, 1209.995597, 2009.997085, 50.5);
    ExpectAt(adjusted, 3, 1300.0, 2080.0, 52.0);
    EXPECT_TRUE(ReportHas(L"Traverse after angle adjustment"));
    EXPECT_TRUE(ReportHas(L"Known Bearing"));
}

TEST_F(LinkTraverse, AngleStageTwiceWorksOnWhatIsLeft) {
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,E,"));
    Watch(traverse);
    host.SetFace<UMisReportDlg>([](UMisReportDlg& dialog) {
        dialog.OnAngleAdjust();
        dialog.OnAngleAdjust();
        return nedit::mb::IdCancel;
    });
    TraverseParams params = LinkParams(L"E", 1300.0, 2080.0, 52.0);
    params.AdjustAngle = 1;
    params.ChkPt = L"F";
    params.CloseBearing = 48.81407483;
    EXPECT_EQ(traverse.Compute(params, nullptr), CTraverse::kGivenUp);
    // Nothing was left: the second press says so and changes nothing.
    EXPECT_EQ(host.Messages().back().text, L"No angle misclosure.");
    ExpectAt(positions.at(CTraverse::kAfterAngles), 2, 1210.001380, 2010.005135, 50.5);
}

TEST_F(LinkTraverse, OpenTraverseCarriedOnToAnObservedPoint) {
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,C,E,F,"));
    EXPECT_EQ(traverse.GetRoute().back().Stn, nullptr);
    Watch(traverse);
    PressOnMisclose(false, false);
    TraverseParams params = LinkParams(L"F", 1380.0, 2150.0, 51.5);
    ASSERT_EQ(traverse.Compute(params, nullptr), CTraverse::kDone);
    ExpectAt(positions.at(CTraverse::kUnadjusted), 4, 1380.012679, 2150.004120, 51.5);
    const std::vector<CTravStn>& adjusted = positions.at(CTraverse::kAfterCoordinates);
    ExpectAt(adjusted, 1, 1100.007577, 2050.004341, 51.0);
    ExpectAt(adjusted, 2, 1209.994659, 2010.000244, 50.5);
    ExpectAt(adjusted, 3, 1300.000558, 2080.003768, 52.0);
    ExpectAt(adjusted, 4, 1380.0, 2150.0, 51.5);
    // The carried-on point has no set-up and takes its adjusted position as a point.
    ExpectPoint(L"F", 1380.0, 2150.0, 51.5, 2e-6);
}

class LargeLoop : public TraverseFixture {};

TEST_F(LargeLoop, FiveThousandStationsAreFoundAndAdjusted) {
    // A regular polygon walked anticlockwise, each set-up turning by the same angle, one leg
    // measured 5 cm long; a loop that large is found and adjusted without a hang.
    constexpr int kStations = 5000;
    const double turn = 180.0 - 360.0 / kStations;
    std::wstring rows = L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n";
    for (int i = 0; i < kStations; ++i) {
        const std::wstring here = L"T" + std::to_wstring(i);
        const std::wstring back = L"T" + std::to_wstring((i + kStations - 1) % kStations);
        const std::wstring ahead = L"T" + std::to_wstring((i + 1) % kStations);
        rows += L"STN ID=" + here + L",HI=1.5\n";
        if (i == 0) {
            rows += L"XYZ ID=T0,E=0,N=0,H=0\nBKB ID=" + back + L",BRG=" +
                    std::to_wstring(270.0 + 360.0 / kStations) + L",HA=0\n";
        } else {
            rows += L"BKB ID=" + back + L",HA=0\n";
        }
        rows += L"SS ID=" + ahead + L",HA=" + std::to_wstring(turn) + L",VA=90,SD=" +
                (i == 2500 ? L"10.05" : L"10") + L",HT=1.5\n";
    }
    Rows(rows);
    engine.AddStage(&routes);
    ASSERT_EQ(engine.Process(), 1);
    ASSERT_EQ(routes.GetTraverseList().size(), 2u);
    EXPECT_EQ(routes.GetTraverseList()[1]->size(), kStations + 1u);

    std::wstring names;
    for (const nedit::NameEntry& entry : *routes.GetTraverseList()[1]) names += entry.Key + L',';
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(names));
    Watch(traverse);
    PressOnMisclose(false, false);
    TraverseParams params;
    params.StartZ = params.FixedZ = 0.0;
    params.StartBearing = 270.0 + 360.0 / kStations;
    params.FixedPt = L"T0";
    ASSERT_EQ(traverse.Compute(params, nullptr), CTraverse::kDone);
    // The long leg, half way round, points west: the loop ends 5 cm west of its start.
    EXPECT_NEAR(figures.at(CTraverse::kUnadjusted).MiscloseDist, 0.05, 1e-4);
    EXPECT_NEAR(figures.at(CTraverse::kAfterCoordinates).MiscloseDist, 0.0, 1e-9);
    EXPECT_GT(figures.at(CTraverse::kAfterCoordinates).EnclosedArea, 0.0);
}
