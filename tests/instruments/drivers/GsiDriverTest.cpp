// The Leica GSI driver through its C interface. Expected values are read by hand from the
// blocks (the format writes 132.47100 gon as 13247100 with unit 2) and converted with a
// separate calculation (1 gon = 0.9 degrees; 1 ft = 0.3048 m, 1 US ft = 1200/3937 m).

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr unsigned kDmsMetres = SXN_MODE_DMS | SXN_MODE_METRES;
constexpr const char* kHeader = "#VERSION-1.0 NEUTRAL FILE";

using Records = std::vector<std::string>;

struct UnitCase {
    unsigned mode;
    Records records;
};

class GsiUnits : public ::testing::TestWithParam<UnitCase> {};

// One GSI-8 block in gon and metres, written in every unit the records can have.
TEST_P(GsiUnits, AngleAndLengthUnitsOfTheRecords) {
    DriverRun gsi("gsi.so");
    const auto result = gsi.Import(
        "110003+00000102 21.102+13247100 22.102+10378200 31..00+05000000 32..00+00005156\r\n",
        GetParam().mode);
    EXPECT_EQ(result.records, GetParam().records);
}

INSTANTIATE_TEST_SUITE_P(
    EveryUnit, GsiUnits,
    ::testing::Values(
        UnitCase{kDmsMetres,
                 {kHeader, "UNIT UL=M,UA=S",
                  "SS ID=102,HA=119.132604,VA=93.241368,SD=5000.000,CO=,HD=5.156"}},
        UnitCase{SXN_MODE_GONS | SXN_MODE_METRES,
                 {kHeader, "UNIT UL=M,UA=G",
                  "SS ID=102,HA=132.47100,VA=103.78200,SD=5000.000,CO=,HD=5.156"}},
        UnitCase{SXN_MODE_DEGREES | SXN_MODE_FEET,
                 {kHeader, "UNIT UL=F,UA=D",
                  "SS ID=102,HA=119.223900,VA=93.403800,SD=16404.1995,CO=,HD=16.9160"}},
        UnitCase{SXN_MODE_DMS | SXN_MODE_US_FEET,
                 {kHeader, "UNIT UL=U,UA=S",
                  "SS ID=102,HA=119.132604,VA=93.241368,SD=16404.1667,CO=,HD=16.9160"}},
        // An unknown unit pattern counts as the first of its group.
        UnitCase{0u,
                 {kHeader, "UNIT UL=M,UA=S",
                  "SS ID=102,HA=119.132604,VA=93.241368,SD=5000.000,CO=,HD=5.156"}}));

TEST(GsiDriver, ReadsEveryUnitOfTheFormat) {
    DriverRun gsi("gsi.so");
    // Hz in mil (1600 mil = 90 degrees), V in decimal degrees, slope distance to 1/10 mm,
    // height difference to 1/100 mm and negative, reflector height in US feet.
    auto result = gsi.Import(
        "110001+00000001 21.105+16000000 22.103+09000000 31..06+00100000 33..08-00012345 "
        "87..11+00001000\n",
        SXN_MODE_DEGREES | SXN_MODE_METRES);
    EXPECT_EQ(result.records.back(),
              "SS ID=1,HA=90.000000,VA=90.00000,SD=10.0000,HT=0.3048,CO=,VD=-0.12345");
    // Sexagesimal DDD.MMSSS with tenths of seconds, and feet to 1/10000 kept in US feet.
    result = gsi.Import(
        "*110002+00000000GDEM5415 21.024+0000000003545100 "
        "22.024+0000000009117510 31..07+0000000010000000\n",
        SXN_MODE_GONS | SXN_MODE_US_FEET);
    EXPECT_EQ(result.records.back(), "SS ID=GDEM5415,HA=39.725309,VA=101.441667,SD=1000.0000,CO=");
}

TEST(GsiDriver, StationsCodesPointsAndWordsItDoesNotKnow) {
    DriverRun gsi("gsi.so");
    const auto result = gsi.Import(
        "410001+0000CODE 42....+00000001\r\n"
        "110001+0000STN1 84..10+01000000 85..10+02000000 86..10+00050000 88..10+00001550\r\n"
        "110002+00000P10 81..10+00001234 82..10+00005678\r\n"
        "110003+00000P11 21.102+10000000 22.102+10000000 31..00+00010000 87..10+00001600 "
        "99....+00000123\r\n",
        kDmsMetres);
    const Records expected = {kHeader,
                              "UNIT UL=M,UA=S",
                              "# CODE CODE INFORMATION: 1",
                              "STN ID=STN1,HI=1.550,CO=CODE",
                              "XYZ ID=STN1,E=1000.000,N=2000.000,H=50.000",
                              "PT ID=P10,E=1.234,N=5.678,H=-10000.000,CO=",
                              "SS ID=P11,HA=90.000000,VA=90.000000,SD=10.000,HT=1.600,CO=",
                              "# GSI LINE 4 WORDS NOT READ: 99:+00000123"};
    EXPECT_EQ(result.records, expected);
    EXPECT_TRUE(result.messages.empty());
}

