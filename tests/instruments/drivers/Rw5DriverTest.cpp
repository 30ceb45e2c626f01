// The Carlson RW5 driver through its C interface. Values are read by hand from the records
// of Trav_19leg.rw5 (angles ddd.mmss, lengths US feet) and converted separately
// (1 US ft = 1200/3937 m; 9 deg 14'18" = 9.238333 deg).

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr const char* kDriver = "rw5.so";
using Records = std::vector<std::string>;

TEST(Rw5Driver, TheTraverseFileAsRecorded) {
    DriverRun rw5(kDriver);
    const auto result = rw5.Import(RawFixture("Trav_19leg.rw5"), SXN_MODE_DMS | SXN_MODE_US_FEET);
    EXPECT_TRUE(result.messages.empty());
    const Records& records = result.records;
    EXPECT_EQ(records[1], "UNIT UL=U,UA=S");
    // 81 set-ups, 119 BD and 76 BR back sights, 76 FD, 76 FR and 77 SS shots.
    EXPECT_EQ(CountOf(records, "STN "), 81);
    EXPECT_EQ(CountOf(records, "BKB "), 81);
    EXPECT_EQ(CountOf(records, "BS "), 119 + 76);
    EXPECT_EQ(CountOf(records, "SS "), 76 + 76 + 77);
    EXPECT_EQ(CountOf(records, "XYZ "), 3 + 81);
    // 579 notes, and the three SP records for the descriptions their XYZ records leave out.
    EXPECT_EQ(CountOf(records, "# "), 579 + 3);
    EXPECT_EQ(CountOf(records, "# RW5 LINE"), 0);

    EXPECT_EQ(FirstOf(records, "XYZ ID=103"), "XYZ ID=103,E=20000.0000,N=50000.0000,H=500.0000");
    EXPECT_EQ(FirstOf(records, "STN "), "STN ID=104,HI=5.330,CO=TPT._5/8\"IRW/ALUM.CAP");
    const auto station = std::find(records.begin(), records.end(), FirstOf(records, "STN "));
    EXPECT_EQ(station[1], "XYZ ID=104,E=21085.86000,N=50000.00000,H=0.000");
    EXPECT_EQ(station[2], "BKB ID=103,HA=0.0000");
    EXPECT_EQ(station[3],
              "BS ID=103,HA=0.0000,VA=90.5410,SD=1085.996,HT=5.690,CO=TPT._5/8\"IRW/ALUM.CAP");
    // FR,OP104,FP105,AR9.1418,ZE270.3719,SD619.474 after LS,HI5.330,HR5.630: face 2 kept.
    EXPECT_EQ(FirstOf(records, "SS ID=105,HA=9"),
              "SS ID=105,HA=9.1418,VA=270.3719,SD=619.474,HT=5.630,CO=TPT._5/8\"IRW/P-CAP");
    EXPECT_EQ(FirstOf(records, "SS ID=1093"),
              "SS ID=1093,HA=84.3256,VA=89.0510,SD=1086.001,HT=5.660,CO=CK._104");
}

TEST(Rw5Driver, UsFeetOfTheModeNoteBecomeMetres) {
    DriverRun rw5(kDriver);
    const auto result =
        rw5.Import(RawFixture("Trav_19leg.rw5"), SXN_MODE_DEGREES | SXN_MODE_METRES);
    // 619.474 US ft = 188.81605 m, 5.630 US ft = 1.71603 m, 270 deg 37'19" = 270.621944.
    EXPECT_EQ(FirstOf(result.records, "SS ID=105,HA=9"),
              "SS ID=105,HA=9.238333,VA=270.621944,SD=188.8161,HT=1.7160,CO=TPT._5/8\"IRW/P-CAP");
    EXPECT_EQ(FirstOf(result.records, "XYZ ID=103"),
              "XYZ ID=103,E=6096.01219,N=15240.03048,H=152.40030");
}

