// The Sokkia SDR driver through its C interface: the SDR33 fixture, read by hand column by
// column, and records of both layouts built field by field.

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr const char* kDriver = "sdr.so";
using Records = std::vector<std::string>;

std::string Pad(const std::string& text, std::size_t width) {
    return text + std::string(width - text.size(), ' ');
}

// A record of SDR33: the type and derivation, then each field in 16 columns.
std::string Record(const std::string& type, std::initializer_list<std::string> fields) {
    std::string line = type;
    for (const std::string& field : fields) line += Pad(field, 16);
    return line;
}

TEST(SdrDriver, TheSdr33FixtureAsRecorded) {
    DriverRun sdr(kDriver);
    const auto result =
        sdr.Import(RawFixture("sokkia_sdr33.tops"), SXN_MODE_GONS | SXN_MODE_METRES);
    EXPECT_TRUE(result.messages.empty());
    const Records& records = result.records;
    ASSERT_EQ(records.size(), 23u);
    EXPECT_EQ(records[1], "UNIT UL=M,UA=G");
    EXPECT_EQ(records[2], "# 00NMSDR33 V04-04.02     00-000-00 00:00 211111");
    EXPECT_EQ(records[3], "JOB JOB3");
    EXPECT_EQ(records[7], "# 13PCP.C. mm Applied:-30.000");
    // Station 00000031 at N 509.97, E 937.274, elevation 20.053, instrument height 1.505.
    EXPECT_EQ(records[8], "STN ID=31,HI=1.50500000,CO=11");
    EXPECT_EQ(records[9], "XYZ ID=31,E=937.27400000,N=509.97000000,H=20.05300000");
    EXPECT_EQ(records[10], "TARGETHT 1.60000000");
    EXPECT_EQ(records[11], "PT ID=9,E=908.83800000,N=510.50400000,H=19.69900000,CO=11");
    EXPECT_EQ(records[22], "PT ID=20,E=915.51400000,N=506.79700000,H=19.55600000,CO=11");
}

TEST(SdrDriver, BackSightsFacesAndCoordinatesOfAnSdr33File) {
    DriverRun sdr(kDriver);
    // Degrees (ddd.mmss), feet, coordinates east first, vertical angles from the horizon.
    const std::string header = "00NMSDR33 V04-04.02     00-000-00 00:00 122121\r\n";
    const std::string instrument = "01KI1" + std::string(45, ' ') + "2\r\n";
    const std::string coordinates = Record("08KI", {"C1", "1.000", "2.000", "3.000", "CONTROL"});
    const std::string bad = Record("09F1", {"C1", "E", "1O.000", "0.0000", "10.0000"});
    const auto result = sdr.Import(
        "\x02\r\n" + header + instrument +
            Record("02KI", {"A", "100.000", "200.000", "10.000", "1.500", "STN"}) + "\r\n" +
            Record("07KI", {"A", "B", "45.3000", "0.0000"}) + "\r\n" +
            Record("09F1", {"A", "B", "50.000", "2.3000", "0.0000", "BS"}) + "\r\n" +
            Record("09F2", {"A", "B", "50.000", "-2.3000", "180.0000", "BS"}) + "\r\n" +
            Record("09F1", {"A", "0007", "20.000", "0.0000", "90.1530", "TREE"}) + "\r\n" +
            coordinates + "\r\n" + Record("09MC", {"C1", "D", "10.000", "0.0000", "10.0000", ""}) +
            "\r\n" + bad + "\r\n\x03" + "58903\r\n",
        SXN_MODE_DMS | SXN_MODE_FEET);
    const Records expected = {
        "#VERSION-1.0 NEUTRAL FILE",
        "UNIT UL=F,UA=S",
        "# 00NMSDR33 V04-04.02     00-000-00 00:00 122121",
        "# 01KI1" + std::string(45, ' ') + "2",
        "STN ID=A,HI=1.500,CO=STN",
        "XYZ ID=A,E=100.000,N=200.000,H=10.000",
        "BKB ID=B,BRG=45.3000,HA=0.0000",
        "BS ID=B,HA=0.0000,VA=87.300000,SD=50.000,CO=BS",
        "BS ID=B,HA=180.0000,VA=92.300000,SD=50.000,CO=BS",
        "SS ID=7,HA=90.1530,VA=90.000000,SD=20.000,CO=TREE",
        "XYZ ID=C1,E=1.000,N=2.000,H=3.000",
        "# " + coordinates.substr(0, coordinates.find_last_not_of(' ') + 1),
        "STN ID=C1,CO=",
        "SS ID=D,HA=10.0000,VA=90.000000,SD=10.000,CO=",
        "# SDR LINE 11 NOT READ: " + bad.substr(0, bad.find_last_not_of(' ') + 1)};
    EXPECT_EQ(result.records, expected);
    EXPECT_EQ(result.messages.size(), 1u);
}

TEST(SdrDriver, TheNarrowLayoutOfSdr2x) {
    DriverRun sdr(kDriver);
    // Names in 4 columns, numbers in 10, descriptions in 16.
    const auto result = sdr.Import(
        "00NM" + Pad("SDR20V03-05", 16) + "    " + Pad("00-000-00 00:00", 16) + "211111\r\n" +
            "02KI0001" + Pad("1000.000", 10) + Pad("2000.000", 10) + Pad("50.000", 10) +
            Pad("1.600", 10) + Pad("STN", 16) + "\r\n" + "09F100010002" + Pad("25.000", 10) +
            Pad("100.0000", 10) + Pad("50.0000", 10) + Pad("CURB", 16) + "\r\n",
        SXN_MODE_GONS | SXN_MODE_METRES);
    ASSERT_EQ(result.records.size(), 6u);
    EXPECT_EQ(result.records[3], "STN ID=1,HI=1.600,CO=STN");
    EXPECT_EQ(result.records[4], "XYZ ID=1,E=2000.000,N=1000.000,H=50.000");
    EXPECT_EQ(result.records[5], "SS ID=2,HA=50.0000,VA=100.0000,SD=25.000,CO=CURB");
}

}  // namespace
