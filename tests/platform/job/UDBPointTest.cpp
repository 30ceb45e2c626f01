#include <gtest/gtest.h>

#include <limits>

#include "JobTestSupport.h"
#include "platform/job/UDBLayer.h"
#include "platform/job/UDBPoint.h"
#include "platform/text/WideText.h"

using namespace nedit;
using UDBPointTest = nedit::test::JobTest;

namespace {

struct Attribute {  // any type with these members will do
    std::wstring Name, Type, Value;
};
struct Image {
    std::wstring FileName;
    double Number1, Number2;
};

}  // namespace

TEST_F(UDBPointTest, EveryFieldRoundTripsAndNoHeightIsStoredAsNull) {
    UDBLayer layer(job.get(), L"TREES");
    ASSERT_TRUE(layer.Save());
    UDBPoint point(job.get(), UWPoint(1000.125, 2000.5, UWPoint::kNoHeight));
    point.SetName(L"Zürich, \"7\"");
    point.SetCode(L"TREE*OS 2.5");
    point.SetLayer(layer.GetId());
    point.SetColour(3);
    point.SetPointMark(5);
    point.SetSymbol(job->SymbolIndex(L"TREE"));
    point.SetSymbolValues(2.0, 0.5, 45.0);
    point.SetFlags(0x4000 | UDBObject::kUseInSurface);
    point.SetStatus(UDBPoint::kStatusTransferred);
    point.SetPointNote(L"under the oak");
    ASSERT_TRUE(point.Save()) << ToUtf8(point.LastError());
    EXPECT_EQ(ObjectKindOf(point.GetId()), kPointKind);

    Reopen();
    const long id = job->GetPointId(UPointNumber(L"Zürich, \"7\""));
    ASSERT_EQ(id, point.GetId());
    UDBPoint loaded(job.get(), 0);
    ASSERT_TRUE(loaded.Load(id));
    EXPECT_EQ(loaded.GetName(), L"Zürich, \"7\"");
    EXPECT_EQ(loaded.GetEast(), 1000.125);
    EXPECT_EQ(loaded.GetNorth(), 2000.5);
    EXPECT_EQ(loaded.GetHeight(), -10000.0);
    EXPECT_FALSE(loaded.HasHeight());
    EXPECT_EQ(loaded.GetCode(), L"TREE*OS 2.5");
    EXPECT_EQ(loaded.GetLayer(), layer.GetId());
    EXPECT_EQ(loaded.GetColour(), 3);
    EXPECT_EQ(loaded.GetPointMark(), 5);
    EXPECT_EQ(job->SymbolName(loaded.GetSymbol()), L"TREE");
    EXPECT_EQ(loaded.GetSymbolValue(1), 2.0);
    EXPECT_EQ(loaded.GetSymbolValue(3), 45.0);
    EXPECT_EQ(loaded.GetFlags(), 0x4010u);
    EXPECT_EQ(loaded.GetStatus(), 1u);
    EXPECT_EQ(loaded.GetPointNote(), L"under the oak");
    auto height = job->Database().Query("SELECT height IS NULL FROM point WHERE id = ?");
    height->Bind(1, id);
    ASSERT_TRUE(height->Step());
    EXPECT_EQ(height->Int(0), 1);

    // A height, then none again.
    loaded.SetHeight(12.25);
    ASSERT_TRUE(loaded.Save());
    EXPECT_EQ(UDBPoint(job.get(), id).GetHeight(), 12.25);
    loaded.ClearHeight();
    ASSERT_TRUE(loaded.Save());
    EXPECT_EQ(UDBPoint(job.get(), id).GetHeight(), -10000.0);

    // Another kind's identifier, or none, loads nothing and leaves the object as it was.
    EXPECT_FALSE(loaded.Load(static_cast<long>((2L << 26) + 1)));
    EXPECT_FALSE(loaded.Load(id + 1000));
    EXPECT_EQ(loaded.GetId(), id);
    loaded.ReInit();
    EXPECT_EQ(loaded.GetId(), 0);
    EXPECT_EQ(loaded.GetName(), L"");
}

TEST_F(UDBPointTest, NamesAreUniqueAndCompareExactly) {
    UDBPoint lower(job.get(), UWPoint(1, 1, 0));
    lower.SetName(L"p1");
    ASSERT_TRUE(lower.Save());
    UDBPoint upper(job.get(), UWPoint(2, 2, 0));
    upper.SetName(L"P1");
    ASSERT_TRUE(upper.Save());
    EXPECT_NE(lower.GetId(), upper.GetId());
    EXPECT_EQ(job->GetPointId(UPointNumber(L"p1")), lower.GetId());
    EXPECT_EQ(job->GetPointId(UPointNumber(L"P1 ")), 0);
    EXPECT_EQ(job->GetPointId(UPointNumber(L"")), 0);

    UDBPoint twin(job.get(), UWPoint(3, 3, 0));
    twin.SetName(L"P1");
    EXPECT_FALSE(twin.Save());
    EXPECT_FALSE(twin.LastError().empty());
    EXPECT_EQ(twin.GetId(), 0);
    twin.SetName(L"  ");
    EXPECT_FALSE(twin.Save());
    twin.SetName(L"P2");
    twin.SetLayer(4242);  // no such layer
    EXPECT_FALSE(twin.Save());
    EXPECT_EQ(job->GetPointId(UPointNumber(L"P2")), 0);
}

