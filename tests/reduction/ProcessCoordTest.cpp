// Reductions checked against coordinates worked out by hand from the observations:
// HD = SD sin z + prism, VD = SD cos z, bearing = back bearing + angle from the back sight,
// E = E0 + HD sin(bearing), N = N0 + HD cos(bearing), H = H0 + VD + HI - HT.

#include <fstream>

#include "ReductionFixture.h"
#include "reduction/UCoordEntryDlg.h"

using Reduction = ReductionFixture;

TEST_F(Reduction, KnownStationWithBackBearingReducesItsSideShots) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\n"
        L"UNIT UL=M,UA=D\n"
        L"STN ID=A,HI=1.500\n"
        L"XYZ ID=A,E=1000,N=2000,H=50\n"
        L"BKB ID=B,BRG=45,HA=0\n"
        L"SS ID=P1,HA=90,VA=90,SD=100.000,HT=1.500,CO=FC\n"
        L"SS ID=P2,HA=30,VA=80,SD=50.000,HT=2.000\n");
    ASSERT_EQ(engine.Process(), 1);
    // P1 on bearing 135 at 100 m level: E 1000 + 70.710678, N 2000 - 70.710678.
    ExpectPoint(L"A", 1000.0, 2000.0, 50.0);
    ExpectPoint(L"P1", 1070.7106781, 1929.2893219, 50.0);
    // P2 on bearing 75, HD 50 sin 80 = 49.240388, VD 50 cos 80 = 8.682409.
    ExpectPoint(L"P2", 1047.5625621, 2012.7443501, 58.1824089);
    EXPECT_EQ(Point(L"P1").GetCode(), L"FC");
    // The coordinate record was confirmed once through the dialog, as a field source.
    ASSERT_EQ(host.DialogsRun().size(), 1u);
    EXPECT_EQ(host.DialogsRun()[0], L"Control Point Coordinate");
}

TEST_F(Reduction, BothFacesAndRoundsAreMeanedBeforeReduction) {
    // Back sight read 0°00'00" and, face 2, 180°00'10": mean 0°00'05". The side shot read
    // 90°00'00" and, face 2, 270°00'10" (zenith 275 folds to 85): mean 90°00'05", so the angle
    // from the back sight is exactly 90 and the bearing 30 + 90 = 120. SD mean 100.002.
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\n"
        L"STN ID=S,HI=1.600\n"
        L"XYZ ID=S,E=500,N=500,H=10\n"
        L"BKB ID=B,BRG=30.0000\n"
        L"BS ID=B,HA=0.0000,VA=90.0000,SD=80,HT=1.6\n"
        L"BS ID=B,HA=180.0010,VA=270.0000,SD=80,HT=1.6\n"
        L"SS ID=P3,HA=90.0000,VA=85.0000,SD=100.000,HT=1.600\n"
        L"SS ID=P3,HA=270.0010,VA=275.0000,SD=100.004,HT=1.600\n");
    ASSERT_EQ(engine.Process(), 1);
    ExpectPoint(L"P3", 586.2747170, 450.1892689, 18.7157486);
    const SSSTRUCT* target = engine.GetStations().front()->SSList.Find(L"P3");
    ASSERT_NE(target, nullptr);
    EXPECT_EQ(target->Meas->size(), 2u);
    EXPECT_NEAR(target->AngleFromBS, 90.0, 1e-9);
    EXPECT_EQ(target->RecordNo, 8);
}

TEST_F(Reduction, ThePrismConstantOfTheFileGoesOnEveryHorizontalDistance) {
    // A vertical sight (zenith 0) has no horizontal distance but the constant: HD = 0.035,
    // VD = 2. The constant is the file's last, also for the shot read before it.
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\n"
        L"UNIT UL=M,UA=D\n"
        L"STN ID=A,HI=1.5\n"
        L"XYZ ID=A,E=0,N=0,H=10\n"
        L"BKB ID=B,BRG=0,HA=0\n"
        L"SS ID=UP,HA=0,VA=0,SD=2,HT=1.5\n"
        L"PRISM 0.035\n"
        L"SS ID=FLAT,HA=90,VA=90,SD=10,HT=1.5\n");
    ASSERT_EQ(engine.Process(), 1);
    ExpectPoint(L"UP", 0.0, 0.035, 12.0);
    ExpectPoint(L"FLAT", 10.035, 0.0, 10.0);
}

