#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "platform/report/UReportDoc.h"

TEST(UReportDoc, WritesLinesAndKeepsBlocksOnOnePage) {
    UReportDoc report(L"Reduction");
    report.SetPageLength(5);
    report.WriteText(L"head", 0, 1);
    report.WriteText(L"a", 0, 0);
    report.WriteText(L"b", 0, 2);  // appended to the same line, then a blank line
    EXPECT_EQ(report.GetText(), L"head\nab\n\n");
    // Three lines are used; a block of three does not fit in the two left.
    report.KeepLines(3);
    report.WriteText(L"block", 0, 1);
    report.KeepLines(1);  // fits on the new page
    report.WriteText(L"next", 0, 1);
    EXPECT_EQ(report.GetText(), L"head\nab\n\n\fblock\nnext\n");
    report.Clear();
    EXPECT_EQ(report.GetText(), L"");
    // Endless pages never break; a block at the top of a page does not break either.
    report.SetPageLength(0);
    report.NewLines(100);
    report.KeepLines(50);
    EXPECT_EQ(report.GetText().find(L'\f'), std::wstring::npos);
    report.SetPageLength(2);
    report.Clear();
    report.KeepLines(10);
    EXPECT_EQ(report.GetText(), L"");
}

TEST(UReportDoc, AReportThatKeepsNoTextHoldsOnlyTheLineBeingWritten) {
    UReportDoc report;
    report.SetKeepText(false);
    report.SetPageLength(3);
    report.WriteText(L"one", 0, 1);
    report.KeepLines(3);
    report.WriteText(L"two", 0, 1);
    report.WriteText(L"three", 0, 0);
    EXPECT_EQ(report.Lines(), std::vector<std::wstring>{L"three"});
    // A page that ends the report full has nothing behind it: text that is kept ends so.
    UReportDoc kept;
    kept.SetPageLength(3);
    for (const wchar_t* line : {L"one", L"two", L"three"}) kept.WriteText(line, 0, 1);
    EXPECT_EQ(kept.GetText(), L"one\ntwo\nthree\n");
}

TEST(UReportDoc, SavesItsTextAsUtf8) {
    UReportDoc report;
    report.WriteText(L"Station \u00c9", 0, 1);
    const std::string path = ::testing::TempDir() + "report.txt";
    ASSERT_TRUE(report.SaveAsText(path));
    EXPECT_FALSE(report.SaveAsText(::testing::TempDir() + "no/such/dir/report.txt"));
}

TEST(UReportDoc, AFullPageBeginsTheNextWithAFormFeed) {
    UReportDoc report;
    report.SetPageLength(5);
    for (int line = 0; line < 12; ++line) report.WriteText(std::to_wstring(line), 0, 1);
    EXPECT_EQ(report.GetText(), L"0\n1\n2\n3\n4\n\f5\n6\n7\n8\n9\n\f10\n11\n");
    // A page that ends the report full gives no empty page behind it.
    report.Clear();
    for (int line = 0; line < 10; ++line) report.WriteText(std::to_wstring(line), 0, 1);
    EXPECT_EQ(report.GetText(), L"0\n1\n2\n3\n4\n\f5\n6\n7\n8\n9\n");
    // Blank lines count as lines.
    report.Clear();
    report.WriteText(L"head", 0, 6);
    report.WriteText(L"next", 0, 0);
    EXPECT_EQ(report.GetText(), L"head\n\n\n\n\n\f\nnext");
}
