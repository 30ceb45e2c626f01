// The application profile: defaults when nothing is stored, the window state's parsing
// rules, and the entries written and read back.

#include <gtest/gtest.h>

#include "../support/TestSupport.h"
#include "document/ProfileStore.h"

using nedit::ColumnFromWindowState;
using nedit::ParseWindowState;
using nedit::ProfileStore;
using nedit::SplitterColumn;

TEST(ProfileStore, NothingStoredGivesTheDefaults) {
    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config("SXNEDIT_CONFIG", dir.Path());
    const ProfileStore profile;
    EXPECT_EQ(profile.Path(), dir.File("sxnedit.ini"));

    EXPECT_EQ(profile.ReadWindowStateText(), L"0, 1, 165, -10, 1284, 798, 505, 16, 697, 0");
    EXPECT_EQ(profile.ReadColumnSize(false), (SplitterColumn{697, 0}));
    EXPECT_FALSE(profile.ReadColumnSize(true).has_value());  // a maximised pane ignores it
    EXPECT_EQ(profile.ReadListWidth(), 0);
    EXPECT_EQ(profile.ReadInstrument(), L"");
    EXPECT_EQ(profile.ReadSurveyCodeControl(), L"");
    EXPECT_EQ(dir.Read("sxnedit.ini"), "");  // reading makes no file

    // The default state written out is the default text.
    EXPECT_EQ(nedit::WindowState{}.ToText(), ProfileStore::kDefaultWindowState);
}

TEST(ProfileStore, WindowStateSplitsAtCommaBlank) {
    EXPECT_EQ(ParseWindowState(L"1, 2, 3"), (std::vector<int>{1, 2, 3}));
    EXPECT_EQ(ParseWindowState(L"0,1,165,-10"), (std::vector<int>{0}));  // no ", ": one value
    EXPECT_EQ(ParseWindowState(L"7, x, -9"), (std::vector<int>{7, 0, -9}));

    EXPECT_EQ(ColumnFromWindowState(ParseWindowState(L"0, 1, 165, -10, 1284, 798, 505, 16, 697")),
              (SplitterColumn{32, 32}));
    EXPECT_EQ(ColumnFromWindowState(ParseWindowState(L"0, 1, 2, 3, 4, 5, 6, 7, 400, 50, 99")),
              (SplitterColumn{400, 50}));
    EXPECT_EQ(ColumnFromWindowState({}), (SplitterColumn{32, 32}));
}

TEST(ProfileStore, EntriesRoundTripThroughTheFile) {
    nedit::test::TempDir dir;
    const ProfileStore profile(dir.File("sub/sxnedit.ini"));

    nedit::WindowState state;
    state.showCommand = 3;
    state.columnWidth = 420;
    state.columnMinimum = 40;
    ASSERT_TRUE(profile.WriteWindowState(state));
    EXPECT_EQ(profile.ReadWindowStateText(), L"0, 3, 165, -10, 1284, 798, 505, 16, 420, 40");
    EXPECT_EQ(profile.ReadColumnSize(false), (SplitterColumn{420, 40}));

    ASSERT_TRUE(profile.WriteListWidth(812));
    EXPECT_EQ(profile.ReadListWidth(), 812);
    ASSERT_TRUE(profile.WriteListWidth(-5));  // stored as given; only a width above 0 is used
    EXPECT_EQ(profile.ReadListWidth(), -5);

    ASSERT_TRUE(profile.WriteInstrument(L"Station Ä 5"));
    EXPECT_EQ(profile.ReadInstrument(), L"Station Ä 5");

    const std::string text = dir.Read("sub/sxnedit.ini");
    EXPECT_NE(text.find("[Settings\\Window State]"), std::string::npos);
    EXPECT_NE(text.find("RawDataEditor=0, 3, 165"), std::string::npos);
    EXPECT_NE(text.find("[Settings\\ListCtrl State]"), std::string::npos);
    EXPECT_NE(text.find("1000000001-2000=-5"), std::string::npos);
    EXPECT_NE(text.find("[Settings]"), std::string::npos);
}

TEST(ProfileStore, HandWrittenEntriesAreReadByTheRules) {
    nedit::test::TempDir dir;
    dir.Write("sxnedit.ini",
              "[Settings\\Window State]\n"
              "RawDataEditor=   \n"
              "[settings\\listctrl state]\n"
              "1000000001-2000=  640px\n"
              "[Settings]\n"
              "Survey Code Control=codes;v2\n");
    const ProfileStore profile(dir.File("sxnedit.ini"));
    EXPECT_EQ(profile.ReadWindowStateText(), ProfileStore::kDefaultWindowState);  // blank entry
    EXPECT_EQ(profile.ReadListWidth(), 640);
    EXPECT_EQ(profile.ReadSurveyCodeControl(), L"codes;v2");

    dir.Write("sxnedit.ini",
              "[Settings\\Window State]\nRawDataEditor= 1, 2, 3, 4, 5, 6, 7, 8, 9\n");
    EXPECT_EQ(profile.ReadColumnSize(false), (SplitterColumn{32, 32}));
}
