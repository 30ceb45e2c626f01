// The Topcon GTS driver through its C interface. Values are read by hand from the blocks of
// topcon_gts_229 ("+00043575m" is 43.575 m, "0970930" 97.0930 gon) and converted separately
// (131.7260 gon = 118.5534 deg = 118 deg 33'12.24").

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr const char* kDriver = "gts.so";
using Records = std::vector<std::string>;

TEST(GtsDriver, TheBlocksOfAGts229) {
    DriverRun gts(kDriver);
    const auto gons = gts.Import(RawFixture("topcon_gts_229"), SXN_MODE_GONS | SXN_MODE_METRES);
    const Records& records = gons.records;
    ASSERT_EQ(records.size(), 2u + 1u + 53u);
    EXPECT_EQ(records[2], "STN ID=,HI=1.540,CO=");
    EXPECT_EQ(records[3], "SS ID=1,HA=131.7260,VA=97.0930,SD=43.575,HT=1.500,CO=,HD=43.530");
    // Point 4's target height is cut between two blocks: "_,1." and "500".
    EXPECT_EQ(records[6], "SS ID=4,HA=157.7910,VA=96.7130,SD=50.071,HT=1.500,CO=,HD=50.004");
    EXPECT_EQ(records.back(), "SS ID=53,HA=146.1500,VA=97.2180,SD=55.997,HT=1.500,CO=,HD=55.944");
    // The station has no name: the user is told that nothing is reduced until it has one.
    EXPECT_EQ(gons.messages,
              Records{"The data hold observations before any station with a name; they are "
                      "reduced only once a STN record with a name stands before them."});

    const auto dms = gts.Import(RawFixture("topcon_gts_229"), SXN_MODE_DMS | SXN_MODE_METRES, 5);
    EXPECT_EQ(dms.records[3],
              "SS ID=1,HA=118.331224,VA=87.230132,SD=43.575,HT=1.500,CO=,HD=43.530");
    EXPECT_EQ(dms.records.size(), records.size());
}

TEST(GtsDriver, UnframedRecordsCodesFeetAndRecordsNotRead) {
    DriverRun gts(kDriver);
    const auto result = gts.Import(
        "_'ST1_(CTRL_)1.500_+P1_ ?+00010000f0900000+0450000d+00010000t_*TREE_,1.200"
        "_+P2_ ?bad_*X_%UNKNOWN\n",
        SXN_MODE_DMS | SXN_MODE_FEET);
    const Records expected = {"#VERSION-1.0 NEUTRAL FILE", "UNIT UL=F,UA=S",
                              // Read in metres: no measurement had said feet yet.
                              "STN ID=ST1,HI=4.9213,CO=CTRL",
                              "SS ID=P1,HA=45.0000,VA=90.0000,SD=10.000,HT=1.200,CO=TREE,HD=10.000",
                              "# GTS LINE 1 NOT READ: _ ?bad", "# GTS _%UNKNOWN",
                              "# GTS POINT P2 WITHOUT MEASUREMENT"};
    EXPECT_EQ(result.records, expected);
    EXPECT_EQ(result.messages,
              Records{"1 line of the GTS data could not be read (line 1); they stand as comments "
                      "that name their lines."});
}

TEST(GtsDriver, TextOfAnotherFormatIsRefused) {
    DriverRun gts(kDriver);
    const auto result = gts.Import("CO,Nikon RAW data format V2.00\nSS,1,1.5,10,0,90\n",
                                   SXN_MODE_DMS | SXN_MODE_METRES);
    EXPECT_TRUE(result.records.empty());
    EXPECT_EQ(result.messages,
              Records{"The data are not Topcon GTS: no GTS record was found in them."});
}

}  // namespace
