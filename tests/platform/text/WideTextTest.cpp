#include <gtest/gtest.h>

#include "platform/text/WideText.h"

using namespace nedit;

TEST(WideText, Utf8RoundTripsAndMarksMalformedBytes) {
    const std::wstring text = L"Pt \u00e9\u00df \u0416 \U0001F4CD";
    EXPECT_EQ(FromUtf8(ToUtf8(text)), text);
    EXPECT_EQ(ToUtf8(L"\u00e9"), "\xC3\xA9");
    // A stray continuation byte, a truncated sequence, an overlong '/' and a surrogate.
    EXPECT_EQ(FromUtf8("a\x80"
                       "b"),
              L"a\uFFFD"
              L"b");
    EXPECT_EQ(FromUtf8("\xC3"), L"\uFFFD");
    EXPECT_EQ(FromUtf8("\xC0\xAF"), L"\uFFFD\uFFFD");
    EXPECT_EQ(FromUtf8("\xED\xA0\x80"), L"\uFFFD\uFFFD\uFFFD");
    EXPECT_FALSE(IsValidUtf8("\xC3("));
    EXPECT_TRUE(IsValidUtf8("plain \xC3\xA9"));
}

TEST(WideText, FileLinesThatAreNotUtf8AreReadAsLatin1) {
    EXPECT_EQ(DecodeTextLine("CO=CAF\xC9"), L"CO=CAF\u00c9");
    EXPECT_EQ(DecodeTextLine("CO=CAF\xC3\x89"), L"CO=CAF\u00c9");
}

TEST(WideText, UpperCaseCoversAccentedLettersAndIgnoresTheUsersLocale) {
    EXPECT_EQ(ToUpper(L"stn id=p1,co=caf\u00e9 \u0436"), L"STN ID=P1,CO=CAF\u00c9 \u0416");
    EXPECT_EQ(ToLower(L"ID=P1"), L"id=p1");
    EXPECT_EQ(ToUpper(L"123 ,=#"), L"123 ,=#");
}

TEST(WideText, TrimmingAndSmallHelpers) {
    EXPECT_EQ(Trim(L" \t ab c \r\n"), L"ab c");
    EXPECT_EQ(TrimLeft(L"  x "), L"x ");
    EXPECT_EQ(TrimRight(L"  x "), L"  x");
    EXPECT_EQ(Trim(L"   "), L"");
    EXPECT_EQ(TrimChars(L",,2026-11-20,", L","), L"2026-11-20");
    EXPECT_EQ(TrimChars(L",,,", L","), L"");
    EXPECT_EQ(Left(L"abc", 2), L"ab");
    EXPECT_EQ(Left(L"abc", 9), L"abc");
    EXPECT_EQ(CountOf(L"E=1,N=2,H=3", L','), 2);
    EXPECT_TRUE(StartsWith(L"#VERSION", L"#V"));
    EXPECT_FALSE(EndsWith(L"E", L"FILE"));
}
