#include <gtest/gtest.h>

#include <string>

#include "platform/text/NameTable.h"

using nedit::NameTable;

TEST(NameTable, EachNameHasOneIdForTheLifeOfTheTable) {
    NameTable names;
    EXPECT_EQ(names.Find(L"A"), NameTable::kNone);
    const NameTable::Id a = names.Intern(L"A");
    const NameTable::Id empty = names.Intern(L"");
    const std::wstring long_name(100000, L'\u00e9');  // longer than a block
    const NameTable::Id longer = names.Intern(long_name);
    // Many more names: the table grows, the ids and the texts stay.
    for (int i = 0; i < 100000; ++i) names.Intern(L"P" + std::to_wstring(i));
    EXPECT_EQ(names.Intern(L"A"), a);
    EXPECT_EQ(names.Find(L"A"), a);
    EXPECT_EQ(names.Find(L""), empty);
    EXPECT_EQ(names.Find(long_name), longer);
    EXPECT_EQ(names.Name(a), L"A");
    EXPECT_TRUE(names.Name(empty).empty());
    EXPECT_EQ(names.Name(longer).size(), long_name.size());
    EXPECT_EQ(names.Name(names.Find(L"P99999")), std::wstring(L"P99999"));
    EXPECT_EQ(names.size(), 100003u);
    // A name compares with text as text does; a default name is empty.
    const nedit::NameText none;
    EXPECT_TRUE(none.empty());
    EXPECT_TRUE(none == L"");
    EXPECT_TRUE(names.Name(a) != L"B");
    EXPECT_EQ(names.Intern(names.Name(longer)), longer);
}
