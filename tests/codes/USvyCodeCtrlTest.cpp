#include <gtest/gtest.h>

#include "codes/USvyCodeCtrl.h"

namespace {

using Tokens = std::vector<std::wstring>;

TEST(CodeGrammar, GroupsStartAtEveryFeatureToken) {
    const USvyCodeCtrl ctrl;
    EXPECT_EQ(ctrl.SplitCode(L"KB01*AS FC02", 2), (Tokens{L"KB01*AS", L"FC02"}));
    EXPECT_EQ(ctrl.SplitCode(L"KB01 AS*CLS  FC02*OS 1.5", 2),
              (Tokens{L"KB01*AS*CLS", L"FC02*OS1.5"}));
    // The feature token comes first; a group that opens with a command has an empty one.
    EXPECT_EQ(ctrl.SplitCode(L"SH01*RECT*2.5", 1), (Tokens{L"SH01", L"RECT2.5"}));
    EXPECT_EQ(ctrl.SplitCode(L"*CHK P12", 2), (Tokens{L"CHK", L"P12"}));
    EXPECT_EQ(ctrl.SplitCode(L"AS", 1), (Tokens{L"", L"AS"}));
    // A separator alone, blanks alone, a comment alone: nothing to split.
    EXPECT_TRUE(ctrl.SplitCode(L"*", 2).empty());
    EXPECT_TRUE(ctrl.SplitCode(L"   ", 2).empty());
    EXPECT_TRUE(ctrl.SplitCode(L"/only a comment", 2).empty());
}

TEST(CodeGrammar, AKeywordIsAWholeToken) {
    const USvyCodeCtrl ctrl;
    std::wstring value;
    EXPECT_EQ(ctrl.InterpretCommand(L"as", value), L"AS");
    EXPECT_EQ(ctrl.InterpretCommand(L"ASPH", value), L"");
    EXPECT_EQ(ctrl.InterpretCommand(L"CLSX", value), L"");
    EXPECT_EQ(ctrl.InterpretCommand(L"RECTANGLE", value), L"");
    EXPECT_EQ(ctrl.InterpretCommand(L"RECT-2.5", value), L"RECT");
    EXPECT_EQ(value, L"-2.5");
    EXPECT_EQ(ctrl.InterpretCommand(L"OS1.5", value), L"OS");
    EXPECT_EQ(value, L"1.5");
    // A width that is no number is still the command: the run says so and makes nothing.
    EXPECT_EQ(ctrl.InterpretCommand(L"RECT2,5", value), L"RECT");
    EXPECT_FALSE(USvyCodeCtrl::IsNumberText(value));
    EXPECT_EQ(ctrl.IsCmdString(L"RECT3"), USvyCodeCtrl::kTwoPointRect);
    EXPECT_EQ(ctrl.IsCmdString(L"R3P"), USvyCodeCtrl::kThreePointRect);
    EXPECT_EQ(ctrl.IsCmdString(L"OS"), USvyCodeCtrl::kOffsetString);
    EXPECT_EQ(ctrl.IsCmdString(L"AS"), 0);
    EXPECT_EQ(ctrl.CheckCtrl(L" ae "), 3);
    EXPECT_EQ(ctrl.CheckCtrl(L"CHK"), 7);
    EXPECT_EQ(ctrl.CheckCtrl(L"KB"), 0);
    EXPECT_EQ(ctrl.ChkCode(), L"*CHK");
}

TEST(CodeGrammar, FeatureNumberContourAndOffsets) {
    const USvyCodeCtrl ctrl;
    std::wstring strNo, remark, name;
    int contour = 0;
    double along = 9, right = 9, up = 9;
    EXPECT_EQ(ctrl.InterpretCode({L"kb01", L"AS", L"@0.5:-1.25"}, strNo, &contour, &along, &right,
                                 &up, remark, name),
              L"KB");
    EXPECT_EQ(strNo, L"01");
    EXPECT_EQ(name, L"KB01");
    EXPECT_EQ(contour, -1);
    EXPECT_DOUBLE_EQ(along, 0.5);
    EXPECT_DOUBLE_EQ(right, -1.25);
    EXPECT_DOUBLE_EQ(up, 0.0);
    EXPECT_EQ(
        ctrl.InterpretCode({L"TREE"}, strNo, &contour, nullptr, nullptr, nullptr, remark, name),
        L"TREE");
    EXPECT_EQ(strNo, L"");

    nedit::CodeSettings first;
    first.StrNoFirst = 1;
    first.ContourDigit = 1;
    const USvyCodeCtrl leading(first);
    EXPECT_EQ(
        leading.InterpretCode({L"011KB"}, strNo, &contour, nullptr, nullptr, nullptr, remark, name),
        L"KB");
    EXPECT_EQ(strNo, L"01");
    EXPECT_EQ(contour, 1);
    EXPECT_EQ(name, L"01KB");
    int number = 0;
    EXPECT_EQ(leading.Split_String(L"7", number, contour), 1);
    EXPECT_EQ(number, 7);
    EXPECT_EQ(contour, 1);  // no longer than the digits: the contour stays 1
    EXPECT_EQ(leading.Split_String(L"   ", number, contour), 0);
}

TEST(CodeGrammar, ParseStringGivesEveryGroupAndTheComment) {
    const USvyCodeCtrl ctrl;
    std::vector<USvyCodeExt> groups;
    ASSERT_EQ(ctrl.ParseString(L"KB01*AS*CLS TR05*CR/big oak*CC", groups), 2);
    EXPECT_EQ(groups[0].Code, L"KB");
    EXPECT_EQ(groups[0].StrNo, L"01");
    EXPECT_EQ(groups[0].Commands, L"AS*CLS");
    EXPECT_EQ(groups[1].Code, L"TR");
    EXPECT_EQ(groups[1].Commands, L"CR");  // CC is comment
    EXPECT_EQ(groups[1].Comment, L"big oak*CC");
    EXPECT_EQ(ctrl.ParseString(std::wstring(255, L'*'), groups), 0);
    EXPECT_EQ(ctrl.ParseString(std::wstring(250, L'X') + L"01*AS", groups), 1);
    EXPECT_EQ(groups[0].StrNo, L"01");
}

}  // namespace
