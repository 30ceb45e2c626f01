#include <gtest/gtest.h>

#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <string>

#include "platform/text/Format.h"
#include "platform/text/NumberText.h"

using namespace nedit;

TEST(Format, TheSystemsRecordFormatsComeOutAsWritten) {
    EXPECT_EQ(Format(L"%-10s ID=%s,HI=0.000,CO= ", L"STN", std::wstring(L"P1")),
              L"STN        ID=P1,HI=0.000,CO= ");
    EXPECT_EQ(Format(L"%-8s %s=%s,%s=%.3f,%s=%.3f,%s=%.3f", L"XYZ", L"ID", L"A", L"E", 1000.0, L"N",
                     2000.0004, L"H", -0.0005),
              L"XYZ      ID=A,E=1000.000,N=2000.000,H=-0.001");
    // A format made by a format, as the back-bearing record is built for the job's decimals.
    const std::wstring made = Format(L"%%-8s %%s=%%s,%%s=%%.%df,%%s=%%.%df", 4, 4);
    EXPECT_EQ(made, L"%-8s %s=%s,%s=%.4f,%s=%.4f");
    EXPECT_EQ(Format(made, L"BKB", L"ID", L"D", L"BRG", 45.0, L"HA", 0.0),
              L"BKB      ID=D,BRG=45.0000,HA=0.0000");
}

TEST(Format, WidthsCountCharactersAndEveryConversionWorks) {
    EXPECT_EQ(Format(L"[%5s][%-5s][%.2s]", L"\u00c9T", L"ab", L"xyz"), L"[   \u00c9T][ab   ][xy]");
    EXPECT_EQ(Format(L"%d|%5d|%-4d|%03d|%x|%X|%o", 7, 42, 3, 5, 255, 255, 8),
              L"7|   42|3   |005|ff|FF|10");
    EXPECT_EQ(Format(L"%.3f|%10.4f|%e|%g|%c|%%", 2.0, -1.5, 1500.0, 0.0001, L'Z'),
              L"2.000|   -1.5000|1.500000e+03|0.0001|Z|%");
    EXPECT_EQ(Format(L"%*d|%-*s|%.*f", 4, 1, 3, L"a", 2, 3.14159), L"   1|a  |3.14");
    EXPECT_EQ(Format(L"%ld %lld %zu", 1L, 2LL, std::size_t{3}), L"1 2 3");
}

TEST(Format, MismatchedOrMissingArgumentsAreConvertedNotUndefined) {
    EXPECT_EQ(Format(L"%d %s %f", 3.9, 12, L"2.5"), L"3 12 2.500000");
    EXPECT_EQ(Format(L"%s|%d|%q", L"a"), L"a|0|");
    EXPECT_EQ(Format(L"%d", 1e300), L"9200000000000000000");
}

namespace {

// Switches the process to a locale whose decimal mark is a comma, building one into a
// temporary directory when the machine has none installed. False when neither works.
bool UseDecimalCommaLocale() {
    if (std::setlocale(LC_ALL, "de_DE.UTF-8") != nullptr) return true;
    const std::string dir = ::testing::TempDir() + "locales";
    const std::string command = "mkdir -p '" + dir + "' && localedef -i de_DE -f UTF-8 '" + dir +
                                "/de_DE.UTF-8' >/dev/null 2>&1";
    if (std::system(command.c_str()) != 0) return false;
    setenv("LOCPATH", dir.c_str(), 1);
    return std::setlocale(LC_ALL, "de_DE.UTF-8") != nullptr;
}

}  // namespace

TEST(Format, NumbersKeepTheirDecimalPointUnderAnotherLocale) {
    if (!UseDecimalCommaLocale()) GTEST_SKIP() << "no locale with a decimal comma can be had";
    char probe[16];
    std::snprintf(probe, sizeof probe, "%.1f", 1.5);
    const std::wstring text = Format(L"%.3f|%g", 1.5, 0.25);
    const double read = TextToDouble(L"2.75");
    std::setlocale(LC_ALL, "C");
    ASSERT_STREQ(probe, "1,5") << "the locale did not take";
    EXPECT_EQ(text, L"1.500|0.25");
    EXPECT_EQ(read, 2.75);
}
