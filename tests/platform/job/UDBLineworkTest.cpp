#include <gtest/gtest.h>

#include "JobTestSupport.h"
#include "platform/geometry/UWRect.h"
#include "platform/job/UDBArc.h"
#include "platform/job/UDBCircle.h"
#include "platform/job/UDBLine.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/UDBPolyLine.h"
#include "platform/job/USVSelectionList.h"

using namespace nedit;

class Linework : public nedit::test::JobTest {
  protected:
    long Point(const std::wstring& name, double east, double north) {
        UDBPoint point(job.get(), UWPoint(east, north, 0.0));
        point.SetName(name);
        EXPECT_TRUE(point.Save());
        return point.GetId();
    }
};

TEST_F(Linework, LinesAndArcsCarryTheirKindAndAreFoundAtTheirPoints) {
    const long a = Point(L"A", 0, 0);
    const long b = Point(L"B", 10, 0);
    const long c = Point(L"C", 10, 10);

    UDBLine line(job.get());
    line.SetPoints(b, a);  // stored from B: found at A all the same
    line.SetLineStyle(job->LineTypeIndex(L"DASHED"));
    line.SetThickness(job->LineThicknessIndex(L"0.35"));
    line.SetFlags(UDBObject::kUseInSurface);
    ASSERT_TRUE(line.Save());
    EXPECT_EQ(ObjectKindOf(line.GetId()), kLineKind);
    EXPECT_EQ(static_cast<unsigned long>(line.GetId()) >> 26, 2u);

    UDBArc arc(job.get());
    arc.SetPoints(a, c, b);
    arc.SetArcType(2);
    ASSERT_TRUE(arc.Save());
    EXPECT_EQ(ObjectKindOf(arc.GetId()), kArcKind);

    USVSelectionList lines(job.get());
    EXPECT_EQ(job->EnumerateLines(nullptr, lines, UWPoint(0, 0, 0), nullptr, 0x1500000), 1);
    EXPECT_EQ(lines.First(), line.GetId());
    EXPECT_EQ(lines.Next(), 0);
    USVSelectionList none(job.get());
    EXPECT_EQ(job->EnumerateLines(nullptr, none, UWPoint(10, 10, 0)), 0);
    EXPECT_EQ(job->EnumerateLines(nullptr, none, UWPoint(0.001, 0, 0)), 0);
    USVSelectionList arcs(job.get());
    EXPECT_EQ(job->EnumerateArcs(nullptr, arcs, UWPoint(10, 10, 0)), 1);
    // The centre of an arc is no end of it.
    EXPECT_EQ(job->EnumerateArcs(nullptr, arcs, UWPoint(10, 0, 0)), 0);

    const UDBLine loadedLine(job.get(), line.GetId());
    EXPECT_EQ(loadedLine.GetStartPointId(), b);
    EXPECT_EQ(loadedLine.GetEndPointId(), a);
    EXPECT_EQ(job->LineTypeName(loadedLine.GetLineStyle()), L"DASHED");
    EXPECT_EQ(job->LineThicknessName(loadedLine.GetThickness()), L"0.35");
    EXPECT_EQ(loadedLine.GetFlags(), UDBObject::kUseInSurface);
    const UDBArc loadedArc(job.get(), arc.GetId());
    EXPECT_EQ(loadedArc.GetThirdPointId(), b);
    EXPECT_EQ(loadedArc.GetArcType(), 2);

    // What the schema refuses comes back as false, and nothing is stored.
    UDBLine same(job.get());
    same.SetPoints(a, a);
    EXPECT_FALSE(same.Save());
    UDBLine dangling(job.get());
    dangling.SetPoints(a, b + 99);
    EXPECT_FALSE(dangling.Save());
    UDBArc flat(job.get());
    flat.SetPoints(a, b, a);
    EXPECT_FALSE(flat.Save());
    UDBCircle nothing(job.get());
    nothing.SetCentreId(a);
    nothing.SetRadius(0.0);
    EXPECT_FALSE(nothing.Save());
    nothing.SetRadius(2.5);
    ASSERT_TRUE(nothing.Save());
    EXPECT_EQ(ObjectKindOf(nothing.GetId()), kCircleKind);
    EXPECT_EQ(UDBCircle(job.get(), nothing.GetId()).GetRadius(), 2.5);
    auto lineCount = job->Database().Query("SELECT count(*) FROM line");
    ASSERT_TRUE(lineCount->Step());
    EXPECT_EQ(lineCount->Int(0), 1);

    // A point in use cannot be deleted behind its lines' backs.
    EXPECT_THROW(job->Database().Query("DELETE FROM point WHERE id = ?")->Bind(1, a).Run(),
                 JobError);
}

