// Operations that other modules call on the engine; nothing inside the module does.

#include "ReductionFixture.h"

using ExportedOperations = ReductionFixture;

TEST_F(ExportedOperations, ForwardPointersPairedOnlyWithTheBackStation) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"STN ID=A\nSS ID=B,HA=0,VA=90,SD=1,HT=0\nSS ID=C,HA=0,VA=90,SD=1,HT=0\n"
        L"STN ID=B\nBKB ID=A,HA=0\nSS ID=X,HA=0,VA=90,SD=1,HT=0\n"
        L"STN ID=C\nBKB ID=Z,HA=0\nSS ID=Y,HA=0,VA=90,SD=1,HT=0\n");
    ASSERT_EQ(engine.PrepareList(), 1);
    ASSERT_EQ(engine.PrepareForwardWithBS(), 1);
    const STNSTRUCT* a = engine.searchSTN(L"A");
    // B takes A as its back station, C does not: only B is a forward target, and no reverse
    // node is made.
    ASSERT_EQ(a->FSList.size(), 1u);
    EXPECT_EQ(a->FSList.front()->SSName, L"B");
    EXPECT_EQ(engine.GetStations().size(), 3u);
    EXPECT_EQ(engine.DeleteForwPtr(), 1);
    EXPECT_TRUE(a->FSList.empty());
    EXPECT_EQ(engine.AddForwPtr(L"C"), 1);
    EXPECT_EQ(a->FSList.front()->SSName, L"C");
    EXPECT_EQ(engine.AddForwPtr(L"C"), 1);  // a forward target of that name is there already
    EXPECT_EQ(a->FSList.size(), 1u);
}

TEST_F(ExportedOperations, NewStationsReRunsAndPlainGeometry) {
    Rows(L"#VERSION-1.0 NEUTRAL FILE\n");
    ASSERT_EQ(engine.AddNewStn(L"N1"), 1);
    EXPECT_EQ(list.GetItemText(1), L"STN       ID=N1,HI=0.000,CO=");
    EXPECT_EQ(engine.GetStations().back()->Sighted, 1);
    engine.InitHeadList();
    EXPECT_TRUE(engine.GetStations().empty());

    // A re-run from given rows prints into no report here, and reduces as Process would.
    engine.Generate({L"#VERSION-1.0 NEUTRAL FILE", L"UNIT UL=M,UA=D", L"PT ID=P,E=3,N=4,H=0"},
                    true);
    EXPECT_GE(engine.GetPointIdx(L"P"), 0);
    EXPECT_DOUBLE_EQ(engine.GetDocExtents().GetMaxX(), 3.0);  // one point: a box of no size

    engine.SetMaxMin(UWRect(-5.0, -5.0, 5.0, 5.0));
    EXPECT_DOUBLE_EQ(engine.GetDocExtents().GetMinY(), -5.0);
    double e = 0.0, n = 0.0;
    // 10 m on bearing 30 from (100, 200): E + 5, N + 8.660254.
    UNeditDatabase::geo_coord(100.0, 200.0, 30.0, 10.0, &e, &n);
    EXPECT_NEAR(e, 105.0, 1e-12);
    EXPECT_NEAR(n, 208.6602540378, 1e-9);
}
