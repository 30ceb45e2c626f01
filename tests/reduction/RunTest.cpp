#include "ReductionFixture.h"

using ReductionRun = ReductionFixture;

TEST_F(ReductionRun, RowsWithoutObservationsReduceToNothing) {
    Rows(L"#VERSION-1.0 NEUTRAL FILE\nNOTE FIELD DAY\nDATE ,2026-11-20,\n");
    ASSERT_EQ(engine.Process(), 1);
    EXPECT_TRUE(engine.GetStations().empty());
    EXPECT_EQ(engine.GetDateText(), L"2026-11-20");
    EXPECT_DOUBLE_EQ(engine.GetDocExtents().GetMaxX(), 100.0);
}

TEST_F(ReductionRun, OnlyContentRowsCountAsModifications) {
    Rows(L"#VERSION-1.0 NEUTRAL FILE\nNOTE A\nSTN ID=A,HI=1.5\nSS ID=P1,HA=1,VA=90,SD=5,HT=1.5\n");
    engine.CreateContent();
    EXPECT_FALSE(engine.IsContentModified());
    list.SetRecord(1, L"NOTE B");
    list.AddRecord(2, L"# a comment");
    EXPECT_FALSE(engine.IsContentModified());
    list.SetRecord(3, L"STN ID=A, HI=1.5");  // layout only
    list.SetRecord(4, L"ss id=p1,ha=1,va=90,sd=5,ht=1.5");
    EXPECT_FALSE(engine.IsContentModified());
    list.SetRecord(4, L"SS ID=P1,HA=1,VA=90,SD=6,HT=1.5");
    EXPECT_TRUE(engine.IsContentModified());
    list.DeleteItem(4);
    EXPECT_TRUE(engine.IsContentModified());
}

TEST_F(ReductionRun, ExtentsCoverThePointsWithAMargin) {
    Rows(L"#VERSION-1.0 NEUTRAL FILE\nPT ID=A,E=0,N=0,H=0\nPT ID=B,E=100,N=50,H=0\n");
    ASSERT_EQ(engine.Process(), 1);
    const UWRect box = engine.GetDocExtents();
    EXPECT_DOUBLE_EQ(box.GetMinX(), -1.0);
    EXPECT_DOUBLE_EQ(box.GetMaxX(), 101.0);
    EXPECT_DOUBLE_EQ(box.GetMinY(), -0.5);
    EXPECT_DOUBLE_EQ(box.GetMaxY(), 50.5);
}

namespace {

struct ErrorRow {
    int code;
    const wchar_t* message;
};

class RunErrors : public ::testing::TestWithParam<ErrorRow> {};

}  // namespace

// The error table, row by row; codes it does not name give the default message.
INSTANTIATE_TEST_SUITE_P(
    ErrorTable, RunErrors,
    ::testing::Values(ErrorRow{0, L""}, ErrorRow{-11, L""},
                      ErrorRow{-10, L"INITIALIZING REDUCE PARAMETERS ERROR!!!!"},
                      ErrorRow{-9, L"TRAVERSE STN LIST ERROR!!!!"},
                      ErrorRow{-8, L"TRAVERSE STN LESS THAN 2!!!!"},
                      ErrorRow{-7, L"NO TRAVERSE ROUTE DEFINE!!!!"},
                      ErrorRow{-6, L"FORWARD STN DOES NOT EXIST!!!!"},
                      ErrorRow{-5, L"OCC.STN DOES NOT EXIST!!!!"},
                      ErrorRow{-4, L"MEASUREMENT NOT AVERAGE!!!!"},
                      ErrorRow{-3, L"Route NOT FOUND!!!!"}, ErrorRow{-2, L"Save Survey Data File"},
                      ErrorRow{34701, L"Invalid angle-checking point !"},
                      ErrorRow{34702, L"Invalid or empty traverse route !"},
                      ErrorRow{1, L"Default Error Has Occurred!!!!"},
                      ErrorRow{-1, L"Default Error Has Occurred!!!!"},
                      ErrorRow{-12, L"Default Error Has Occurred!!!!"},
                      ErrorRow{34703, L"Default Error Has Occurred!!!!"}));

TEST_P(RunErrors, TheErrorTableNamesEachCode) {
    EXPECT_EQ(CError::MessageOf(GetParam().code), GetParam().message);
}

TEST_F(ReductionRun, ASecondRunOnOneEngineGivesTheSameResult) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\nPT ID=K1,E=1,N=2,H=3\nSTN ID=A,HI=1.5\n"
        L"XYZ ID=A,E=0,N=0,H=0\nBKB ID=B,BRG=0,HA=0\nSS ID=P,HA=90,VA=90,SD=10,HT=1.5\n"
        L"PT ID=K2,E=5,N=5,H=5\nSS ID=P,HA=90,VA=90,SD=12,HT=1.5\n");
    ASSERT_EQ(engine.Process(), 1);
    const UNeditPt first = Point(L"P");
    ASSERT_EQ(engine.Process(), 1);
    // Two measurements of P: a mean distance of 11 m, East of A.
    EXPECT_DOUBLE_EQ(Point(L"P").x, first.x);
    EXPECT_NEAR(first.x, 11.0, 1e-9);
    EXPECT_EQ(engine.GetStations().size(), 2u);  // A and the point-only node of P
}
