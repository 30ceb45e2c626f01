// Strings filed from codes and assembled into lines and arcs, over points of known
// coordinates. Every coordinate below is worked out by hand in the comments.

#include <gtest/gtest.h>

#include "CodeGeometryFake.h"
#include "codes/StringAssembly.h"
#include "codes/StringFiling.h"

namespace {

class StringWork : public ::testing::Test {
  protected:
    /// A point reduced at (e, n) with that code, filed as reduction files it.
    void Shot(const std::wstring& name, double e, double n, const std::wstring& code) {
        host.Put(name, e, n, code);
        filing.Arrange_SS_String(code, name);
    }
    void Assemble() {
        filing.ProcessOffsetStringPoints();
        assembly.ProcessString(filing.Strings(), {});
    }
    std::vector<std::wstring> StringOf(const std::wstring& strNo, const std::wstring& code) {
        for (const CStrNoList& string : filing.Strings()) {
            if (string.StrNo != strNo || string.Code != code) continue;
            std::vector<std::wstring> names;
            for (const CStrList& element : string.StrList) names.push_back(element.PtName);
            return names;
        }
        return {};
    }
    void ExpectAt(const std::wstring& name, double e, double n) {
        const UNeditPt& point = host.Named(name);
        EXPECT_NEAR(point.x, e, 1e-9) << std::string(name.begin(), name.end());
        EXPECT_NEAR(point.y, n, 1e-9) << std::string(name.begin(), name.end());
        EXPECT_TRUE(point.IsPTInterpolated());
    }

