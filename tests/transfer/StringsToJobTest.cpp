// Strings into polylines: chains of lines and arcs with bulges worked by hand, closed figures,
// a polyline of the same name replaced or kept, and strings the rules lose, named.

#include <cmath>

#include "TransferFixture.h"
#include "codes/ArcStore.h"
#include "transfer/UOverridePolyDlg.h"

using namespace nedit;
using namespace nedit::test;

namespace {

// tan(90 / 4 degrees): the bulge of a quarter circle.
const double kQuarter = std::sqrt(2.0) - 1.0;

class StringsToJobTest : public TransferTest {
  protected:
    // A kerb: east from A to B, a quarter circle left about (10,10) to C, north to D.
    void Kerb(const std::wstring& string = L"KB01") {
        Point(L"A", 0, 0, 10.0, L"KB01");
        Point(L"B", 10, 0, 10.0, L"KB01");
        Point(L"C", 20, 10, 10.0, L"KB01");
        Point(L"D", 20, 20, 10.0, L"KB01");
        Point(L"CENTERB-C", 10, 10, 0.0, L"KB01");
        Line(L"A", L"B", L"KB", string);
        // The arc store gives the sense: from B to C about the centre is anticlockwise.
        ArcStore store;
        store.Save(Find(L"B"), Find(L"C"), Find(L"CENTERB-C"), 0);
        ASSERT_EQ(store.Items().front().GetArcType(), UWArc::kAnticlockwise);
        arcs.push_back(store.Items().front());
        arcs.back().SetCode(L"KB");
        arcs.back().SetStringNo(string);
        Line(L"C", L"D", L"KB", string);
    }
    // A building, closed back on its first corner.
    void Building() {
        Point(L"P1", 100, 100, 10.0, L"BLD01");
        Point(L"P2", 110, 100, 10.0, L"BLD01");
        Point(L"P3", 110, 108, 10.0, L"BLD01");
        Point(L"P4", 100, 108, 10.0, L"BLD01");
        Line(L"P1", L"P2", L"BLD", L"BLD01");
        Line(L"P2", L"P3", L"BLD", L"BLD01");
        Line(L"P3", L"P4", L"BLD", L"BLD01");
        Line(L"P4", L"P1", L"BLD", L"BLD01");
    }
};

}  // namespace

// The kerb is one polyline A, B, C, D. Its segment from B bends left through a quarter circle
// of radius 10: chord 10 sqrt 2 = 2 r sin(angle / 2) gives the angle 90 degrees, bulge
// tan(90 / 4) = sqrt 2 - 1, negative as the arc turns anticlockwise. The centre is no vertex.
TEST_F(StringsToJobTest, KerbWithTangentArcIsOnePolylineWithItsBulge) {
    Kerb();
    ASSERT_EQ(Transfer(), 1);
    const std::vector<UDBPolyLine> kerb = Polylines(L"KB01");
    ASSERT_EQ(kerb.size(), 1u);
    EXPECT_EQ(VertexNames(kerb[0]), (std::vector<std::wstring>{L"A", L"B", L"C", L"D"}));
    const std::vector<UVertex>& v = kerb[0].GetVertices();
    EXPECT_EQ(v[0].Bulge, 0.0);
    EXPECT_NEAR(v[1].Bulge, -kQuarter, 1e-12);
    EXPECT_NEAR(v[1].Bulge, -std::tan(std::asin(std::sqrt(200.0) / 20.0) / 2.0), 1e-12);
    EXPECT_EQ(v[2].Bulge, 0.0);
    EXPECT_EQ(v[3].Bulge, 0.0);
    // The string's look comes from its code: layer KERB, line colour 4.
    EXPECT_EQ(kerb[0].GetLayer(), job->GetLayerId(L"KERB"));
    EXPECT_EQ(kerb[0].GetColour(), 4);
    // Its pieces went into the polyline, not into the job as lines and arcs of their own.
    EXPECT_EQ(Count("line"), 0);
    EXPECT_EQ(Count("arc"), 0);
    EXPECT_EQ(report.PolylinesAdded, 1);
    EXPECT_TRUE(report.Left.empty());
}

// Seeded from its end (C-D is its first line), the kerb grows at its head through the arc:
// B, C, D; the line A-B would attach at the head only, so the string is given up after more
// than three passes without growth, and the report names it. The kerb's name comes up again
// for its arcs, and the line left over makes a polyline of its own.
TEST_F(StringsToJobTest, LineThatWouldAttachAtTheHeadOnlyLosesTheStringAndSaysSo) {
    Kerb();
    std::swap(lines[0], lines[1]);
    ASSERT_EQ(Transfer(), 1);
    const std::vector<UDBPolyLine> kerb = Polylines(L"KB01");
    ASSERT_EQ(kerb.size(), 1u);
    EXPECT_EQ(VertexNames(kerb[0]), (std::vector<std::wstring>{L"A", L"B"}));
    ASSERT_EQ(report.Left.size(), 1u);
    EXPECT_EQ(report.Left[0].Kind, L"string");
    EXPECT_EQ(report.Left[0].Name, L"KB01");
    EXPECT_NE(report.Left[0].Reason.find(L"1 of its lines and arcs do not join"),
              std::wstring::npos);
    EXPECT_TRUE(Told(L"Not written to the job:\nstring KB01: 1 of its lines"));
}