TEST_F(UDBPointTest, CoordinatesThatAreNotFiniteNumbersNeverReachTheJob) {
    const double infinity = std::numeric_limits<double>::infinity();
    const double nan = std::numeric_limits<double>::quiet_NaN();
    for (const UWPoint& bad : {UWPoint(infinity, 1, 0), UWPoint(1, -infinity, 0),
                               UWPoint(nan, 1, 0), UWPoint(1, 1, infinity), UWPoint(1, 1, nan)}) {
        UDBPoint point(job.get(), bad);
        point.SetName(L"OVERFLOW");
        EXPECT_FALSE(point.Save());
        EXPECT_EQ(point.LastError(), L"The coordinates of point OVERFLOW are not finite numbers.");
    }
    EXPECT_EQ(job->GetPointId(UPointNumber(L"OVERFLOW")), 0);
    UDBPoint none(job.get(), UWPoint(1, 1, UWPoint::kNoHeight));
    none.SetName(L"NO HEIGHT");
    EXPECT_TRUE(none.Save());
}

TEST_F(UDBPointTest, ALockedPointIsSavedOnlyAfterUnlocking) {
    UDBPoint point(job.get(), UWPoint(10, 20, 30));
    point.SetName(L"CTRL");
    point.SetFlags(0x800);
    ASSERT_TRUE(point.Save());
    ASSERT_TRUE(point.Lock());
    EXPECT_TRUE(UDBPoint(job.get(), point.GetId()).IsLocked());

    UDBPoint other(job.get(), point.GetId());
    other.SetEast(99);
    EXPECT_FALSE(other.Save());  // the stored point is locked
    ASSERT_TRUE(other.UnLock());
    ASSERT_TRUE(other.Save());
    ASSERT_TRUE(other.Lock());
    const UDBPoint stored(job.get(), point.GetId());
    EXPECT_EQ(stored.GetEast(), 99.0);
    EXPECT_EQ(stored.GetFlags(), 0x800u | UDBObject::kLocked);
}

TEST_F(UDBPointTest, AttributesImagesNotesAndSymbolsHangOnThePointAndGoWithIt) {
    UDBPoint point(job.get(), UWPoint(5, 6, 7));
    point.SetName(L"MH1");
    EXPECT_FALSE(
        point.AddAttributeObjectData(std::vector<Attribute>{{L"DEPTH", L"R", L"2.1"}}, false));
    ASSERT_TRUE(point.Save());

    ASSERT_TRUE(point.AddAttributeObjectData(
        std::vector<Attribute>{{L"DEPTH", L"R", L"2.1"}, {L"LID", L"T", L"cast iron"}}, true, true,
        true));
    ASSERT_TRUE(
        point.AddAttributeObjectData(std::vector<Attribute>{{L"PIPES", L"I", L"3"}}, false));
    EXPECT_FALSE(point.AddAttributeObjectData(std::vector<Attribute>{{L"", L"T", L"x"}}, false));
    auto attributes = point.GetAttributes();
    ASSERT_EQ(attributes.size(), 3u);
    EXPECT_EQ(attributes[1].Value, L"cast iron");
    ASSERT_TRUE(
        point.AddAttributeObjectData(std::vector<Attribute>{{L"DEPTH", L"R", L"2.2"}}, true));
    ASSERT_EQ(point.GetAttributes().size(), 1u);

    dir.Write("mh1.jpg", "jpeg");
    EXPECT_FALSE(point.AttachImageFiles(std::vector<Image>{{L"missing.jpg", 0, 0}}, false,
                                        FromUtf8(dir.Path())));
    ASSERT_TRUE(point.AttachImageFiles(std::vector<Image>{{L"mh1.jpg", 1.5, 2.5}}, false,
                                       FromUtf8(dir.Path())));
    ASSERT_EQ(point.GetImages().size(), 1u);
    EXPECT_EQ(point.GetImages()[0].FileName, FromUtf8(dir.File("mh1.jpg")));
    EXPECT_EQ(point.GetImages()[0].Number2, 2.5);

    ASSERT_TRUE(point.SaveExtendedData(L"first", UDBObject::kNoteData));
    ASSERT_TRUE(point.SaveExtendedData(L"second", UDBObject::kNoteData));
    EXPECT_EQ(point.LoadExtendedData(UDBObject::kNoteData), L"second");
    EXPECT_EQ(point.LoadExtendedData(7), L"");

    ASSERT_TRUE(point.SaveExtraSymbols(
        {{job->SymbolIndex(L"A"), 2.0, 2.0, 0.0}, {job->SymbolIndex(L"B"), 1.0, 3.0, 90.0}}));
    ASSERT_TRUE(point.SaveExtraSymbols({{job->SymbolIndex(L"B"), 1.0, 3.0, 90.0}}));
    ASSERT_EQ(point.GetExtraSymbols().size(), 1u);
    EXPECT_EQ(job->SymbolName(point.GetExtraSymbols()[0].Symbol), L"B");

    // Deleting the point takes everything hung on it along.
    job->Database().Query("DELETE FROM point WHERE id = ?")->Bind(1, point.GetId()).Run();
    for (const char* table : {"attribute", "image", "extended_data"}) {
        auto left = job->Database().Query(std::string("SELECT count(*) FROM ") + table);
        ASSERT_TRUE(left->Step());
        EXPECT_EQ(left->Int(0), 0) << table;
    }
    auto symbols = job->Database().Query("SELECT count(*) FROM extra_symbol");
    ASSERT_TRUE(symbols->Step());
    EXPECT_EQ(symbols->Int(0), 0);
}
