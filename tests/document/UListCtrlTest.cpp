#include <gtest/gtest.h>

#include "../records/RecordFixture.h"
#include "document/UListCtrl.h"

using ListGate = RecordFixture;

TEST_F(ListGate, EveryRowEntersNormalised) {
    UListCtrl list(&format);
    EXPECT_EQ(list.AddRecord(0, L"ss id=p1,ha=1.0000"), 0);
    EXPECT_EQ(list.AddRecord(5, L"weather sunny"), 1);   // past the end: appended
    EXPECT_EQ(list.AddRecord(0, L"#  note:  Keep"), 0);  // a comment is only upper-cased
    EXPECT_EQ(list.AddRecord(1, L""), -1);
    EXPECT_EQ(list.AddRecord(1, L"stn,id=a"), 1);  // the key ends at a comma too
    ASSERT_EQ(list.GetItemCount(), 4);
    EXPECT_EQ(list.GetItemText(0), L"#  NOTE:  KEEP");
    EXPECT_EQ(list.GetItemText(1), L"STN       ,ID=A");
    EXPECT_EQ(list.GetItemText(2), L"SS        ID=P1,HA=1.0000");
    EXPECT_EQ(list.GetItemText(3), L"# WEATHER SUNNY");
    EXPECT_EQ(list.GetItemText(4), L"");

    EXPECT_EQ(list.SetRecord(3, L"scale 1.0"), 3);
    EXPECT_EQ(list.GetItemText(3), L"SCALE     1.0");
    EXPECT_EQ(list.SetRecord(9, L"scale 1.0"), -1);
    EXPECT_EQ(list.SetRecord(0, L"   "), -1);
    EXPECT_EQ(list.GetItemText(0), L"#  NOTE:  KEEP");

    // A row never holds more than 255 characters, whatever the gate adds.
    EXPECT_EQ(list.NormaliseRecord(L"x" + std::wstring(300, L'y')).size(), 255u);
    EXPECT_EQ(list.NormaliseRecord(L"unknown" + std::wstring(260, L'z')).substr(0, 9),
              L"# UNKNOWN");
}
