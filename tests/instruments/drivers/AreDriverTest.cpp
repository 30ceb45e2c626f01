// The Trimble ARE driver through its C interface. Values are read by hand from the labels of
// BSG-08-11-19.are; the sight worked out from a horizontal distance of 4 and a height
// difference of 3 is checked against the 3-4-5 triangle (zenith atan(4/3) = 59.033447 gon).

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr const char* kDriver = "are.so";
constexpr unsigned kGonsMetres = SXN_MODE_GONS | SXN_MODE_METRES;
using Records = std::vector<std::string>;

TEST(AreDriver, StationsReferenceObjectsAndMeasuredPoints) {
    DriverRun are(kDriver);
    const auto result = are.Import(RawFixture("BSG-08-11-19.are"), kGonsMetres);
    EXPECT_TRUE(result.messages.empty());
    const Records& records = result.records;
    const Records head = {"#VERSION-1.0 NEUTRAL FILE",
                          "UNIT UL=M,UA=G",
                          "XYZ ID=1000,E=490.567,N=498.875,H=-0.229",
                          "# ARE 1000: 46=0.002",
                          "# ARE 0=DiffZ:0.000",
                          "STN ID=1000,HI=1.650,CO=",
                          "XYZ ID=1000,E=490.567,N=498.875,H=-0.229",
                          "XYZ ID=1,E=500.000,N=500.000,H=0.000",
                          "BKB ID=1,BRG=92.4461,HA=92.4461",
                          "# ARE 1000: 11=0.000",
                          "# ARE 0=Measured point",
                          "PT ID=1,E=500.000,N=500.000,H=0.000,CO=TEST",
                          "SS ID=1,HA=92.4486,VA=109.4524,SD=9.605,HT=0.000,CO=TEST"};
    ASSERT_GT(records.size(), head.size());
    EXPECT_EQ(Records(records.begin(), records.begin() + head.size()), head);
    EXPECT_EQ(CountOf(records, "STN "), 3);
    EXPECT_EQ(CountOf(records, "SS "), 105);
    EXPECT_EQ(FirstOf(records, "BKB ID=4"), "BKB ID=4,BRG=97.0256,HA=97.0256");
    EXPECT_EQ(records.back(), "SS ID=PARETE-CH-02,HA=87.7976,VA=95.7426,SD=14.375,HT=0.000,CO=POS");
}

TEST(AreDriver, ASightFromDistancesAndLabelsThatCannotBeRead) {
    DriverRun are(kDriver);
    const auto result = are.Import(
        "5=P9\r\n4=WALL\r\n6=1.600\r\n7=10.0000\r\n10=3.000\r\n11=4.000\r\n23=3311\r\nabc\r\n"
        "9=x\r\n",
        kGonsMetres);
    const Records expected = {
        "#VERSION-1.0 NEUTRAL FILE",
        "UNIT UL=M,UA=G",
        "# ARE LINE 8 NOT READ: abc",
        "# ARE LINE 9 NOT READ: 9=x",
        "SS ID=P9,HA=10.0000,VA=59.033447,SD=5.0000,HT=1.600,CO=WALL,HD=4.000,VD=3.000",
        "# ARE P9: 23=3311"};
    EXPECT_EQ(result.records, expected);
    ASSERT_EQ(result.messages.size(), 2u);
    EXPECT_EQ(result.messages[1],
              "2 lines of the ARE data could not be read (lines 8, 9); they stand as comments "
              "that name their lines.");
}

}  // namespace
