// Finding text in the record list: the start row, the wrap, whole words and case.

#include <gtest/gtest.h>

#include "ListFixture.h"

class ListFind : public ListFixture {
  protected:
    void SetUp() override {
        ListFixture::SetUp();
        Fill({L"#VERSION-1.0 NEUTRAL FILE",  // 0
              L"STN ID=A,HI=1.5,CO=STN",     // 1
              L"SS ID=P1,HA=1,CO=FENCE",     // 2
              L"SS ID=P10,HA=2,CO=FC",       // 3
              L"SS ID=P2,HA=3,CO=FENCE",     // 4
              L"SS ID=P1X,HA=4,CO=TREE",     // 5
              L"# P10, P1"});                // 6
    }
    /// Finds from `selected` (-1 for no selection) and gives the row selected afterwards.
    int FindFrom(int selected, const std::wstring& text, bool down, bool matchCase = false,
                 bool wholeWord = false) {
        list.SetSelection(selected < 0 ? std::vector<int>{} : std::vector<int>{selected});
        list.FindText(text, down, matchCase, wholeWord);
        return list.GetFirstSelected();
    }
};

TEST_F(ListFind, DownwardWrapsToTheTopAndReachesTheSelectedRow) {
    EXPECT_EQ(FindFrom(2, L"FENCE", true), 4);
    EXPECT_EQ(FindFrom(4, L"FENCE", true), 2);  // wraps
    EXPECT_EQ(FindFrom(6, L"STN", true), 1);    // from the last row: row 0 on
    EXPECT_EQ(FindFrom(5, L"TREE", true), 5);   // the selected row itself, last of all
    EXPECT_EQ(FindFrom(-1, L"HA=", true), 2);   // no selection: from row 0

    // A found row is selected as a click would: header, form and plan follow.
    graphic.points = {L"P2"};
    EXPECT_EQ(FindFrom(0, L"ID=P2", true), 4);
    EXPECT_EQ(list.GetHeaderText(), L"Rec.No:4");
    EXPECT_EQ(form.shown.back().second, 4);
    EXPECT_EQ(graphic.viewed, 1);
    EXPECT_TRUE(host.Messages().empty());
}

TEST_F(ListFind, UpwardRunsToRowZeroThenOnBelowTheSelection) {
    EXPECT_EQ(FindFrom(4, L"FENCE", false), 2);
    EXPECT_EQ(FindFrom(2, L"FENCE", false), 4);  // nothing above: on below it
    EXPECT_EQ(FindFrom(0, L"TREE", false), 5);   // from row 0 the search starts at the end
    // The second pass runs downward from the selected row, so the nearest row below is
    // found first, not the last one.
    EXPECT_EQ(FindFrom(1, L"HA=", false), 2);
    // Upward the selected row itself is never searched (row 0 aside, where the search
    // starts from the end).
    list.SetSelection({3});
    EXPECT_EQ(list.FindText(L"FC", false, false, false), 0);
    ASSERT_EQ(host.Messages().size(), 1u);
    EXPECT_EQ(host.Messages()[0].text, L"FC not found.");

    // With no selection only row 0 is searched upward.
    list.ClearSelection();
    EXPECT_EQ(list.FindText(L"FENCE", false, false, false), 0);
    EXPECT_EQ(host.Messages().back().text, L"FENCE not found.");
    EXPECT_EQ(list.FindText(L"VERSION", false, false, false), 1);
}

TEST_F(ListFind, WholeWordAndMatchCase) {
    EXPECT_EQ(FindFrom(2, L"P1", true), 3);                   // inside P10
    EXPECT_EQ(FindFrom(2, L"P1", true, false, true), 2);      // P10, P1X and row 6 fail
    EXPECT_EQ(FindFrom(-1, L"D=P1", true, false, true), -1);  // 'I' stands before it
    EXPECT_EQ(FindFrom(-1, L"CO=FC", true, false, true), 3);  // ends at the row's end
    EXPECT_EQ(FindFrom(-1, L"#", true, false, true), 6);      // "#VERSION" is no word

    // Rows are upper case; without match case the text is compared in lower case.
    EXPECT_EQ(FindFrom(0, L"tree", true), 5);
    host.QueueAnswer(nedit::mb::IdOk);
    EXPECT_EQ(list.FindText(L"tree", true, true, false), 0);
    EXPECT_EQ(host.Messages().back().text, L"tree not found.");
    EXPECT_EQ(list.GetFirstSelected(), 5);  // a failed find leaves the selection
}

TEST_F(ListFind, EmptyTextOrEmptyListFindsNothingQuietly) {
    list.SetSelection({3});
    EXPECT_EQ(list.FindText(L"", true, false, false), 0);
    EXPECT_EQ(list.FindText(L"", false, true, true), 0);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{3}));

    list.DeleteAllItems();
    EXPECT_EQ(list.FindText(L"FENCE", true, false, false), 0);
    EXPECT_TRUE(host.Messages().empty());
}
