#include "ReductionFixture.h"
#include "reduction/UCoordEntryDlg.h"

using CoordLookup = ReductionFixture;

TEST_F(CoordLookup, TheBearingStoreAnswersBothWays) {
    EXPECT_EQ(engine.InsertBearingArray(L"A", L"B", 350.0), 0);
    EXPECT_DOUBLE_EQ(engine.GetBearingFromArray(L"B", L"A"), 170.0);
    EXPECT_EQ(engine.InsertBearingArray(L"B", L"A", 90.0), 0);
    EXPECT_DOUBLE_EQ(engine.GetLineBearings()[0].Bearing, 270.0);
    engine.InsertBearingArray(L"C", L"D", 180.0);
    EXPECT_DOUBLE_EQ(engine.GetBearingFromArray(L"D", L"C"), 0.0);
    engine.InsertBearingArray(L"E", L"", 12.5);
    EXPECT_EQ(engine.GetLineBearings().back().ToName, L"-99999");
    EXPECT_DOUBLE_EQ(engine.GetBearingFromArray(L"E", L""), 12.5);
    int direction = 0;
    EXPECT_EQ(engine.GetBearingArray(L"X", L"Y", direction), -1);
    EXPECT_EQ(direction, 0);
    EXPECT_DOUBLE_EQ(engine.GetBearingFromArray(L"X", L"Y"), -1.0);

    // Saved beside the neutral file and read back by a new engine.
    const std::string base = ::testing::TempDir() + "store-round-trip";
    engine.SetFileName(std::wstring(base.begin(), base.end()) + L".neu");
    EXPECT_EQ(engine.BearingFileName(), std::wstring(base.begin(), base.end()) + L".$BR");
    ASSERT_EQ(engine.SaveBearingArray(), 1);
    UNeditDatabase other(&format, &list, nullptr, &host);
    other.SetFileName(engine.GetFileName());
    ASSERT_EQ(other.LoadBearingArray(), 1);
    EXPECT_EQ(other.GetLineBearings().size(), 3u);
    EXPECT_DOUBLE_EQ(other.GetBearingFromArray(L"A", L"B"), 270.0);
    other.SetFileName(L"");
    EXPECT_EQ(other.LoadBearingArray(), 0);
}

TEST_F(CoordLookup, SetCoordWritesEveryNodeOfTheNameOrMakesAPointNode) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"STN ID=A\nSS ID=P,HA=0,VA=90,SD=1,HT=0\nSTN ID=A\nSS ID=Q,HA=0,VA=90,SD=1,HT=0\n");
    ASSERT_EQ(engine.PrepareList(), 1);
    EXPECT_EQ(engine.setCoord(L"A", 1.0, 2.0, 3.0, L"CP", 8, 1, 1), 1);
    for (const auto& station : engine.GetStations()) {
        EXPECT_DOUBLE_EQ(station->East, 1.0);
        EXPECT_EQ(station->CoordKnown, 1);
        EXPECT_EQ(station->StnCode, L"CP");
    }
    // Without the bit of value 8 a known node keeps its values; only the point is saved.
    EXPECT_EQ(engine.setCoord(L"A", 9.0, 9.0, 9.0, L"", 0, 1, 1), 0);
    EXPECT_DOUBLE_EQ(engine.GetStations()[0]->East, 1.0);
    EXPECT_EQ(engine.setCoord(L"NEW", 5.0, 6.0, 7.0, L"", 8, 0, 0), 1);
    EXPECT_EQ(engine.GetStations().back()->StnName, L"NEW");
    EXPECT_EQ(engine.GetStations().back()->PointOnly, 1);
    EXPECT_EQ(engine.searchSTN(L"NEW"), nullptr);
    EXPECT_EQ(engine.setCoord(L"", 0, 0, 0, L"", 8, 0, 0), 0);
    double e = 0, n = 0, z = 0;
    std::wstring code;
    EXPECT_EQ(engine.GetCoordFromStnList(L"NEW", e, n, z, code), 1);
    EXPECT_DOUBLE_EQ(z, 7.0);
}

TEST_F(CoordLookup, AFieldCoordinateIsConfirmedOnceThenRemembered) {
    int shown = 0;
    host.SetFace<UCoordEntryDlg>([&](UCoordEntryDlg& dialog) {
        ++shown;
        EXPECT_TRUE(dialog.IsOffered(UCoordEntryDlg::Source::Field));
        EXPECT_FALSE(dialog.IsOffered(UCoordEntryDlg::Source::Database));
        EXPECT_EQ(dialog.GetSelectedSource(), UCoordEntryDlg::Source::Field);
        EXPECT_FALSE(dialog.IsEntryEditable());
        dialog.SelectSource(UCoordEntryDlg::Source::Database);  // not offered: no change
        EXPECT_EQ(dialog.GetSelectedSource(), UCoordEntryDlg::Source::Field);
        EXPECT_DOUBLE_EQ(dialog.RowOf(UCoordEntryDlg::Source::Database).Height, -10000.0);
        return dialog.OnOK() ? nedit::mb::IdOk : nedit::mb::IdCancel;
    });
    Rows(L"#VERSION-1.0 NEUTRAL FILE\nXYZ ID=K,E=10,N=20,H=30\n");
    ASSERT_EQ(engine.PrepareList(), 1);
    double e = 0, n = 0, z = 0;
    std::wstring code;
    ASSERT_EQ(engine.findCoord(L"K", e, n, z, code, 0, true), 1);
    EXPECT_DOUBLE_EQ(e, 10.0);
    EXPECT_DOUBLE_EQ(z, 30.0);
    ASSERT_EQ(engine.findCoord(L"K", e, n, z, code, 0, true), 1);
    EXPECT_EQ(shown, 1);
    EXPECT_EQ(engine.findCoord(L"UNKNOWN", e, n, z, code, 0, true), 0);
    // The row of a coordinate record is found by name, its values read in working units.
    EXPECT_EQ(engine.FindXYZ(L"K", e, n, z), 1);
    EXPECT_EQ(engine.FindRecord(112, L"NOPE"), -1);
}

TEST_F(CoordLookup, RowsWrittenForTheUserAreLaidOutAsRecords) {
    EXPECT_EQ(engine.FormatXYZRecord(L"B", 1.23456, 2.0, -0.5),
              L"XYZ      ID=B,E=1.235,N=2.000,H=-0.500");
    // Angles in the job's unit (ddd.mmss) with its four decimals: 45.5° is 45°30'.
    EXPECT_EQ(engine.FormatBKBRecord(L"B", 0.0, 45.5), L"BKB      ID=B,HA=0.0000,BRG=45.3000");
}