TEST_F(Reduction, OffsetsScaleAndBearingMode) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\n"
        L"UNIT UL=M,UA=D\n"
        L"STN ID=A,HI=1.500\n"
        L"XYZ ID=A,E=1000,N=2000,H=50\n"
        L"BKB ID=B,BRG=45,HA=0\n"
        L"SS ID=P1,HA=90,VA=90,SD=100.000,HT=1.500\n"
        L"OFFSET OA=1,OR=2,OU=0.5\n"
        L"STN ID=Z,HI=1.500\n"
        L"XYZ ID=Z,E=0,N=0,H=0\n"
        L"BKB ID=Y,BRG=0,HA=0\n"
        L"SCALE 0.9996\n"
        L"SS ID=PS,HA=0,VA=90,SD=200,HT=1.5\n"
        L"SCALE 1\n"
        L"AMODE HM=B,VM=Z\n"
        L"STN ID=M,HI=0\n"
        L"XYZ ID=M,E=100,N=100,H=0\n"
        L"SS ID=PB,HA=120,VA=90,SD=10,HT=0\n");
    ASSERT_EQ(engine.Process(), 1);
    // 1 m further along bearing 135 and 2 m to its right (bearing 225), 0.5 m up.
    ExpectPoint(L"P1", 1070.0035713, 1927.1680015, 50.5);
    // The scale factor goes on each slope distance as it is read: 200 x 0.9996 = 199.92.
    ExpectPoint(L"PS", 0.0, 199.92, 0.0);
    // In bearing mode the reading is the bearing: 10 m on 120 from (100, 100).
    ExpectPoint(L"PB", 108.6602540, 95.0, 0.0);
}

TEST_F(Reduction, ForwardObservationsPositionLaterStations) {
    // B lies 100 m on bearing 60 from A; from B, with A as back sight (bearing 240), C is
    // 90° round: bearing 330, 50 m.
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\n"
        L"UNIT UL=M,UA=D\n"
        L"STN ID=A,HI=1.5\n"
        L"XYZ ID=A,E=1000,N=2000,H=50\n"
        L"BKB ID=R,BRG=0,HA=0\n"
        L"SS ID=B,HA=60,VA=90,SD=100,HT=1.5\n"
        L"STN ID=B,HI=1.5\n"
        L"BKB ID=A,HA=0\n"
        L"BS ID=A,HA=0,VA=90,SD=100,HT=1.5\n"
        L"SS ID=C,HA=90,VA=90,SD=50,HT=1.5\n");
    ASSERT_EQ(engine.Process(), 1);
    ExpectPoint(L"B", 1086.6025404, 2050.0, 50.0);
    ExpectPoint(L"C", 1061.6025404, 2093.3012702, 50.0);
    // Only the first station was asked for: B took its position from A's observation.
    EXPECT_EQ(host.DialogsRun().size(), 1u);
    ASSERT_EQ(engine.GetLineList().size(), 1u);
    EXPECT_EQ(engine.GetLineList()[0].GetFromPt(), L"A");
    EXPECT_EQ(engine.GetLineList()[0].GetToPt(), L"B");
}

TEST_F(Reduction, AStationNobodyKnowsIsPositionedByTheUsersAnswer) {
    host.SetFace<UCoordEntryDlg>([](UCoordEntryDlg& dialog) {
        EXPECT_FALSE(dialog.IsOffered(UCoordEntryDlg::Source::Database));
        EXPECT_FALSE(dialog.IsOffered(UCoordEntryDlg::Source::Field));
        EXPECT_EQ(dialog.GetSelectedSource(), UCoordEntryDlg::Source::Enter);
        dialog.InitXYZ(300.0, 400.0, 20.0, L"CP");
        dialog.SetApplyToAll(true);
        return dialog.OnOK() ? nedit::mb::IdOk : nedit::mb::IdCancel;
    });
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\n"
        L"UNIT UL=M,UA=D\n"
        L"STN ID=K,HI=1.0\n"
        L"SS ID=Q,HA=180,VA=90,SD=25,HT=1.0\n"
        L"STN ID=L,HI=1.0\n"
        L"SS ID=R,HA=0,VA=90,SD=10,HT=1.0\n");
    ASSERT_EQ(engine.Process(), 1);
    ExpectPoint(L"K", 300.0, 400.0, 20.0);
    ExpectPoint(L"Q", 300.0, 375.0, 20.0);
    // "Apply to All": the second unknown station takes the entered values without asking.
    EXPECT_EQ(host.DialogsRun().size(), 1u);
    ExpectPoint(L"L", 0.0, 0.0, -10000.0);
    ExpectPoint(L"R", 0.0, 10.0, -10000.0);
}