    USvyCodeCtrl ctrl;
    nedit::test::CodeGeometryFake host;
    nedit::StringFiling filing{ctrl, nullptr, host};
    nedit::StringAssembly assembly{ctrl, host};
};

TEST_F(StringWork, KerbWithATangentArc) {
    // A kerb runs East to B, turns left through a quarter circle to C and runs North.
    // The circle tangent to y = 0 at B(10, 0) and to x = 20 at C(20, 10) has its centre at
    // (10, 10) and radius 10; from B to C about it the arc turns anticlockwise.
    Shot(L"A", 0, 0, L"KB01");
    Shot(L"B", 10, 0, L"KB01*AS");
    Shot(L"C", 20, 10, L"KB01*AE");
    Shot(L"D", 20, 20, L"KB01");
    Assemble();
    EXPECT_TRUE(host.HasLine(L"A", L"B"));
    EXPECT_TRUE(host.HasLine(L"C", L"D"));
    EXPECT_FALSE(host.HasLine(L"B", L"C"));
    ASSERT_EQ(host.Arcs.size(), 1u);
    const UWArc& arc = host.Arcs[0];
    EXPECT_FALSE(arc.IsThreePoint());
    EXPECT_NEAR(arc.ComputeCentre().x, 10.0, 1e-9);
    EXPECT_NEAR(arc.ComputeCentre().y, 10.0, 1e-9);
    EXPECT_NEAR(arc.ComputeRadius(), 10.0, 1e-9);
    ExpectAt(L"CENTERB-C", 10, 10);
    EXPECT_EQ(host.Named(L"CENTERB-C").z, 0.0);
    EXPECT_EQ(host.Lines[0].Code, L"KB");
    EXPECT_EQ(host.Lines[0].String, L"KB01");
}

TEST_F(StringWork, ThreePointArcAndAClosedBuilding) {
    // B(10, 0), C(20, 10), D(30, 0) lie on the circle about (20, 0) of radius 10; over the
    // top from West to East the arc runs clockwise.
    Shot(L"A", 0, 0, L"KB02");
    Shot(L"B", 10, 0, L"KB02*AS");
    Shot(L"C", 20, 10, L"KB02");
    Shot(L"D", 30, 0, L"KB02*AE");
    Shot(L"E", 40, 0, L"KB02");
    // A building closed on its fourth corner.
    Shot(L"H1", 0, 50, L"BLD01");
    Shot(L"H2", 10, 50, L"BLD01");
    Shot(L"H3", 10, 55, L"BLD01");
    Shot(L"H4", 0, 55, L"BLD01*CLS");
    Assemble();
    ASSERT_EQ(host.Arcs.size(), 1u);
    const UWArc& arc = host.Arcs[0];
    EXPECT_TRUE(arc.IsThreePoint());
    EXPECT_NEAR(arc.ComputeCentre().x, 20.0, 1e-9);
    EXPECT_NEAR(arc.ComputeCentre().y, 0.0, 1e-9);
    EXPECT_NEAR(arc.ComputeRadius(), 10.0, 1e-9);
    EXPECT_TRUE(arc.IsClockwise());
    EXPECT_TRUE(host.HasLine(L"A", L"B"));
    EXPECT_TRUE(host.HasLine(L"D", L"E"));
    EXPECT_FALSE(host.HasLine(L"B", L"C"));
    EXPECT_FALSE(host.HasLine(L"C", L"D"));
    for (const auto& [a, b] :
         {std::pair{L"H1", L"H2"}, {L"H2", L"H3"}, {L"H3", L"H4"}, {L"H4", L"H1"}}) {
        EXPECT_TRUE(host.HasLine(a, b));
    }
    EXPECT_EQ(host.Lines.size(), 6u);
}

TEST_F(StringWork, ArcsThatFollowOnAndArcsLeftOpen) {
    // AS on B and D, AE on E: an arc B-C-D through C, then a tangent arc D-E.
    Shot(L"A", 0, 0, L"KB03");
    Shot(L"B", 10, 0, L"KB03*AS");
    Shot(L"C", 20, 10, L"KB03");
    Shot(L"D", 30, 0, L"KB03*AS");
    Shot(L"E", 40, -10, L"KB03*AE");
    Shot(L"F", 40, -20, L"KB03");
    // An arc opened and never closed, with one point after its mark: a straight line.
    Shot(L"P", 0, 100, L"FC01");
    Shot(L"Q", 10, 100, L"FC01*AS");
    Shot(L"R", 20, 100, L"FC01");
    // An arc end without a start: the string runs on straight, and the run says so.
    Shot(L"X", 0, 200, L"WL01");
    Shot(L"Y", 10, 200, L"WL01*AE");
    Assemble();
    ASSERT_EQ(host.Arcs.size(), 2u);
    EXPECT_TRUE(host.Arcs[0].IsThreePoint());
    EXPECT_FALSE(host.Arcs[1].IsThreePoint());
    EXPECT_TRUE(host.HasLine(L"E", L"F"));
    EXPECT_TRUE(host.HasLine(L"Q", L"R"));
    EXPECT_TRUE(host.HasLine(L"X", L"Y"));
    ASSERT_EQ(host.Notices.size(), 1u);
    EXPECT_NE(host.Notices[0].find(L"Y"), std::wstring::npos);
}

TEST_F(StringWork, StringsRunOnAndAreKeyedByNumberAndCode) {
    Shot(L"1", 0, 0, L"KB01");
    Shot(L"2", 5, 0, L"FE01 KB05");  // two groups: two strings
    Shot(L"3", 10, 0, L"kb01");
    Shot(L"4", 15, 0, L"TREE");  // no number, no job: no string geometry
    Shot(L"5", 20, 0, L"KB01");
    Assemble();
    EXPECT_EQ(StringOf(L"01", L"KB"), (std::vector<std::wstring>{L"1", L"3", L"5"}));
    EXPECT_EQ(StringOf(L"01", L"FE"), (std::vector<std::wstring>{L"2"}));
    EXPECT_EQ(StringOf(L"05", L"KB"), (std::vector<std::wstring>{L"2"}));
    EXPECT_TRUE(host.HasLine(L"1", L"3"));
    EXPECT_TRUE(host.HasLine(L"3", L"5"));
    EXPECT_EQ(host.Lines.size(), 2u);
    EXPECT_TRUE(filing.UndefinedCodes().empty());  // no library: nothing is undefined
}

TEST_F(StringWork, TwoPointRectangleOnEitherSide) {
    // Base from Q(0, 0) East to P(4, 0), width 3: positive widths lie to the right of the
    // base, here South. A minus sign puts the shed on the North side.
    Shot(L"Q", 0, 0, L"SH01");
    Shot(L"P", 4, 0, L"SH01*RECT3");
    Shot(L"Q2", 0, 20, L"SH02");
    Shot(L"P2", 4, 20, L"SH02*RECT*-3");
    Assemble();
    ExpectAt(L"RECT-P", 4, -3);
    ExpectAt(L"RECT-Q", 0, -3);
    ExpectAt(L"RECT-P2", 4, 23);
    ExpectAt(L"RECT-Q2", 0, 23);
    EXPECT_EQ(StringOf(L"01", L"SH"),
              (std::vector<std::wstring>{L"Q", L"P", L"RECT-P", L"RECT-Q", L"Q"}));
    EXPECT_EQ(host.Lines.size(), 8u);
    EXPECT_EQ(host.Named(L"RECT-P").GetCode(), L"SH01");
}

TEST_F(StringWork, RectangleCommandsThatMakeNothingSaySo) {
    Shot(L"A", 0, 0, L"SH03*RECT3");    // first point of its string
    Shot(L"B", 4, 0, L"SH03*RECT");     // no width
    Shot(L"C", 8, 0, L"SH03*RECT2,5");  // a width that is no number
    Assemble();
    EXPECT_EQ(StringOf(L"03", L"SH"), (std::vector<std::wstring>{L"A", L"B", L"C"}));
    EXPECT_EQ(host.Notices.size(), 3u);
}

TEST_F(StringWork, ThreePointRectangleSquareAndOffSquare) {
    // Base R(0, 0) to Q(4, 0); P(4, -3) is square to it and is the third corner; the fourth
    // is (0, -3).
    Shot(L"R", 0, 0, L"BLD02");
    Shot(L"Q", 4, 0, L"BLD02");
    Shot(L"P", 4, -3, L"BLD02*R3P");
    // P5(5, -3) is off the square: it gives the width 3 and leaves the string.
    Shot(L"R5", 0, 10, L"BLD03");
    Shot(L"Q5", 4, 10, L"BLD03");
    Shot(L"P5", 5, 7, L"BLD03*R3P");
    Assemble();
    EXPECT_EQ(StringOf(L"02", L"BLD"),
              (std::vector<std::wstring>{L"R", L"Q", L"P", L"RECT-R", L"R"}));
    ExpectAt(L"RECT-R", 0, -3);
    EXPECT_LT(host.PointIndex(L"RECT-Q"), 0);
    EXPECT_EQ(StringOf(L"03", L"BLD"),
              (std::vector<std::wstring>{L"R5", L"Q5", L"RECT-Q5", L"RECT-R5", L"R5"}));
    ExpectAt(L"RECT-Q5", 4, 7);
    ExpectAt(L"RECT-R5", 0, 7);
    EXPECT_GE(host.PointIndex(L"P5"), 0);
}

TEST_F(StringWork, OffsetFenceWithAChangeOfOffset) {
    // The fence F1(0, 0), F2(10, 0), F3(10, 10) turns North at F2; its twin lies 1.5 to the
    // right, then 2 at F3. First leg: y = -1.5 from (0, -1.5). Second leg: from (11.5, 0) to
    // (12, 10), x = 11.5 + 0.05 y, which meets y = -1.5 at x = 11.425.
    Shot(L"F1", 0, 0, L"FE01*OS1.5");
    Shot(L"F2", 10, 0, L"FE01*OS1.5");
    Shot(L"F3", 10, 10, L"FE01*OS 2");
    Shot(L"F4", 10, 20, L"FE01");  // ends the offset string
    Assemble();
    ExpectAt(L"OFFSET-F1", 0, -1.5);
    ExpectAt(L"OFFSET-F2", 11.425, -1.5);
    ExpectAt(L"OFFSET-F3", 12, 10);
    EXPECT_TRUE(host.HasLine(L"OFFSET-F1", L"OFFSET-F2"));
    EXPECT_TRUE(host.HasLine(L"OFFSET-F2", L"OFFSET-F3"));
    EXPECT_TRUE(host.HasLine(L"F3", L"F4"));
    EXPECT_FALSE(host.HasLine(L"OFFSET-F3", L"F4"));
}

TEST_F(StringWork, OffsetNamesAreMadeUniqueAndOnePointMakesNone) {
    host.Put(L"OFFSET-7", 99, 99);
    host.Put(L"OFFSET-7-1", 99, 99);
    Shot(L"7", 0, 0, L"FE02*OS1");
    Shot(L"8", 0, 10, L"FE02*OS1");
    Shot(L"9", 50, 50, L"FE03*OS1");  // another string closes FE02 and stands alone
    Assemble();
    // Straight North: the twins lie 1 to the East.
    ExpectAt(L"OFFSET-7-1-2", 1, 0);
    ExpectAt(L"OFFSET-8", 1, 10);
    EXPECT_LT(host.PointIndex(L"OFFSET-9"), 0);
    EXPECT_EQ(host.Notices.size(), 1u);
}

TEST(ArcCentre, TangentsThatCannotBothHoldAreProjectedOntoTheBisector) {
    UWPoint centre;
    // Legs in line with the chord: the normals are parallel.
    EXPECT_FALSE(nedit::StringAssembly::Calc_Arc_Center({0, 0}, {10, 0}, {20, 0}, {30, 0}, centre));
    // Incoming East at B(10, 0), outgoing North at C(20, 5): the normals x = 10 and y = 5
    // meet at (10, 5), 10 from B but 10 from C too only on the bisector of the chord B-C.
    // The bisector runs through (15, 2.5) along (-5, 10)/|..|; (10, 5) lies at distance
    // ((10-15)(-5) + (5-2.5)(10)) / sqrt(125) = 50 / sqrt(125) along it, at (13, 6.5).
    ASSERT_TRUE(nedit::StringAssembly::Calc_Arc_Center({0, 0}, {10, 0}, {20, 5}, {20, 20}, centre));
    EXPECT_NEAR(centre.x, 13.0, 1e-9);
    EXPECT_NEAR(centre.y, 6.5, 1e-9);
}

}  // namespace