TEST(Rw5Driver, EveryWayOfWritingAnObservation) {
    DriverRun rw5(kDriver);
    const auto result = rw5.Import(
        "MO,AD0,UN1,SF0.99990000,EC0,EO0.0,AU1\n"             // metres and gons
        "JB,NMTEST,DT01-02-2003,TM10:00:00\n"                 //
        "SP,PN1,N 100.000,E 200.000,EL10.000\n"               //
        "OC,OP1,N 100.000,E 200.000\n"                        // no elevation
        "LS,HI1.500,HR1.800\n"                                //
        "BK,OP1,BP2,BS50.0000,BC10.0000\n"                    //
        "SS,OP1,FP3,AL100.0000,ZE100.0000,SD10.000,--TREE\n"  // 400 - 100 gon
        "SS,OP1,FP4,DR10.0000,VA5.0000,HD20.000\n"            // 200 + 10 gon; 100 - 5 gon; 20 / sin
        "SS,OP1,FP5,DL10.0000,CE2.000,HD20.000\n"             // 200 - 10 gon; atan2(20, 2); hypot
        "SS,OP1,FP6,AZ150.0000,ZE100.0000,SD5.000\n"          // 10 + 150 - 50 gon
        "LS,HI1.600\n"                                        // a new height within the set-up
        "GPS,PN9,LA45.1,LN-66.0,EL30.2\n",
        SXN_MODE_GONS | SXN_MODE_METRES);
    const Records expected = {"#VERSION-1.0 NEUTRAL FILE",
                              "UNIT UL=M,UA=G",
                              "SCALE 0.99990000",
                              "# MO,AD0,UN1,SF0.99990000,EC0,EO0.0,AU1",
                              "JOB TEST",
                              "DATE 01-02-2003",
                              "# JB,NMTEST,DT01-02-2003,TM10:00:00",
                              "XYZ ID=1,E=200.000,N=100.000,H=10.000",
                              "STN ID=1,HI=1.500,CO=",
                              "XYZ ID=1,E=200.000,N=100.000,H=-10000.000",
                              "BKB ID=2,BRG=50.0000,HA=10.0000",
                              "SS ID=3,HA=300.000000,VA=100.0000,SD=10.000,HT=1.800,CO=TREE",
                              "SS ID=4,HA=210.000000,VA=95.000000,SD=20.0618,HT=1.800,CO=",
                              "SS ID=5,HA=190.000000,VA=93.654897,SD=20.0998,HT=1.800,CO=",
                              "SS ID=6,HA=110.000000,VA=100.0000,SD=5.000,HT=1.800,CO=",
                              "INSHT 1.600",
                              "# GPS,PN9,LA45.1,LN-66.0,EL30.2"};
    EXPECT_EQ(result.records, expected);
    EXPECT_TRUE(result.messages.empty());
}

TEST(Rw5Driver, LinesThatCannotBeReadAreNamed) {
    DriverRun rw5(kDriver);
    const auto result = rw5.Import(
        "OC,OP1,N 1.0,E 2.0,EL3.0\n"
        "SS,OP1,FP7,AR1.0000,ZE1X0.0000,SD5.000\n"  // a letter in the zenith angle
        "just some text\n"                          // no record type
        "SS,OP1,FP8,ZE90.0000,SD5.000\n"            // no horizontal reading
        "SS,OP1,FP9,AR1.7500,ZE90.0000,SD5.000\n"   // 75 minutes
        "OC,OP2,N north,E 2.0\n",                   // a coordinate that is no number
        SXN_MODE_DMS | SXN_MODE_METRES);
    const Records& records = result.records;
    ASSERT_EQ(records.size(), 9u);
    EXPECT_EQ(records[2], "STN ID=1,CO=");
    EXPECT_EQ(records[4], "# RW5 LINE 2 NOT READ: SS,OP1,FP7,AR1.0000,ZE1X0.0000,SD5.000");
    EXPECT_EQ(records[5], "# RW5 LINE 3 NOT READ: just some text");
    EXPECT_EQ(records[6], "# RW5 LINE 4 NOT READ: SS,OP1,FP8,ZE90.0000,SD5.000");
    EXPECT_EQ(records[7], "# RW5 LINE 5 NOT READ: SS,OP1,FP9,AR1.7500,ZE90.0000,SD5.000");
    EXPECT_EQ(records[8], "# RW5 LINE 6 NOT READ: OC,OP2,N north,E 2.0");
    EXPECT_EQ(result.messages,
              Records{"5 lines of the RW5 data could not be read (lines 2, 3, 4, 5, 6); they "
                      "stand as comments that name their lines."});
}

TEST(Rw5Driver, TheMessageNamesTheFirstTenLinesNotRead) {
    DriverRun rw5(kDriver);
    std::string data = "OC,OP1\n";
    for (int i = 0; i < 12; ++i) data += "?\n";
    const auto result = rw5.Import(data, SXN_MODE_DMS | SXN_MODE_METRES);
    EXPECT_EQ(CountOf(result.records, "# RW5 LINE "), 12);
    EXPECT_EQ(result.messages,
              Records{"12 lines of the RW5 data could not be read (lines 2, 3, 4, 5, 6, 7, 8, 9, "
                      "10, 11, ...); they stand as comments that name their lines."});
}

TEST(Rw5Driver, DataOfAnotherFormatAndRecordsSplitAcrossReads) {
    DriverRun rw5(kDriver);
    const auto other = rw5.Import("110001+00000001 21.102+00000000\r\nsome text\r\n",
                                  SXN_MODE_DMS | SXN_MODE_METRES);
    EXPECT_TRUE(other.records.empty());
    EXPECT_EQ(other.messages,
              Records{"The data are not Carlson RW5: no RW5 record was found in them."});
    const std::string file = RawFixture("Trav_19leg.rw5");
    EXPECT_EQ(rw5.Import(file, SXN_MODE_DMS | SXN_MODE_FEET, 7).records,
              rw5.Import(file, SXN_MODE_DMS | SXN_MODE_FEET).records);
}

}  // namespace
