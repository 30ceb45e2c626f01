// The Zeiss R4/R5/Rec 500 driver through its C interface. Values are read by hand from the
// sample files (X is north, Y east); the R4 and R5 files hold the same survey, so they must
// give the same records.

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr const char* kDriver = "zeiss.so";
constexpr unsigned kGonsMetres = SXN_MODE_GONS | SXN_MODE_METRES;
using Records = std::vector<std::string>;

Records WithoutComments(const Records& records) {
    Records kept;
    for (const std::string& record : records) {
        if (record.rfind("# ", 0) != 0) kept.push_back(record);
    }
    return kept;
}

TEST(ZeissDriver, TheR4AndR5LayoutsOfOneSurvey) {
    DriverRun zeiss(kDriver);
    const auto r4 = zeiss.Import(RawFixture("zeiss_elta_r55-R4.tops"), kGonsMetres);
    const auto r5 = zeiss.Import(RawFixture("zeiss_elta_r55-R5.tops"), kGonsMetres);
    EXPECT_TRUE(r4.messages.empty());
    const Records records = WithoutComments(r4.records);
    EXPECT_EQ(WithoutComments(r5.records), records);
    const Records head = {"#VERSION-1.0 NEUTRAL FILE",
                          "UNIT UL=M,UA=G",
                          "XYZ ID=0,E=0.000,N=0.000,H=-10000.000",
                          "STN ID=0,CO=",
                          "XYZ ID=0,E=46.475,N=23.926,H=0.000",
                          "SCALE 0.999198",
                          "SWING 21.9645",
                          "TARGETHT 1.500",
                          "INSHT 1.486",
                          "STN ID=1,CO=",
                          "PT ID=1100,E=59.620,N=21.259,H=11.256,CO=NTR"};
    EXPECT_EQ(Records(records.begin(), records.begin() + head.size()), head);
    EXPECT_EQ(records.back(), "PT ID=1241,E=50.354,N=18.092,H=11.405,CO=ORD");
    EXPECT_EQ(CountOf(records, "PT "), 142);
    // The station's height alone has no record: its line stands as a comment.
    EXPECT_EQ(FirstOf(r4.records, "# For R4|KR S     1"),
              "# For R4|KR S     1|                   |                   |Z       12.232 m   |");
}

TEST(ZeissDriver, TheRec500Layout) {
    DriverRun zeiss(kDriver);
    const auto big = zeiss.Import(RawFixture("zeiss_elta_r55-REC_500.tops"), kGonsMetres);
    const Records records = WithoutComments(big.records);
    EXPECT_EQ(records[2], "XYZ ID=506,E=-59.853,N=58.670,H=-10000.000");
    EXPECT_EQ(records[3], "STN ID=506,CO=");
    EXPECT_EQ(records[4], "XYZ ID=506,E=-107.371,N=63.174,H=0.000");
    EXPECT_EQ(records[5], "SCALE 1.002785");
    EXPECT_EQ(records[6], "SWING 399.9670");
    EXPECT_EQ(records[7], "STN ID=507,CO=");
    EXPECT_EQ(records[8], "PT ID=508,E=-91.484,N=77.688,H=156.261,CO=0863");
    EXPECT_EQ(records.back(), "PT ID=628,E=-94.570,N=69.085,H=155.802,CO=872");
    EXPECT_EQ(CountOf(records, "PT "), 121);

    // The orientation may follow the station it belongs to.
    const auto small = zeiss.Import(RawFixture("zeiss_elta_r55"), kGonsMetres);
    const Records expected = {"#VERSION-1.0 NEUTRAL FILE",
                              "UNIT UL=M,UA=G",
                              "# 0001 OR.COOR",
                              "STN ID=0,CO=",
                              "XYZ ID=0,E=0.000,N=0.000,H=0.000",
                              "SWING 397.0370",
                              "# 0004 POLAR",
                              "TARGETHT 1.500",
                              "INSHT 0.000",
                              "# 0005 INPUT                       th       1.500 ih        0.000",
                              "TARGETHT 0.000",
                              "INSHT 0.000",
                              "# 0006 INPUT                       th       0.000 ih        0.000 Z"
                              "     0.000",
                              "PT ID=1,E=1.576,N=-0.472,H=0.004,CO=",
                              "# END"};
    EXPECT_EQ(small.records, expected);
}

TEST(ZeissDriver, PolarReadingsUnitsAndIdentifiersOfEveryLayout) {
    DriverRun zeiss(kDriver);
    const std::string polar =
        "For R5|Adr 0001|PR ABC  12|SD      10.000 m   |Hz     100.0000 grd|V1     100.0000 grd|";
    const std::string strange_unit =
        "For R5|Adr 0002|PR     13|SD      10.000 m   |Hz     100.0000 xyz|                   |";
    const std::string strange_value =
        "For R4|KR      14|X        1.000 m   |Y        2.000 m   |Q        5.000 m   |";
    // A horizontal distance of 3 and a height difference of 4: zenith atan(3/4) = 40.966553 gon.
    const std::string distances = "   0004 " + std::string(17, ' ') + "15" + std::string(9, ' ') +
                                  "Hz      50.0000 HD       3.000 h        4.000";
    const std::string nameless = "For R4|KR A|X        1.000 m   |";
    const auto result = zeiss.Import(polar + "\n" + strange_unit + "\n" + strange_value + "\n" +
                                         distances + "\n" + nameless + "\n",
                                     kGonsMetres);
    const Records expected = {"#VERSION-1.0 NEUTRAL FILE",
                              "UNIT UL=M,UA=G",
                              "SS ID=12,HA=100.0000,VA=100.0000,SD=10.000,CO=ABC",
                              "# ZEISS LINE 2 NOT READ: " + strange_unit,
                              "PT ID=14,E=2.000,N=1.000,H=-10000.000,CO=",
                              "# " + strange_value,
                              "SS ID=15,HA=50.0000,VA=40.966553,SD=5.0000,CO=,HD=3.000,VD=4.000",
                              "# ZEISS LINE 5 NOT READ: " + nameless};
    EXPECT_EQ(result.records, expected);
    EXPECT_EQ(result.messages.size(), 2u);  // no station, and the lines not read
}

}  // namespace