TEST(GsiDriver, FillsInWhatABlockLeavesOut) {
    DriverRun gsi("gsi.so");
    const auto result = gsi.Import(
        // No zenith angle and no slope distance: both from the horizontal distance 3 and the
        // height difference 4 (zenith atan(3/4) = 36.869898 degrees = 36 52'11.63").
        "110001+00000001 21.102+00000000 32..00+00003000 33..00+00004000\n"
        // No slope distance: horizontal 3 over sin(95 gon).
        "110002+00000002 21.102+00000000 22.102+09500000 32..00+00003000\n"
        // Angles alone: the distance is 0, never the one before.
        "110003+00000003 21.102+05000000 22.102+10000000\n"
        // The instrument's own coordinates of an observed point come first, as a point.
        "110004+00000004 21.102+00000000 22.102+10000000 31..00+00001000 81..00+00000100 "
        "82..00+00000200 83..00+00000300 71....+000TREES\n",
        kDmsMetres);
    const Records expected = {kHeader,
                              "UNIT UL=M,UA=S",
                              "SS ID=1,HA=0.000000,VA=36.521163,SD=5.0000,CO=,HD=3.000,VD=4.000",
                              "SS ID=2,HA=0.000000,VA=85.300000,SD=3.0093,CO=,HD=3.000",
                              "SS ID=3,HA=45.000000,VA=90.000000,SD=0.000,CO=",
                              "PT ID=4,E=0.100,N=0.200,H=0.300,CO=TREES",
                              "SS ID=4,HA=0.000000,VA=90.000000,SD=1.000,CO=TREES"};
    EXPECT_EQ(result.records, expected);
    ASSERT_EQ(result.messages.size(), 1u);
    EXPECT_NE(result.messages[0].find("before any station block"), std::string::npos);
}

TEST(GsiDriver, BlocksThatCannotBeReadBecomeCommentsAndAreCounted) {
    DriverRun gsi("gsi.so");
    const std::string long_line(10000, 'X');
    const auto result = gsi.Import(
        "110001+00000001 21.102+00000000 22.102+10000000 31..00+00001000\n"
        "110002+00000002 22.102+10000000 31..00+00001000\n"  // no horizontal circle
        "110003+00000003 21..00+00000000 22.102+10000000\n"  // a length unit on an angle
        "110004+00000004 21.104+12375000 22.102+10000000\n"  // 75 minutes
        "110005+00000005 21.102+0000A000 22.102+10000000\n"  // a letter in a number
            + long_line + "\n" +
            "110006+00000006 21.102+00000000 22.102+10000000 31..00+00002000\n"
            "110007+00000007 21.102+00000000 31..00+0000",  // cut in the middle of a word
        kDmsMetres);
    ASSERT_EQ(result.records.size(), 10u);
    EXPECT_EQ(result.records[2], "SS ID=1,HA=0.000000,VA=90.000000,SD=1.000,CO=");
    EXPECT_EQ(result.records[3],
              "# GSI LINE 2 NOT READ: 110002+00000002 22.102+10000000 31..00+00001000");
    EXPECT_EQ(result.records[4],
              "# GSI LINE 3 NOT READ: 110003+00000003 21..00+00000000 22.102+10000000");
    EXPECT_EQ(result.records[5].substr(0, 22), "# GSI LINE 4 NOT READ:");
    EXPECT_EQ(result.records[6].substr(0, 22), "# GSI LINE 5 NOT READ:");
    EXPECT_NE(result.records[7].find("# GSI LINE 6 NOT READ: XXXX"), std::string::npos);
    EXPECT_NE(result.records[7].find("(10000 CHARACTERS)"), std::string::npos);
    EXPECT_EQ(result.records[8], "SS ID=6,HA=0.000000,VA=90.000000,SD=2.000,CO=");
    EXPECT_EQ(result.records[9],
              "# GSI LINE 8 NOT READ: 110007+00000007 21.102+00000000 31..00+0000");
    for (const std::string& record : result.records) EXPECT_LE(record.size(), 255u) << record;
    ASSERT_EQ(result.messages.size(), 2u);
    EXPECT_EQ(result.messages[1],
              "6 blocks of the GSI data could not be read; they stand as comments that name "
              "their lines.");
}

