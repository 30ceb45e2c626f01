#include <gtest/gtest.h>

#include <climits>
#include <string>

#include "platform/text/NumberText.h"

using namespace nedit;

namespace {

struct NumberCase {
    const wchar_t* text;
    double expected;
};

class TextToDoubleReads : public ::testing::TestWithParam<NumberCase> {};

}  // namespace

INSTANTIATE_TEST_SUITE_P(Texts, TextToDoubleReads,
                         ::testing::Values(NumberCase{L"35.214", 35.214},
                                           NumberCase{L"  -2.5", -2.5}, NumberCase{L"+7", 7.0},
                                           NumberCase{L"12.5M", 12.5}, NumberCase{L"1.5e3", 1500.0},
                                           NumberCase{L".5", 0.5}, NumberCase{L"", 0.0},
                                           NumberCase{L"ABC", 0.0}, NumberCase{L"--3", 0.0},
                                           NumberCase{L"nan", 0.0}, NumberCase{L"inf", 0.0},
                                           NumberCase{L"1e400", 0.0}, NumberCase{L"1,5", 1.0},
                                           NumberCase{L"0.99960", 0.9996}));

TEST_P(TextToDoubleReads, TheLeadingNumberOrGivesZero) {
    EXPECT_DOUBLE_EQ(TextToDouble(GetParam().text), GetParam().expected);
    // UTF-8 text reads alike.
    const std::wstring_view wide = GetParam().text;
    EXPECT_DOUBLE_EQ(TextToDouble(std::string(wide.begin(), wide.end())), GetParam().expected);
}

TEST(NumberText, TextToIntReadsTheLeadingWholeNumber) {
    EXPECT_EQ(TextToInt(L"42"), 42);
    EXPECT_EQ(TextToInt(L" -7x"), -7);
    EXPECT_EQ(TextToInt(L"3.9"), 3);
    EXPECT_EQ(TextToInt(L"x3"), 0);
    EXPECT_EQ(TextToInt(L"99999999999"), INT_MAX);
    EXPECT_EQ(TextToInt(L"-99999999999"), INT_MIN);
}

TEST(NumberText, DoubleToTextIsShortestAndExact) {
    EXPECT_EQ(DoubleToText(35.214), L"35.214");
    EXPECT_EQ(DoubleToText(-2.0), L"-2");
    EXPECT_EQ(DoubleToText(0.1 + 0.2), L"0.30000000000000004");
    const double awkward = 123.0 + 45.0 / 60.0 + 30.0 / 3600.0;
    EXPECT_EQ(TextToDouble(DoubleToText(awkward)), awkward);
}
