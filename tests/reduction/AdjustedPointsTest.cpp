// Points the engine derived go back into rows: addition points above the marker, adjusted
// points below it.

#include "ReductionFixture.h"

using AdjustedPoints = ReductionFixture;

TEST_F(AdjustedPoints, AdditionPointsGoIntoTheRowsTheyAreGiven) {
    Rows(L"#VERSION-1.0 NEUTRAL FILE\nXYZ ID=K,E=1,N=2,H=3\n");
    nedit::test::RowList other(&format);
    for (const wchar_t* row : {L"#VERSION-1.0 NEUTRAL FILE", L"XYZ ID=K,E=9,N=9,H=9", L"NOTE KEPT",
                               L"  ##########adjusted-points  "}) {
        other.AddRecord(other.GetItemCount(), row);
    }
    engine.SaveTravPoint(L"K", 1.0, 2.0, 3.0, L"", 1);
    engine.SaveTravPoint(L"NEW", 5.0, 6.0, 7.0, L"", 1);
    ASSERT_EQ(engine.SaveAdditionPt2CtrlList(&other), 1);
    // K differed: replaced where it stood. NEW went in directly above the marker.
    const std::vector<std::wstring> expected = {
        L"#VERSION-1.0 NEUTRAL FILE",
        L"XYZ       ID=K,E=1.000,N=2.000,H=3.000",
        L"NOTE      KEPT",
        L"XYZ       ID=NEW,E=5.000,N=6.000,H=7.000",
        L"##########ADJUSTED-POINTS",
    };
    EXPECT_EQ(other.GetRows(), expected);
    // The engine's own rows were neither read nor written, and are still the ones it reads.
    EXPECT_EQ(list.GetItemCount(), 2);
    double e = 0.0, n = 0.0, h = 0.0;
    EXPECT_EQ(engine.FindXYZ(L"NEW", e, n, h), -1);
    ASSERT_EQ(engine.FindXYZ(L"K", e, n, h), 1);
    EXPECT_DOUBLE_EQ(e, 1.0);
    // A second save finds every value in place and changes nothing.
    ASSERT_EQ(engine.SaveAdditionPt2CtrlList(&other), 1);
    EXPECT_EQ(other.GetRows(), expected);
}

TEST_F(AdjustedPoints, AdjustedPointsFollowAMarkerMadeForThem) {
    Rows(L"#VERSION-1.0 NEUTRAL FILE\nNOTE A\n");
    engine.SetTravFlag(1);
    engine.SavePoint(L"T1", 10.0, 20.0, 30.0, L"", 1, 0, 0);
    engine.SavePoint(L"T2", 11.0, 21.0, 31.0, L"", 1, 0, 0);
    ASSERT_EQ(engine.SaveAdjustedPt2CtrlList(&list), 1);
    const std::vector<std::wstring> expected = {
        L"#VERSION-1.0 NEUTRAL FILE",
        L"NOTE      A",
        L"##########ADJUSTED-POINTS",
        L"XYZ       ID=T1,E=10.000,N=20.000,H=30.000",
        L"XYZ       ID=T2,E=11.000,N=21.000,H=31.000",
    };
    EXPECT_EQ(list.GetRows(), expected);
    engine.DelAdjPts();
    EXPECT_EQ(list.GetItemCount(), 2);
}

TEST_F(AdjustedPoints, TraversePointsAreTheLastAdjustedRoute) {
    EXPECT_FALSE(engine.IsTraversePoint(L"A"));
    const std::vector<UNeditPt> route = {UNeditPt(L"A", 1.0, 2.0, 3.0, L"STN", 0),
                                         UNeditPt(L"b", 4.0, 5.0, kNoHeight, L"", 0)};
    engine.UpdateTraversePoints(&route);
    EXPECT_TRUE(engine.IsTraversePoint(L"a"));
    EXPECT_TRUE(engine.IsTraversePoint(L"B"));
    EXPECT_FALSE(engine.IsTraversePoint(L"C"));
    UNeditPt asked(L"B", 0.0, 0.0, 0.0, L"KEEP", UNeditPt::kFromPTRecord);
    ASSERT_TRUE(engine.GetTraversePoint(asked));
    EXPECT_EQ(asked.GetID(), L"B");
    EXPECT_DOUBLE_EQ(asked.x, 4.0);
    EXPECT_EQ(asked.z, kNoHeight);
    EXPECT_EQ(asked.GetCode(), L"");
    EXPECT_EQ(asked.GetFlags(), 0u);
    UNeditPt unknown(L"C", 0.0, 0.0, 0.0, L"", 0);
    EXPECT_FALSE(engine.GetTraversePoint(unknown));
    // The side shots of a re-reduction leave them where the adjustment put them.
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\nSTN ID=K,HI=1.5\nXYZ ID=K,E=0,N=0,H=0\n"
        L"BKB ID=Z,BRG=0,HA=0\nSS ID=A,HA=90,VA=90,SD=10,HT=1.5\nSS "
        L"ID=Q,HA=0,VA=90,SD=10,HT=1.5\n");
    ASSERT_EQ(engine.Process(), 1);
    EXPECT_EQ(engine.GetPointIdx(L"A"), -1);
    EXPECT_GE(engine.GetPointIdx(L"Q"), 0);
    engine.UpdateTraversePoints(nullptr);
    EXPECT_FALSE(engine.IsTraversePoint(L"A"));
}