// A three-point arc is split at its middle point: a half circle from S over T to E gives two
// clockwise quarter circles, each of bulge sqrt 2 - 1.
TEST_F(StringsToJobTest, ThreePointArcIsSplitAtItsMiddlePoint) {
    Point(L"S", 0, 0, 1.0, L"KB02");
    Point(L"T", 5, 5, 1.0, L"KB02");
    Point(L"E", 10, 0, 1.0, L"KB02");
    Point(L"F", 10, -5, 1.0, L"KB02");
    Arc(L"S", L"E", L"T", UWArc::kThirdOnArc, L"KB", L"KB02");
    Line(L"E", L"F", L"KB", L"KB02");
    ASSERT_EQ(Transfer(), 1);
    const std::vector<UDBPolyLine> kerb = Polylines(L"KB02");
    ASSERT_EQ(kerb.size(), 1u);
    EXPECT_EQ(VertexNames(kerb[0]), (std::vector<std::wstring>{L"S", L"T", L"E", L"F"}));
    EXPECT_NEAR(kerb[0].GetAt(0).Bulge, kQuarter, 1e-9);
    EXPECT_NEAR(kerb[0].GetAt(1).Bulge, kQuarter, 1e-9);
    EXPECT_EQ(kerb[0].GetAt(2).Bulge, 0.0);
}

// A closed building ends on its first corner; a string with one line only is two vertices.
TEST_F(StringsToJobTest, ClosedBuildingAndStringOfOneLine) {
    Building();
    Point(L"G1", 50, 50, 1.0, L"KB09");
    Point(L"G2", 60, 50, 1.0, L"KB09");
    Line(L"G1", L"G2", L"KB", L"KB09");
    ASSERT_EQ(Transfer(), 1);
    const std::vector<UDBPolyLine> building = Polylines(L"BLD01");
    ASSERT_EQ(building.size(), 1u);
    EXPECT_EQ(VertexNames(building[0]),
              (std::vector<std::wstring>{L"P1", L"P2", L"P3", L"P4", L"P1"}));
    for (const UVertex& vertex : building[0].GetVertices()) EXPECT_EQ(vertex.Bulge, 0.0);
    EXPECT_EQ(building[0].GetLayer(), job->GetLayerId(L"BUILDING"));
    ASSERT_EQ(Polylines(L"KB09").size(), 1u);
    EXPECT_EQ(Polylines(L"KB09")[0].GetCount(), 2);
}

// A string replaced keeps its identifier; answered "No" a second polyline of the name is
// made; "Apply to All" with Yes replaces every later string without asking.
TEST_F(StringsToJobTest, StringReplacedKeepsItsIdentifierOrIsKeptBeside) {
    Kerb();
    Building();
    ASSERT_EQ(Transfer(), 1);
    const long kerbId = Polylines(L"KB01")[0].GetId();
    int asked = 0;
    host.SetFace<UOverridePolyDlg>([&](UOverridePolyDlg& dialog) {
        ++asked;
        EXPECT_EQ(dialog.GetMessage(), L"String " + dialog.GetName() +
                                           L" is in the database, do you want to override it?");
        return dialog.OnNo();
    });
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(asked, 2);
    ASSERT_EQ(Polylines(L"KB01").size(), 2u);
    EXPECT_EQ(Polylines(L"BLD01").size(), 2u);
    const long secondKerbId = Polylines(L"KB01")[1].GetId();

    // Yes with "Apply to All": asked once, and the highest of each name is replaced in place.
    asked = 0;
    host.SetFace<UOverridePolyDlg>([&](UOverridePolyDlg& dialog) {
        ++asked;
        dialog.ApplyAll = true;
        return dialog.OnYes();
    });
    points[1].x = 10.5;  // B moved: the kerb's vertex B and its bulge follow
    AnswerDuplicates(DuplicatePtsDlg::kOverwrite);
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(asked, 1);
    const std::vector<UDBPolyLine> kerbs = Polylines(L"KB01");
    ASSERT_EQ(kerbs.size(), 2u);
    EXPECT_EQ(kerbs[0].GetId(), kerbId);
    EXPECT_NEAR(kerbs[0].GetAt(1).Bulge, -kQuarter, 1e-12);  // kept as it was
    EXPECT_EQ(kerbs[1].GetId(), secondKerbId);
    // About the centre (10,10) from B (10.5,0) round to C (20,10): atan2(-10, 0.5) is
    // -87.1376 degrees, so the arc sweeps 87.1376 anticlockwise; bulge -tan(87.1376 / 4).
    EXPECT_NEAR(kerbs[1].GetAt(1).Bulge, -0.39965564344570076, 1e-12);
    EXPECT_EQ(report.PolylinesReplaced, 2);
    EXPECT_EQ(report.PolylinesAdded, 0);
    EXPECT_EQ(Count("polyline"), 4);
}