TEST(GsiDriver, DataOfAnotherFormatGiveNoRecordsButAMessage) {
    DriverRun gsi("gsi.so");
    const std::string kNotGsi = "The data are not Leica GSI: no GSI word was found in them.";
    // A neutral file, short.
    auto result = gsi.Import("#VERSION-1.0 NEUTRAL FILE\nSTN ID=A,HI=1.5\n", kDmsMetres);
    EXPECT_TRUE(result.records.empty());
    EXPECT_EQ(result.messages, std::vector<std::string>{kNotGsi});
    // Binary data: the driver gives up after its first 4096 bytes and ends the transfer.
    std::string binary;
    for (int i = 0; i < 100000; ++i) binary += static_cast<char>((i * 37 + 11) % 251 + 5);
    result = gsi.Import(binary, kDmsMetres, 1000);
    EXPECT_TRUE(result.records.empty());
    EXPECT_TRUE(result.ended);
    EXPECT_EQ(result.messages, std::vector<std::string>{kNotGsi});
    // An empty file is no other format: nothing at all.
    result = gsi.Import("", kDmsMetres);
    EXPECT_TRUE(result.records.empty());
    EXPECT_TRUE(result.messages.empty());
}

TEST(GsiDriver, BlocksRunTogetherOnOneLineAndSplitAcrossReads) {
    DriverRun gsi("gsi.so");
    const std::string blocks =
        "110001+00000001 21.102+00000000 22.102+10000000 31..00+00001000 "
        "110002+00000002 21.102+10000000 22.102+10000000 31..00+00002000";
    const auto whole = gsi.Import(blocks, kDmsMetres);
    ASSERT_EQ(whole.records.size(), 4u);
    EXPECT_EQ(whole.records[3], "SS ID=2,HA=90.000000,VA=90.000000,SD=2.000,CO=");
    EXPECT_EQ(gsi.Import(blocks, kDmsMetres, 1).records, whole.records);
    const std::string fixture = RawFixture("leica_gsi16_gurob.gsi");
    EXPECT_EQ(gsi.Import(fixture, kDmsMetres, 7).records, gsi.Import(fixture, kDmsMetres).records);
}

TEST(GsiDriver, ALinkEndsAtEndOfTransmissionAcknowledgesAndDropsFlowControl) {
    DriverRun gsi("gsi.so");
    const auto result = gsi.Download(
        "110001+00000001 21.102+00000000 22.102+10000000 31..00+00001000\r\n"
        "\x13"
        "110002+00000002 21.102+\x11"
        "00000000\r\n"  // XOFF and XON inside the data
        "1100\r\n"      // noise
        "\x04"
        "110003+00000003 21.102+00000000\r\n",  // after the end: never read
        kDmsMetres, SXN_DOWNLOAD_ACKNAK);
    EXPECT_TRUE(result.ended);
    ASSERT_EQ(result.records.size(), 5u);
    EXPECT_EQ(result.records[3], "SS ID=2,HA=0.000000,VA=90.000000,SD=0.000,CO=");
    EXPECT_EQ(result.records[4], "# GSI LINE 3 NOT READ: 1100");
    EXPECT_EQ(result.sent, "\x06\x06\x15");
    // Without acknowledgements nothing is sent.
    EXPECT_EQ(gsi.Download("110001+00000001 21.102+00000000\r\n", kDmsMetres, 0).sent, "");
}

TEST(GsiDriver, TheLinkIsDeadWhenNothingCameForThePeriod) {
    DriverRun gsi("gsi.so");
    const nedit::DriverFunctions& driver = gsi.Functions();
    const sxn_host host{nullptr, nullptr, nullptr, nullptr};
    sxn_session* session = driver.download(&host, kDmsMetres, 0);
    EXPECT_EQ(driver.timeOut(session, 9999, 10000), 0);
    EXPECT_EQ(driver.timeOut(session, 10000, 10000), 1);
    driver.abort(session);
}

// The fixtures, with values read by hand from their first and last blocks.
TEST(GsiDriver, TheGsi8AndGsi16FixturesAsRecorded) {
    DriverRun gsi("gsi.so");
    const auto gsi8 = gsi.Import(RawFixture("RILIEVO.gsi"), SXN_MODE_GONS | SXN_MODE_METRES);
    ASSERT_EQ(gsi8.records.size(), 2u + 23u);
    EXPECT_EQ(gsi8.records[2], "SS ID=100,HA=115.45200,VA=98.85300,SD=0.000,CO=,HD=0.000");
    EXPECT_EQ(gsi8.records[4], "SS ID=102,HA=132.47100,VA=103.78200,SD=5.165,CO=,HD=5.156");
    EXPECT_EQ(gsi8.records[24], "SS ID=122,HA=43.92100,VA=103.54100,SD=4.600,CO=,HD=4.593");

    const auto gsi16 = gsi.Import(RawFixture("leica_gsi16_gurob.gsi"), kDmsMetres);
    ASSERT_EQ(gsi16.records.size(), 3u + 343u);
    EXPECT_EQ(gsi16.records[2], "INSHT 1.324");
    EXPECT_EQ(gsi16.records[3], "SS ID=GDEM5415,HA=35.45100,VA=91.17510,SD=13.825,HT=1.300,CO=");
    EXPECT_EQ(gsi16.records.back(),
              "SS ID=GDEM5829,HA=270.56590,VA=90.00430,SD=375.995,HT=1.500,CO=");
}

}  // namespace
