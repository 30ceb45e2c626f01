// The Nikon RAW v2.00 driver through its C interface, on the Nikon and Trimble M3 files.
// Values are read by hand from the records; conversions are worked out separately
// (107.9916 gon = 97.19244 deg = 97 deg 11'32.78").

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

constexpr const char* kDriver = "nikon.so";
using Records = std::vector<std::string>;

TEST(NikonDriver, AStationInGonsWithItsBackSightAndSideShots) {
    DriverRun nikon(kDriver);
    const auto gons =
        nikon.Import(RawFixture("nikon_raw_v200.tops"), SXN_MODE_GONS | SXN_MODE_METRES);
    EXPECT_TRUE(gons.messages.empty());
    const Records& records = gons.records;
    EXPECT_EQ(FirstOf(records, "XYZ "), "XYZ ID=1,E=0.000,N=0.000,H=0.000");
    EXPECT_EQ(FirstOf(records, "STN "), "STN ID=1,HI=1.430,CO=");
    EXPECT_EQ(FirstOf(records, "BKB "), "BKB ID=,BRG=0.0000,HA=0.0000");
    EXPECT_EQ(FirstOf(records, "BS "), "BS ID=,HA=0.0000,VA=110.5344,SD=0.000,HT=1.500,CO=");
    EXPECT_EQ(FirstOf(records, "SS "), "SS ID=2,HA=107.9916,VA=102.3376,SD=8.986,HT=1.500,CO=P");
    EXPECT_EQ(records.back(), "SS ID=802,HA=179.9716,VA=92.2336,SD=20.961,HT=2.550,CO=P");
    EXPECT_EQ(CountOf(records, "SS "), 82);
    EXPECT_EQ(CountOf(records, "# CO,"), 23);

    const auto dms =
        nikon.Import(RawFixture("nikon_raw_v200.tops"), SXN_MODE_DMS | SXN_MODE_METRES);
    EXPECT_EQ(FirstOf(dms.records, "SS "),
              "SS ID=2,HA=97.113278,VA=92.061382,SD=8.986,HT=1.500,CO=P");
}

TEST(NikonDriver, SetUpsInDegreesAndShotsTakenAgain) {
    DriverRun nikon(kDriver);
    const auto result = nikon.Import(RawFixture("nikon_dtm.tops"), SXN_MODE_DMS | SXN_MODE_METRES);
    EXPECT_TRUE(result.messages.empty());
    const Records& records = result.records;
    // The first shot to 2 had no distance and was taken again: only the second is observed.
    EXPECT_EQ(FirstOf(records, "# *SS,2"), "# *SS,2,1.800,,0.0000,88.5537,16:13:53,HC");
    EXPECT_EQ(CountOf(records, "SS ID=2,"), 1);
    EXPECT_EQ(FirstOf(records, "SS ID=2,"),
              "SS ID=2,HA=0.0000,VA=88.5655,SD=30.188,HT=1.800,CO=HC");
    EXPECT_EQ(FirstOf(records, "STN ID=4"), "STN ID=4,HI=1.242,CO=");
    EXPECT_EQ(FirstOf(records, "BKB ID=1"), "BKB ID=1,BRG=344.3051,HA=344.3051");
    EXPECT_EQ(CountOf(records, "STN "), 4);
    EXPECT_EQ(records.back(), "# CO,O/S MSR:6 87.340 163.3227 86.2719");
}

TEST(NikonDriver, TheM3FileHasNoStation) {
    DriverRun nikon(kDriver);
    const auto result = nikon.Import(RawFixture("051012-1.RAW"), SXN_MODE_GONS | SXN_MODE_METRES);
    EXPECT_EQ(FirstOf(result.records, "SS "),
              "SS ID=1,HA=104.4031,VA=99.0992,SD=12.000,HT=2.000,CO=");
    EXPECT_EQ(CountOf(result.records, "STN "), 0);
    EXPECT_EQ(result.messages,
              Records{"The data hold observations before any station with a name; they are "
                      "reduced only once a STN record with a name stands before them."});
}

TEST(NikonDriver, EveryRecordTypeFeetAndVerticalAnglesFromTheHorizon) {
    DriverRun nikon(kDriver);
    const auto result = nikon.Import(
        "CO,Dist Units: US Feet\n"
        "CO,Angle Units: Degrees\n"
        "CO,Zero VA: Horizontal\n"
        "ST,10,,11,,1.500,45.0000,0.0000\n"
        "F1,11,1.600,100.000,0.0000,5.0000,10:00:00\n"       // 5 above the horizon: zenith 85
        "F2,,1.600,100.000,180.0000,-5.0000,10:00:10\n"      // the set-up's back point
        "CP,12,,1.700,50.000,90.0000,0.0000,10:01:00,CTL\n"  //
        "SO,13,7,1.700,50.000,90.0000,0.0000,10:01:00,\n"    // stake-out of point 7
        "CC,14,,10.000,20.000,30.000,PIPE,A\n"               // north, east, elevation
        "XX,whatever\n"                                      //
        "SS,15,1.700,abc,1.0,2.0,10:02:00,X\n"               // a distance that is no number
        "SS\n",
        SXN_MODE_DEGREES | SXN_MODE_US_FEET);
    const Records expected = {"#VERSION-1.0 NEUTRAL FILE",
                              "UNIT UL=U,UA=D",
                              "# CO,Dist Units: US Feet",
                              "# CO,Angle Units: Degrees",
                              "# CO,Zero VA: Horizontal",
                              "STN ID=10,HI=1.500,CO=",
                              "BKB ID=11,BRG=45.0000,HA=0.0000",
                              "# ST,10,,11,,1.500,45.0000,0.0000",
                              "BS ID=11,HA=0.0000,VA=85.000000,SD=100.000,HT=1.600,CO=",
                              "BS ID=11,HA=180.0000,VA=95.000000,SD=100.000,HT=1.600,CO=",
                              "SS ID=12,HA=90.0000,VA=90.000000,SD=50.000,HT=1.700,CO=CTL",
                              "SS ID=13,HA=90.0000,VA=90.000000,SD=50.000,HT=1.700,CO=",
                              "# SO,13,7,1.700,50.000,90.0000,0.0000,10:01:00,",
                              "PT ID=14,E=20.000,N=10.000,H=30.000,CO=PIPE_A",
                              "# XX,whatever",
                              "# NIKON LINE 11 NOT READ: SS,15,1.700,abc,1.0,2.0,10:02:00,X",
                              "# NIKON LINE 12 NOT READ: SS"};
    EXPECT_EQ(result.records, expected);
    EXPECT_EQ(result.messages,
              Records{"2 lines of the NIKON data could not be read (lines 11, 12); they stand as "
                      "comments that name their lines."});
}

}  // namespace
