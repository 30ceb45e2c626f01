// The selection and focus of the record list, the header, and the mouse and keys that move
// them.

#include <gtest/gtest.h>

#include "ListFixture.h"

using ListSelection = ListFixture;
using nedit::ListKey;

TEST_F(ListSelection, FollowsItsRowsWhenRowsComeAndGo) {
    FillShots(6);
    list.SetSelection({1, 3});
    list.SetFocusRow(3);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{1, 3}));

    list.AddRecord(2, L"SS ID=NEW,HA=1");  // between the two selected rows
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{1, 4}));
    EXPECT_EQ(list.GetFocusRow(), 4);
    EXPECT_FALSE(list.IsSelected(2));

    list.DeleteItem(0);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{0, 3}));
    EXPECT_EQ(list.GetFocusRow(), 3);

    const int before = events.selection_changes;
    list.DeleteItem(3);  // the focused, selected row
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{0}));
    EXPECT_EQ(list.GetFocusRow(), -1);
    EXPECT_GT(events.selection_changes, before);

    // Rows that do not exist are ignored, and setting what is already there is no change.
    const int settled = events.selection_changes;
    list.SetSelected(99, true);
    list.SetSelection({0});
    list.SetFocusRow(-4);
    EXPECT_EQ(events.selection_changes, settled);
    EXPECT_EQ(list.GetNextSelected(0), -1);

    list.DeleteAllItems();
    EXPECT_EQ(list.GetFirstSelected(), -1);
    EXPECT_EQ(list.GetFocusRow(), -1);
    EXPECT_EQ(list.GetItemCount(), 0);
}

TEST_F(ListSelection, HeaderNamesTheFirstSelectedRowAndShowsItInTheForm) {
    EXPECT_EQ(list.UpdateHeader(), 0);  // no rows
    EXPECT_EQ(list.GetHeaderText(), L"Neutral File Records");

    Fill({L"#VERSION-1.0 NEUTRAL FILE", L"STN ID=A,HI=1.5", L"SS ID=P1,HA=1"});
    EXPECT_EQ(list.UpdateHeader(), 1);  // no selection: nothing to show, nothing wrong
    EXPECT_EQ(list.GetHeaderText(), L"Neutral File Records");
    EXPECT_TRUE(form.shown.empty());

    list.SetSelection({2, 1});
    EXPECT_EQ(list.UpdateHeader(), 1);
    EXPECT_EQ(list.GetHeaderText(), L"Rec.No:1");  // counted from the file's header line, 0
    EXPECT_EQ(events.header, L"Rec.No:1");
    ASSERT_EQ(form.shown.size(), 1u);
    EXPECT_EQ(form.shown[0].second, 1);

    form.accepts = [](const std::wstring&) { return 0; };
    list.SetSelection({0});
    EXPECT_EQ(list.UpdateHeader(), 0);  // the form refused the header line
    EXPECT_EQ(list.GetHeaderText(), L"Rec.No:0");

    list.SetRecordForm(nullptr);
    EXPECT_EQ(list.UpdateHeader(), 0);
    EXPECT_EQ(list.ShowRecord(L"SS ID=X,HA=1", 0), 0);
}

TEST_F(ListSelection, AddRecordLeavesTheFormAloneWhileALongOperationRuns) {
    list.AddRecord(0, L"SS ID=P1,HA=1");
    ASSERT_EQ(form.shown.size(), 1u);
    EXPECT_EQ(form.shown[0], std::make_pair(list.GetItemText(0), 0));

    bool downloading = true;
    list.SetAbortProcessQuery([&downloading] { return downloading; });
    list.AddRecord(1, L"SS ID=P2,HA=2");
    list.AddRecord(2, L"SS ID=P3,HA=3");
    EXPECT_EQ(form.shown.size(), 1u);
    EXPECT_EQ(list.GetItemCount(), 3);

    // The mouse selects nothing meanwhile, and neither does a simulated click.
    list.OnLButtonDown(1);
    list.SelectRow(2);
    list.OnLButtonDblClk(2);
    EXPECT_EQ(list.GetFirstSelected(), -1);
    EXPECT_TRUE(events.edit_requests.empty());

    downloading = false;
    list.OnLButtonDown(1);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{1}));
    list.AddRecord(3, L"SS ID=P4,HA=4");
    EXPECT_EQ(form.shown.back().second, 3);
}

TEST_F(ListSelection, MouseSelectsAsAListDoes) {
    FillShots(8);
    graphic.points = {L"P2", L"P5"};

    list.OnLButtonDown(2);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{2}));
    EXPECT_EQ(list.GetFocusRow(), 2);
    EXPECT_EQ(list.GetHeaderText(), L"Rec.No:2");
    EXPECT_EQ(graphic.asked, (std::vector<std::wstring>{L"P2"}));
    EXPECT_EQ(graphic.viewed, 1);

    list.OnLButtonDown(5, /*ctrl=*/true);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{2, 5}));
    list.OnLButtonDown(2, /*ctrl=*/true);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{5}));

    list.OnLButtonDown(4, false, /*shift=*/true);  // from the anchor, the row clicked last
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{2, 3, 4}));
    EXPECT_EQ(list.GetFocusRow(), 4);
    list.OnLButtonDown(0, false, /*shift=*/true);  // the anchor stays
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{0, 1, 2}));

    list.OnLButtonDown(-1);  // below the last row
    EXPECT_EQ(list.GetSelectedCount(), 0);

    list.OnLButtonDblClk(6);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{6}));
    ASSERT_EQ(events.edit_requests.size(), 1u);
    EXPECT_EQ(events.edit_requests[0], std::make_pair(list.GetItemText(6), 6));

    list.SelectRow(42);  // out of range: nothing happens
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{6}));
    list.SelectRow(7);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{7}));
    EXPECT_EQ(list.GetHeaderText(), L"Rec.No:7");
}

TEST_F(ListSelection, MovementKeysUpdateHeaderAndHighlightOnlyASingleRow) {
    FillShots(30);
    for (int i = 0; i < 30; ++i) graphic.points.insert(L"P" + std::to_wstring(i));
    list.SetVisibleRowCount(10);

    list.OnKeyDown(ListKey::Down);  // nothing focused yet: the first row
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{0}));
    list.OnKeyDown(ListKey::Down);
    list.OnKeyDown(ListKey::PageDown);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{11}));
    EXPECT_EQ(list.GetHeaderText(), L"Rec.No:11");
    EXPECT_EQ(graphic.asked.back(), L"P11");

    const std::size_t asked = graphic.asked.size();
    list.OnKeyDown(ListKey::Up, /*extend=*/true);
    list.OnKeyDown(ListKey::Up, /*extend=*/true);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{9, 10, 11}));
    EXPECT_EQ(list.GetHeaderText(), L"Rec.No:9");
    EXPECT_EQ(graphic.asked.size(), asked);  // several rows: no point is singled out

    list.OnKeyDown(ListKey::PageUp);
    list.OnKeyDown(ListKey::PageUp);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{0}));  // stops at the top
    list.OnKeyDown(ListKey::PageDown);
    list.OnKeyDown(ListKey::PageDown);
    list.OnKeyDown(ListKey::PageDown);
    list.OnKeyDown(ListKey::Down);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{29}));  // and at the bottom

    list.OnKeyDown(ListKey::Enter);
    EXPECT_EQ(events.form_focus, 1);
    list.OnKeyDown(ListKey::Other);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{29}));
}