// Lost strings are named: one with a gap, one closed twice (the second closing cannot attach
// to the first closing's end), and one whose point did not reach the job.
TEST_F(StringsToJobTest, LostStringsAreNamedWithTheirReason) {
    Point(L"X1", 0, 0, 1.0);
    Point(L"X2", 1, 0, 1.0);
    Point(L"X3", 5, 0, 1.0);
    Point(L"X4", 6, 0, 1.0);
    Line(L"X1", L"X2", L"KB", L"KB05");
    Line(L"X3", L"X4", L"KB", L"KB05");
    Point(L"Y1", 0, 10, 1.0);
    Point(L"Y2", 5, 10, 1.0);
    Point(L"Y3", 5, 15, 1.0);
    Point(L"Y4", 10, 15, 1.0);
    Line(L"Y1", L"Y2", L"BLD", L"BLD07");
    Line(L"Y2", L"Y3", L"BLD", L"BLD07");
    Line(L"Y3", L"Y1", L"BLD", L"BLD07");  // closed
    Line(L"Y3", L"Y4", L"BLD", L"BLD07");  // and on from the corner before
    Point(L"Z1", 30, 30, 1.0);
    lines.push_back(UNeditLine(Find(L"Z1"), UNeditPt(L"Z9", 31, 31, 1, L"", 0)));
    lines.back().SetCode(L"KB");
    lines.back().SetStringNo(L"KB06");
    ASSERT_EQ(Transfer(), 1);
    EXPECT_TRUE(Polylines(L"KB05").empty());
    EXPECT_TRUE(Polylines(L"BLD07").empty());
    EXPECT_TRUE(Polylines(L"KB06").empty());
    std::map<std::wstring, std::wstring> lost;
    for (const NotWritten& left : report.Left) lost[left.Name] = left.Reason;
    EXPECT_NE(lost[L"KB05"].find(L"do not join its chain"), std::wstring::npos);
    EXPECT_NE(lost[L"BLD07"].find(L"1 of its lines and arcs do not join"), std::wstring::npos);
    EXPECT_EQ(lost[L"KB06"], L"point Z9 is not in the job");
    EXPECT_TRUE(
        Told(L"String KB06 could not be created because some vertices were not found "
             L"in the database."));
    // The job keeps the record of the transfer, with what it left out.
    const std::vector<TransferRecord> records = ReadTransfers(job->Database());
    ASSERT_EQ(records.size(), 1u);
    EXPECT_EQ(records[0].Source, L"SITE");
    EXPECT_TRUE(records[0].Complete);
    EXPECT_EQ(records[0].Points, 9);
    EXPECT_EQ(records[0].Polylines, 0);
    ASSERT_EQ(records[0].Left.size(), 3u);
    EXPECT_EQ(records[0].Left[2].Reason, L"point Z9 is not in the job");
    EXPECT_EQ(records[0].MadeAt.size(), 20u);  // 2026-11-23T17:13:15Z
}

// Awkward input: a string of 100,000 vertices, a three-point arc on a straight line (bulges 0),
// a line of no length, and a layer name of 255 characters.
TEST_F(StringsToJobTest, LongStraightAndEmptyStringsAndALongLayerName) {
    constexpr int kLong = 100000;
    points.reserve(kLong + 8);
    for (int i = 0; i < kLong; ++i) Point(L"L" + std::to_wstring(i), i * 0.5, 0.0, 1.0);
    for (std::size_t i = 1; i < kLong; ++i) Line(points[i - 1], points[i], L"KB", L"KB99");
    Point(L"S", 0, 10, 1.0);
    Point(L"T", 5, 10, 1.0);
    Point(L"E", 10, 10, 1.0);
    Arc(L"S", L"E", L"T", UWArc::kThirdOnArc, L"KB", L"KB98");
    Point(L"Q1", 3, 3, 1.0);
    Point(L"Q2", 3, 3, 1.0);
    Line(L"Q1", L"Q2", L"LONG", L"KB97");
    USvyCode longLayer = Code(L"LONG", std::wstring(255, L'L'), 1);
    job->GetJobCodeLibrary()->SetSvyCode(longLayer);
    ASSERT_EQ(Transfer(), 1);
    ASSERT_EQ(Polylines(L"KB99").size(), 1u);
    EXPECT_EQ(Polylines(L"KB99")[0].GetCount(), kLong);
    const std::vector<UDBPolyLine> straight = Polylines(L"KB98");
    ASSERT_EQ(straight.size(), 1u);
    EXPECT_EQ(VertexNames(straight[0]), (std::vector<std::wstring>{L"S", L"T", L"E"}));
    EXPECT_EQ(straight[0].GetAt(0).Bulge, 0.0);
    EXPECT_EQ(straight[0].GetAt(1).Bulge, 0.0);
    const std::vector<UDBPolyLine> empty = Polylines(L"KB97");
    ASSERT_EQ(empty.size(), 1u);
    EXPECT_EQ(empty[0].GetCount(), 2);
    EXPECT_EQ(empty[0].GetLayer(), job->GetLayerId(std::wstring(255, L'L')));
    EXPECT_TRUE(report.Left.empty());
}
