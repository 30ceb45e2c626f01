// The record list printed as pages of text.

#include <gtest/gtest.h>

#include "ListFixture.h"

using ListPrinting = ListFixture;

TEST_F(ListPrinting, PagesHoldThePageSizeAndNoEmptyPageTrails) {
    FillShots(110);
    EXPECT_EQ(list.OnPreparePrinting(55), 2);  // divides exactly: no empty third page
    EXPECT_EQ(list.OnPreparePrinting(50), 3);
    EXPECT_EQ(list.OnPreparePrinting(110), 1);
    EXPECT_EQ(list.OnPreparePrinting(0), 1);  // no page size known
    EXPECT_EQ(list.OnPreparePrinting(-3), 1);

    const nedit::ListPage second = list.PrintPage(2, 55);
    EXPECT_EQ(second.heading, L"Page 2 of 2");
    EXPECT_EQ(second.firstRow, 55);
    ASSERT_EQ(second.rows.size(), 55u);
    EXPECT_EQ(second.rows.front(), list.GetItemText(55));
    EXPECT_EQ(second.rows.back(), list.GetItemText(109));

    const nedit::ListPage last = list.PrintPage(3, 50);
    EXPECT_EQ(last.heading, L"Page 3 of 3");
    EXPECT_EQ(last.rows,
              (std::vector<std::wstring>(list.GetRows().begin() + 100, list.GetRows().end())));

    // Without a page size everything is on the one page.
    EXPECT_EQ(list.PrintPage(1, 0).rows.size(), 110u);
    EXPECT_EQ(list.PrintPage(1, 0).heading, L"Page 1 of 1");

    EXPECT_TRUE(list.PrintPage(0, 55).heading.empty());
    EXPECT_TRUE(list.PrintPage(3, 55).rows.empty());
    EXPECT_TRUE(list.PrintPage(3, 55).Lines().empty());
}

TEST_F(ListPrinting, PageTextPutsRowsThreeLinesBelowTheHeading) {
    EXPECT_EQ(list.OnPreparePrinting(55), 1);  // an empty list still prints its heading
    EXPECT_EQ(list.PrintPage(1, 55).Lines(), (std::vector<std::wstring>{L"Page 1 of 1", L"", L""}));

    FillShots(3);
    const std::vector<std::wstring> lines = list.PrintPage(2, 2).Lines();
    ASSERT_EQ(lines.size(), 4u);
    EXPECT_EQ(lines[0], L"Page 2 of 2");
    EXPECT_EQ(lines[nedit::ListPage::kFirstRowLine], list.GetItemText(2));
}