TEST_F(Reduction, CancellingTheCoordinateDialogEndsTheRun) {
    host.SetFace<UCoordEntryDlg>([](UCoordEntryDlg&) { return nedit::mb::IdCancel; });
    Rows(L"#VERSION-1.0 NEUTRAL FILE\nSTN ID=K\nSS ID=Q,HA=0,VA=90,SD=5,HT=0\n");
    EXPECT_EQ(engine.Process(), 0);
    EXPECT_EQ(engine.GetPointIdx(L"Q"), -1);
    // The cancel is remembered: the run's error shows the default message.
    EXPECT_EQ(engine.GetError(), 1);
    EXPECT_EQ(host.Messages().back().text, L"Default Error Has Occurred!!!!");
}

TEST_F(Reduction, TheBearingStoreHasTheLastWord) {
    const std::string base = ::testing::TempDir() + "bearing-store";
    std::ofstream(base + ".$BR") << "A,B,90.00000000\n";
    engine.SetFileName(std::wstring(base.begin(), base.end()) + L".neu");
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\n"
        L"UNIT UL=M,UA=D\n"
        L"STN ID=A,HI=1.5\n"
        L"XYZ ID=A,E=0,N=0,H=0\n"
        L"BKB ID=B,BRG=45,HA=0\n"
        L"SS ID=P,HA=0,VA=90,SD=10,HT=1.5\n");
    ASSERT_EQ(engine.Process(), 1);
    // The stored bearing A to B, 90, overrides the record's 45.
    ExpectPoint(L"P", 10.0, 0.0, 0.0);
    EXPECT_DOUBLE_EQ(engine.GetBearingFromArray(L"B", L"A"), 270.0);
}

TEST_F(Reduction, BadObservationsNeverGiveNaN) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\n"
        L"UNIT UL=M,UA=D\n"
        L"SS ID=EARLY,HA=0,VA=90,SD=5\n"  // before any station: ignored
        L"OFFSET OA=1\n"                  // nothing to apply to
        L"STN HI=1.5\n"                   // no name: ignored
        L"DCORR 0.13\n"                   // no radius: the mean earth radius serves
        L"STN ID=A,HI=1.5\n"
        L"XYZ ID=A,E=0,N=0,H=0\n"
        L"BKB ID=B,BRG=0,HA=0\n"
        L"SS ID=A,HA=10,VA=90,SD=5,HT=1.5\n"  // the station itself: not reduced
        L"SS ID=Z,HA=1e400,VA=nan,SD=-3,HT=1.5\n"
        L"SS ID=Y,HA=0,VA=90,SD=0,HT=1.5\n");
    ASSERT_EQ(engine.Process(), 1);
    EXPECT_EQ(engine.GetPointIdx(L"EARLY"), -1);
    for (const UNeditPt& point : engine.GetPointList()) {
        EXPECT_TRUE(std::isfinite(point.x) && std::isfinite(point.y) && std::isfinite(point.z))
            << std::string(point.GetID().begin(), point.GetID().end());
    }
    ExpectPoint(L"A", 0.0, 0.0, 0.0);
    ExpectPoint(L"Y", 0.0, 0.0, 0.0);
}

TEST_F(Reduction, AFileEndingInAStationReducesWhatCameBefore) {
    // The station of a last STN record never joins the list; the run once divided by zero
    // counting its progress. Alone, or after a set-up, or as a check station, it must reduce.
    for (const wchar_t* last : {L"STN ID=C\n", L"STN ID=C,CO=*CHK\n", L"STN ID=C\nSTN ID=D\n"}) {
        Rows(std::wstring(L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n") + last);
        EXPECT_EQ(engine.Process(), 1);
        Rows(std::wstring(L"#VERSION-1.0 NEUTRAL FILE\n"
                          L"UNIT UL=M,UA=D\n"
                          L"STN ID=A,HI=1.500\n"
                          L"XYZ ID=A,E=1000,N=2000,H=50\n"
                          L"BKB ID=B,BRG=45,HA=0\n"
                          L"SS ID=P1,HA=90,VA=90,SD=100.000,HT=1.500\n") +
             last);
        ASSERT_EQ(engine.Process(), 1);
        // P1 on bearing 135 at 100 m level, as without the last record.
        ExpectPoint(L"P1", 1070.7106781, 1929.2893219, 50.0);
    }
}