TEST_F(Linework, PolylinesKeepTheirVerticesAndAReplacedOneKeepsItsIdentifier) {
    const long a = Point(L"A", 0, 0);
    const long b = Point(L"B", 10, 0);
    const long c = Point(L"C", 10, 10);
    const long d = Point(L"D", 50, 50);

    UDBPolyLine poly(job.get());
    poly.SetName(L"FNC01");
    poly.Add({0.0, b});
    EXPECT_FALSE(poly.Save());  // one vertex is no line
    poly.Add({0.25, c});        // the last vertex's bulge is dropped on saving
    poly.AddVertexAt(0, {0.5, a});
    ASSERT_TRUE(poly.Save());
    EXPECT_EQ(ObjectKindOf(poly.GetId()), kPolylineKind);

    UDBPolyLine loaded(job.get(), poly.GetId());
    ASSERT_EQ(loaded.GetCount(), 3);
    EXPECT_EQ(loaded.GetIdAt(0), a);
    EXPECT_EQ(loaded.GetAt(0).Bulge, 0.5);
    EXPECT_EQ(loaded.GetIdAt(2), c);
    EXPECT_EQ(loaded.GetAt(2).Bulge, 0.0);
    EXPECT_EQ(loaded.GetIdAt(3), 0);
    EXPECT_EQ(loaded.GetName(), L"FNC01");

    // Replacing: the new polyline takes the old one's identifier and is assigned to it.
    UDBPolyLine replacement(job.get());
    replacement.SetName(L"FNC01");
    replacement.Add({0.0, c});
    replacement.Add({0.0, d});
    ASSERT_TRUE(loaded.ReleaseLinkage());
    replacement.SetId(loaded.GetId());
    loaded = replacement;
    ASSERT_TRUE(loaded.Save(4, false, false));
    ASSERT_TRUE(loaded.AddLinkage());
    EXPECT_EQ(loaded.GetId(), poly.GetId());
    EXPECT_EQ(UDBPolyLine(job.get(), poly.GetId()).GetCount(), 2);

    UDBPolyLine twin(job.get());  // a second polyline of the same name is allowed
    twin.SetName(L"FNC01");
    twin.Add({0.0, a});
    twin.Add({0.0, b});
    ASSERT_TRUE(twin.Save());

    UDBPolyLine walk(job.get());
    EXPECT_EQ(walk.Enumerate(UWRect(0, 0, 0, 0), 0x500000), 2);
    EXPECT_EQ(walk.Next(), poly.GetId());
    EXPECT_EQ(walk.GetCount(), 2);
    EXPECT_EQ(walk.Next(), twin.GetId());
    EXPECT_EQ(walk.Next(), 0);
    // Only the polyline with a vertex in the area.
    EXPECT_EQ(walk.Enumerate(UWRect(40, 40, 60, 60)), 1);
    EXPECT_EQ(walk.Next(), poly.GetId());

    UDBPolyLine broken(job.get());
    broken.Add({0.0, a});
    broken.Add({0.0, d + 100});
    EXPECT_FALSE(broken.Save());
    EXPECT_EQ(broken.GetId(), 0);
}

// The line between two points and the arc on three, as a transfer looks them up: in either
// direction, the first of several, and an arc only with its own third point. Attributes
// replaced by none go.
TEST_F(Linework, LineBetweenAndArcOnTheirPointsAndAttributesReplacedByNone) {
    const long a = Point(L"A", 0, 0);
    const long b = Point(L"B", 10, 0);
    const long c = Point(L"C", 5, 5);
    EXPECT_EQ(job->GetLineBetween(a, b), 0);
    UDBLine first(job.get());
    first.SetPoints(b, a);
    ASSERT_TRUE(first.Save());
    UDBLine second(job.get());
    second.SetPoints(a, b);
    ASSERT_TRUE(second.Save());
    EXPECT_EQ(job->GetLineBetween(a, b), first.GetId());
    EXPECT_EQ(job->GetLineBetween(b, a), first.GetId());
    EXPECT_EQ(job->GetLineBetween(a, c), 0);
    UDBArc arc(job.get());
    arc.SetPoints(a, b, c);
    ASSERT_TRUE(arc.Save());
    EXPECT_EQ(job->GetArcOn(b, a, c), arc.GetId());
    EXPECT_EQ(job->GetArcOn(a, c, b), 0);

    struct Attribute {
        std::wstring Name, Type, Value;
    };
    ASSERT_TRUE(
        first.AddAttributeObjectData(std::vector<Attribute>{{L"KIND", L"", L"KERB"}}, true));
    ASSERT_EQ(first.GetAttributes().size(), 1u);
    ASSERT_TRUE(first.AddAttributeObjectData(std::vector<Attribute>{}, false));
    EXPECT_EQ(first.GetAttributes().size(), 1u);
    ASSERT_TRUE(first.AddAttributeObjectData(std::vector<Attribute>{}, true));
    EXPECT_TRUE(first.GetAttributes().empty());
}
