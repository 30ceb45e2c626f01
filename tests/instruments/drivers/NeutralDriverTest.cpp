// The neutral driver through its C interface: lines pass through as records.

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr unsigned kMode = SXN_MODE_DMS | SXN_MODE_METRES;
using Records = std::vector<std::string>;

TEST(NeutralDriver, LinesPassThroughWhateverEndsThem) {
    DriverRun neutral("neutral.so");
    // A byte-order mark, CR LF, a lone CR, LF, a blank line, a tab and a Latin-1 letter.
    const auto result = neutral.Import(
        "\xEF\xBB\xBF#VERSION-1.0 NEUTRAL FILE\r\nSTN ID=A,HI=1.5\rNOTE Z\xDCRICH\n\n  \n"
        "SS\tID=P1,HA=1\n",
        kMode, 3);
    const Records expected = {"#VERSION-1.0 NEUTRAL FILE", "STN ID=A,HI=1.5", "NOTE Z\xC3\x9CRICH",
                              "SS ID=P1,HA=1"};
    EXPECT_EQ(result.records, expected);
    EXPECT_TRUE(result.messages.empty());
}

TEST(NeutralDriver, AFileWithoutTheHeaderIsRefusedALinkGetsOne) {
    DriverRun neutral("neutral.so");
    const std::string gsi = "110001+00000001 21.102+00000000\r\n";
    auto result = neutral.Import(gsi, kMode);
    EXPECT_TRUE(result.records.empty());
    EXPECT_EQ(result.messages, Records{"Neutral file header not found."});
    result = neutral.Download("STN ID=A\r\nSS ID=B\r\n\x04SS ID=C\r\n", kMode, SXN_DOWNLOAD_ACKNAK);
    EXPECT_EQ(result.records, (Records{"#VERSION-1.0 NEUTRAL FILE", "STN ID=A", "SS ID=B"}));
    EXPECT_TRUE(result.ended);
    EXPECT_EQ(result.sent, "\x06\x06");
}

TEST(NeutralDriver, ALineTooLongForARecordBecomesACommentThatNamesIt) {
    DriverRun neutral("neutral.so");
    const auto result = neutral.Import(
        "#VERSION-1.0 NEUTRAL FILE\nSTN ID=A\n" + std::string(10000, 'Q') + "\nSS ID=B\n", kMode);
    ASSERT_EQ(result.records.size(), 4u);
    EXPECT_EQ(result.records[2].substr(0, 45), "# LINE 3 TOO LONG (10000 CHARACTERS): QQQQQQQ");
    EXPECT_LE(result.records[2].size(), 255u);
    EXPECT_EQ(result.records[3], "SS ID=B");
    EXPECT_EQ(result.messages,
              Records{"1 line was longer than 255 characters; they stand as comments that name "
                      "their lines."});
}

TEST(NeutralDriver, ControlCharactersOfABinaryFileBecomeBlanks) {
    DriverRun neutral("neutral.so");
    const auto result = neutral.Import("#VERSION-1.0 NEUTRAL FILE\nSS ID=\x01\x02P\x7F", kMode);
    ASSERT_EQ(result.records.size(), 2u);
    EXPECT_EQ(result.records[1], "SS ID=  P\x7F");
}

}  // namespace
