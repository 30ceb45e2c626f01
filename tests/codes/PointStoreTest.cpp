#include <gtest/gtest.h>

#include "codes/PointStore.h"

namespace {

UNeditPt Point(const std::wstring& name, double x, bool fromPTRecord) {
    return UNeditPt(name, x, x, x, L"", fromPTRecord ? UNeditPt::kFromPTRecord : 0u);
}

struct Precedence {
    const char* what;
    bool firstFromPT;
    bool secondFromPT;
    bool secondWins;
};

// A case prints as its name, so that the names of the tests do not carry its bytes.
void PrintTo(const Precedence& precedence, std::ostream* out) {
    *out << precedence.what;
}

class PointPrecedence : public ::testing::TestWithParam<Precedence> {};

}  // namespace

INSTANTIATE_TEST_SUITE_P(FirstAndSecondSave, PointPrecedence,
                         ::testing::Values(Precedence{"ObservedThenObserved", false, false, true},
                                           Precedence{"ObservedThenPTRecord", false, true, false},
                                           Precedence{"PTRecordThenPTRecord", true, true, true},
                                           Precedence{"PTRecordThenObserved", true, false, true}),
                         [](const auto& name) { return std::string(name.param.what); });

TEST_P(PointPrecedence, APTRecordReplacesOnlyAPTPoint) {
    nedit::PointStore store;
    EXPECT_EQ(store.Save(Point(L"P", 1.0, GetParam().firstFromPT)), 0u);
    // Stored or dropped, the index of the name is given.
    EXPECT_EQ(store.Save(Point(L"P", 2.0, GetParam().secondFromPT)), 0u);
    ASSERT_EQ(store.size(), 1u);
    EXPECT_DOUBLE_EQ(store[0].x, GetParam().secondWins ? 2.0 : 1.0);
}

TEST(PointStore, NamesAreLookedUpExactlyAndKeptOnce) {
    nedit::PointStore store;
    store.Put(Point(L"A", 1.0, false));
    store.Put(Point(L"b", 2.0, false));
    store.Put(Point(L"A", 3.0, false));
    ASSERT_EQ(store.size(), 2u);
    EXPECT_EQ(store.IndexOf(L"A"), 0);
    EXPECT_DOUBLE_EQ(store.Find(L"A")->x, 3.0);
    EXPECT_EQ(store.IndexOf(L"B"), -1);  // case counts
    EXPECT_EQ(store.Find(L"B"), nullptr);
    store.KeepIf([](const UNeditPt& point) { return point.GetID() == L"b"; });
    EXPECT_EQ(store.IndexOf(L"b"), 0);
    EXPECT_EQ(store.IndexOf(L"A"), -1);
    store.Clear();
    EXPECT_TRUE(store.empty());
    EXPECT_EQ(store.IndexOf(L"b"), -1);
}

TEST(PointStore, AnEmptyCodeKeepsTheCodeOfTheName) {
    nedit::PointStore store;
    EXPECT_EQ(store.CodeFor(L"P", L"  FC01 "), L"FC01");
    store.Save(UNeditPt(L"P", 0, 0, 0, L"FC01", 0));
    EXPECT_EQ(store.CodeFor(L"P", L"  "), L"FC01");
    EXPECT_EQ(store.CodeFor(L"P", L"TREE"), L"TREE");
    EXPECT_EQ(store.CodeFor(L"Q", L""), L"");
}

TEST(PointStore, SavesByAKnownIndexAndLooksNamesUpOnlyWhenAsked) {
    nedit::PointStore store;
    EXPECT_EQ(store.SaveAt(-1, Point(L"A", 1.0, false)), 0u);
    EXPECT_EQ(store.SaveAt(-1, Point(L"B", 2.0, true)), 1u);
    EXPECT_EQ(store.SaveAt(0, Point(L"A", 3.0, false)), 0u);
    EXPECT_EQ(store.SaveAt(0, Point(L"A", 4.0, true)), 0u);  // a PT record keeps off
    EXPECT_DOUBLE_EQ(store[0].x, 3.0);
    // The look-up by name, made now, follows later saves.
    EXPECT_EQ(store.IndexOf(L"B"), 1);
    EXPECT_EQ(store.SaveAt(-1, Point(L"C", 5.0, false)), 2u);
    EXPECT_EQ(store.IndexOf(L"C"), 2);
}

TEST(UNeditPt, CopiesCarryTheRarerMembersAndShareTheCode) {
    UNeditPt point(L"P", 1.0, 2.0, 3.0, L"FC01", 0);
    EXPECT_EQ(point.GetLayer(), L"");
    EXPECT_TRUE(point.GetImages().empty());
    point.SetLayer(L"FENCES");
    point.SetNote(L"leaning");
    point.SetImage(1.0, 2.0, L"p.jpg");
    EXPECT_FALSE(point.SetPointAttribute(L"", L"TEXT", L"x"));
    EXPECT_TRUE(point.SetPointAttribute(L"HEIGHT", L"TEXT", L"1.2"));
    UNeditPt copy = point;
    point.SetLayer(L"OTHER");
    point.SetImage(3.0, 4.0, L"q.jpg");
    EXPECT_EQ(copy.GetLayer(), L"FENCES");
    EXPECT_EQ(copy.GetNote(), L"leaning");
    EXPECT_EQ(copy.GetImageSize(), 1);
    EXPECT_EQ(copy.GetPointAttributeSize(), 1);
    EXPECT_EQ(copy.GetCode(), L"FC01");
    EXPECT_EQ(copy.GetSharedCode(), point.GetSharedCode());
    copy = UNeditPt(L"Q", 0.0, 0.0, 0.0, L"", 0);
    EXPECT_EQ(copy.GetCode(), L"");
    EXPECT_EQ(copy.GetLayer(), L"");
    EXPECT_EQ(copy.GetID(), L"Q");
}
