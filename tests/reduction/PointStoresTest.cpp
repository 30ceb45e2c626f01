#include "ReductionFixture.h"

using PointStores = ReductionFixture;

TEST_F(PointStores, ObservedPointsWinOverPointRecords) {
    engine.SavePoint(L"P", 1, 1, 1, L"OBS", 0, 0, 0);
    engine.SavePoint(L"P", 9, 9, 9, L"PT", 1, 2, 0);  // a PT record does not replace it
    EXPECT_DOUBLE_EQ(engine.SearchPt(L"P")->x, 1.0);
    engine.SavePoint(L"Q", 2, 2, 2, L"", 1, 2, 0);
    engine.SavePoint(L"Q", 3, 3, 3, L"", 1, 2, 0);  // a second PT record does
    EXPECT_DOUBLE_EQ(engine.SearchPt(L"Q")->x, 3.0);
    engine.SavePoint(L"Q", 4, 4, 4, L"", 0, 0, 1);  // an observation replaces a PT point
    EXPECT_FALSE(engine.SearchPt(L"Q")->IsPTRecord());
    EXPECT_TRUE(engine.SearchPt(L"Q")->IsPTInterpolated());
    engine.SavePoint(L"P", 5, 5, 5, L"  ", 0, 0, 0);  // an empty code keeps the old one
    EXPECT_EQ(engine.SearchPt(L"P")->GetCode(), L"OBS");
    EXPECT_EQ(engine.GetPointList().size(), 2u);
    EXPECT_EQ(engine.GetLastPoint()->GetID(), L"Q");
    std::wstring name;
    EXPECT_FALSE(engine.GetPtNameAt(7, name));
}

TEST_F(PointStores, LinesKeepTheirFirstDirectionAndTopoLinesGo) {
    const unsigned a = engine.SavePoint(L"A", 0, 0, 0, L"", 1, 0, 0);
    const unsigned b = engine.SavePoint(L"B", 0, 10, 0, L"", 1, 0, 0);
    const unsigned c = engine.SavePoint(L"C", 10, 10, 0, L"", 0, 0, 0);
    const unsigned d = engine.SavePoint(L"D", 10, 0, 0, L"", 0, 0, 0);
    EXPECT_EQ(engine.SaveLine(a, b, 1), 1);
    EXPECT_EQ(engine.SaveLine(b, a, 1), 1);
    ASSERT_EQ(engine.GetLineList().size(), 1u);
    EXPECT_EQ(engine.GetLineList()[0].GetFromPt(), L"A");
    EXPECT_EQ(engine.SaveLine(static_cast<unsigned>(-1), a, 1), 0);
    engine.SaveLine(b, c, 1);
    engine.SaveLine(c, d, 0);
    EXPECT_EQ(engine.GetLineIdx(L"D", L"C"), 2);
    EXPECT_EQ(engine.Check_In_LnList(L"D"), 1);
    engine.DeleteTopoLines();
    // C is still named by a station line; D was only on a code line.
    EXPECT_EQ(engine.GetLineList().size(), 2u);
    EXPECT_GE(engine.GetPointIdx(L"C"), 0);
    EXPECT_EQ(engine.GetPointIdx(L"D"), -1);
    EXPECT_EQ(engine.GetLineIdx(L"C", L"D"), -1);
}

TEST_F(PointStores, ArcsAboutACentreAreToldApartBySense) {
    const UNeditPt start(L"S", 0, 10, 0, L"", 0);
    const UNeditPt end(L"E", 10, 0, 0, L"", 0);
    const UNeditPt centre(L"O", 0, 0, 0, L"", 0);
    // From North round to East about the origin is a clockwise turn: no sense bit.
    EXPECT_EQ(engine.SaveArc(start, end, centre, 0), 0);
    EXPECT_EQ(engine.GetArcList()[0].GetArcType(), 0u);
    EXPECT_TRUE(engine.GetArcList()[0].IsClockwise());
    EXPECT_EQ(engine.SaveArc(end, start, centre, 0), 0);  // the same ends and centre: replaced
    EXPECT_EQ(engine.GetArcList()[0].GetArcType(), UWArc::kAnticlockwise);
    EXPECT_FALSE(engine.GetArcList()[0].IsClockwise());
    EXPECT_EQ(engine.GetArcList().size(), 1u);
}
