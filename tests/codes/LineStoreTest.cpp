#include <gtest/gtest.h>

#include "codes/LineStore.h"

namespace {

const UNeditPt kA(L"A", 0, 0, 0, L"", 0);
const UNeditPt kB(L"B", 0, 10, 0, L"", 0);
const UNeditPt kC(L"C", 10, 10, 0, L"", 0);

}  // namespace

TEST(LineStore, ALineKeepsItsFirstDirection) {
    nedit::LineStore store;
    EXPECT_EQ(store.Save(kA, kB, false), 0u);
    EXPECT_EQ(store.Save(kB, kA, true), 0u);
    ASSERT_EQ(store.size(), 1u);
    // The second save's values, in the first save's direction.
    EXPECT_EQ(store.Items()[0].GetFromPt(), L"A");
    EXPECT_EQ(store.Items()[0].GetToPt(), L"B");
    EXPECT_EQ(store.Items()[0].GetStationLine(), 1);
    EXPECT_EQ(store.IndexOf(L"B", L"A"), 0);
    EXPECT_EQ(store.IndexOf(L"A", L"C"), -1);
}

TEST(LineStore, OnlyStationLinesOutliveTheThinning) {
    nedit::LineStore store;
    store.Save(kA, kB, true);
    store.Save(kB, kC, false);
    EXPECT_TRUE(store.Names(L"C"));
    EXPECT_EQ(store.KeepStationLines(), (std::unordered_set<std::wstring>{L"A", L"B"}));
    EXPECT_EQ(store.size(), 1u);
    EXPECT_FALSE(store.Names(L"C"));
    EXPECT_EQ(store.IndexOf(L"B", L"C"), -1);
    EXPECT_EQ(store.IndexOf(L"A", L"B"), 0);
}
