// The drivers of the Leica TPS 700 and System 1200 exports through their C interface. Values
// are read by hand from leica_tcr_705 and leica_tcr_1205. The 1205's angles are ddd.mmss:
// sin(56 deg 26'59") x 4.696 = 3.914, its own horizontal distance, where the decimal reading
// would give 3.907.

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr const char* kTps700 = "tps700.so";
constexpr const char* kTps1200 = "tps1200.so";
constexpr unsigned kDmsMetres = SXN_MODE_DMS | SXN_MODE_METRES;
using Records = std::vector<std::string>;

TEST(LeicaExportDriver, TheTps700ExportAsRecorded) {
    DriverRun tps(kTps700);
    const auto result = tps.Import(RawFixture("leica_tcr_705"), kDmsMetres);
    const Records& records = result.records;
    const Records head = {"#VERSION-1.0 NEUTRAL FILE",
                          "UNIT UL=M,UA=S",
                          "# Oxford Archaeology Survey.",
                          "JOB SCRAS01",
                          "NAME MB",
                          "DATE 08/02/05",
                          "# INS. NO.    656205",
                          "INSTRU TCR705",
                          "STN ID=1000,HI=0.000,CO=",
                          "BKB ID=0",
                          "PT ID=100,E=999.630,N=1002.620,H=98.406,CO=WALL01"};
    ASSERT_GT(records.size(), head.size());
    EXPECT_EQ(Records(records.begin(), records.begin() + head.size()), head);
    EXPECT_EQ(CountOf(records, "STN "), 5);
    EXPECT_EQ(FirstOf(records, "BKB ID=1"), "BKB ID=105");
    // 71 point lines, 29 of them the export's 1.00 rows.
    EXPECT_EQ(CountOf(records, "PT "), 71 - 29);
    EXPECT_EQ(CountOf(records, "# TPS700 POINT WITHOUT COORDINATES: "), 29);
    EXPECT_EQ(FirstOf(records, "# TPS700 POINT WITHOUT COORDINATES: "),
              "# TPS700 POINT WITHOUT COORDINATES: 1001,       1.00,       1.00,       1.00, "
              "WALL01 --------");
    EXPECT_EQ(records[records.size() - 2], "PT ID=T4,E=1001.972,N=998.705,H=96.932,CO=WALL04");
    EXPECT_EQ(records.back(), "# File End.");
    EXPECT_EQ(result.messages,
              Records{"29 point lines have no coordinates (1.00, 1.00, 1.00); they stand as "
                      "comments."});
}

TEST(LeicaExportDriver, Tps700PointLinesThatCannotBeRead) {
    DriverRun tps(kTps700);
    const auto result = tps.Import(
        "SETUP SN      7\nIH     1.550\n  200,  abc,   1.0,   2.0, X ----\n  201,  5.0,   6.0,   "
        "7.0\n",
        kDmsMetres);
    const Records expected = {"#VERSION-1.0 NEUTRAL FILE", "UNIT UL=M,UA=S",
                              "# TPS700 LINE 3 NOT READ:   200,  abc,   1.0,   2.0, X ----",
                              "STN ID=7,HI=1.550,CO=", "PT ID=201,E=5.0,N=6.0,H=7.0,CO="};
    EXPECT_EQ(result.records, expected);
    // Comma-separated records of another format are no point lines.
    const auto nikon = tps.Import(RawFixture("nikon_raw_v200.tops"), kDmsMetres);
    EXPECT_TRUE(nikon.records.empty());
    EXPECT_EQ(nikon.messages, Records{"The data are not Leica TPS 700 export: no TPS700 record was "
                                      "found in them."});
}

TEST(LeicaExportDriver, TheSystem1200ExportAsRecorded) {
    DriverRun tps(kTps1200);
    const auto result = tps.Import(RawFixture("leica_tcr_1205"), kDmsMetres);
    EXPECT_TRUE(result.messages.empty());
    const Records& records = result.records;
    EXPECT_EQ(FirstOf(records, "DATE "), "DATE 02.07.08  13:54:41");
    EXPECT_EQ(FirstOf(records, "JOB "), "JOB OSN020708");
    EXPECT_EQ(FirstOf(records, "NAME "), "NAME MEL");
    EXPECT_EQ(FirstOf(records, "INSTRU "), "INSTRU TCRP1205");
    EXPECT_EQ(FirstOf(records, "XYZ "), "XYZ ID=OA6,E=450398.831,N=205884.254,H=56.973");
    EXPECT_EQ(FirstOf(records, "STN ID=OA15"), "STN ID=OA15,HI=1.657,CO=");
    EXPECT_EQ(FirstOf(records, "SS "),
              "SS ID=OA9,HA=73.0632,VA=90.2450,SD=3.513,HT=0.000,CO=,HD=3.513");
    EXPECT_EQ(FirstOf(records, "PT ID=10000"),
              "PT ID=10000,E=450403.994,N=205882.988,H=58.689,CO=BS");
    EXPECT_EQ(FirstOf(records, "# TPS1200 LINE "), "# TPS1200 LINE Line0001 CODE RT");
    EXPECT_EQ(FirstOf(records, "PT ID=10001"),
              "PT ID=10001,E=450402.042,N=205885.618,H=61.309,CO=RT");
    EXPECT_EQ(FirstOf(records, "SS ID=10001"),
              "SS ID=10001,HA=21.0602,VA=56.2659,SD=4.696,HT=0.000,CO=,HD=3.914");
    EXPECT_EQ(CountOf(records, "SS "), 711);
    EXPECT_EQ(CountOf(records, "STN "), 2);
    // The export writes 46 deg 08'60" for 46 deg 09': it is read, and written as it should be.
    EXPECT_EQ(FirstOf(records, "SS ID=1130,"),
              "SS ID=1130,HA=30.2637,VA=46.090000,SD=4.932,HT=0.000,CO=,HD=3.557");
    EXPECT_EQ(records.back(), "# System 1200 Data Export - File End");
}

}  // namespace
