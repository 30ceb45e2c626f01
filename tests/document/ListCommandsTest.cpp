// Commenting, stepping by record type and the point highlight of the record list.

#include <gtest/gtest.h>

#include "ListFixture.h"

using ListCommands = ListFixture;

TEST_F(ListCommands, CommentAndUncommentRoundTrip) {
    Fill({L"#VERSION-1.0 NEUTRAL FILE", L"ss id=p1,ha=1", L"#  ss id=p2"});
    const std::wstring shot = list.GetItemText(1);

    list.CommentRow();  // nothing selected
    EXPECT_EQ(list.GetItemText(1), shot);

    list.SetSelection({1});
    list.CommentRow();
    EXPECT_EQ(list.GetItemText(1), L"#" + shot);
    ASSERT_EQ(form.shown.size(), 1u);
    EXPECT_EQ(form.shown[0], std::make_pair(L"#" + shot, 1));
    list.CommentRow();  // already a comment
    EXPECT_EQ(list.GetItemText(1), L"#" + shot);

    list.UncommentRow();
    EXPECT_EQ(list.GetItemText(1), shot);
    list.UncommentRow();  // no comment: nothing to take off
    EXPECT_EQ(list.GetItemText(1), shot);

    // The blanks behind '#' go too, and the record passes the gate again.
    list.SetSelection({2});
    list.UncommentRow();
    EXPECT_EQ(list.GetItemText(2), L"SS        ID=P2");

    // The file's header line, uncommented, is an unknown key; the form cannot show the
    // comment that the gate makes of it, so the header comes back.
    form.accepts = [](const std::wstring& text) { return text[0] == L'#' ? 0 : 1; };
    list.SetSelection({0});
    list.UncommentRow();
    EXPECT_EQ(list.GetItemText(0), L"#VERSION-1.0 NEUTRAL FILE");

    // Without a form nothing can refuse it.
    list.SetRecordForm(nullptr);
    list.UncommentRow();
    EXPECT_EQ(list.GetItemText(0), L"# VERSION-1.0 NEUTRAL FILE");

    // A lone '#' leaves nothing to uncomment; the row stays.
    list.SetRecord(0, L"#");
    list.UncommentRow();
    EXPECT_EQ(list.GetItemText(0), L"#");
}

TEST_F(ListCommands, NextAndPreviousOfTypeStopAtTheEnds) {
    Fill({L"#VERSION-1.0 NEUTRAL FILE", L"STN ID=A,HI=1", L"BS ID=B,HA=0", L"SS ID=P1,HA=1",
          L"# NOTE", L"SS ID=P2,HA=2", L"STN ID=B,HI=1", L"SS ID=P3,HA=3", L"#END"});
    graphic.points = {L"P1", L"P2", L"P3"};
    EXPECT_EQ(list.NextOfType(), 0);  // nothing selected
    EXPECT_EQ(list.PreviousOfType(), 0);

    list.SetSelection({3, 6});
    EXPECT_EQ(list.NextOfType(), 1);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{5, 6}));  // only the old row lets go
    EXPECT_EQ(list.GetFocusRow(), 5);
    EXPECT_EQ(form.shown.back(), std::make_pair(list.GetItemText(5), 5));
    EXPECT_EQ(graphic.asked.back(), L"P2");

    list.SetSelection({5});
    EXPECT_EQ(list.NextOfType(), 1);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{7}));
    EXPECT_EQ(list.NextOfType(), 1);  // no side shot below: it stays, without wrapping
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{7}));

    EXPECT_EQ(list.PreviousOfType(), 1);
    EXPECT_EQ(list.PreviousOfType(), 1);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{3}));
    EXPECT_EQ(list.PreviousOfType(), 1);  // none above
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{3}));

    // Comments are one type, whatever they hold.
    list.SetSelection({8});
    EXPECT_EQ(list.NextOfType(), 0);  // the last row
    EXPECT_EQ(list.PreviousOfType(), 1);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{4}));
    EXPECT_EQ(list.PreviousOfType(), 1);
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{0}));
    EXPECT_EQ(list.PreviousOfType(), 0);  // row 0

    list.SetSelection({1});
    list.NextOfType();
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{6}));
}

TEST_F(ListCommands, HighlightTakesTheNameUpToTheNextComma) {
    Fill({L"SS ID=P1,HA=1", L"SS ID=P9", L"SCALE 0.9996", L"SS ID=GONE,HA=1",
          L"SS HA=1,ID= P7 ,VA=90"});
    graphic.points = {L"P1", L"P9", L"P7"};

    list.HighlightRecordPoint();  // nothing selected
    EXPECT_TRUE(graphic.asked.empty());

    list.SetSelection({0});
    list.HighlightRecordPoint();
    EXPECT_EQ(graphic.asked, (std::vector<std::wstring>{L"P1"}));
    EXPECT_EQ(graphic.viewed, 1);

    list.SetSelection({1});  // "ID=" is the last field: no comma behind it
    list.HighlightRecordPoint();
    list.SetSelection({2});  // no "ID=" at all
    list.HighlightRecordPoint();
    EXPECT_EQ(graphic.asked.size(), 1u);

    list.SetSelection({3});  // asked, but the plan has no such point
    list.HighlightRecordPoint();
    EXPECT_EQ(graphic.asked.back(), L"GONE");
    EXPECT_EQ(graphic.viewed, 1);

    list.SetSelection({4});  // a field anywhere in the record
    list.HighlightRecordPoint();
    EXPECT_EQ(graphic.asked.back(), L"P7");
    EXPECT_EQ(graphic.viewed, 2);

    list.SetGraphicView(nullptr);
    list.HighlightRecordPoint();
    EXPECT_EQ(graphic.asked.size(), 3u);
}
