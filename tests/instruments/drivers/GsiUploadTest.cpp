// The GSI-16 coordinate file the Leica GSI driver uploads, word by word as worked out by
// hand, and read back by the same driver to the coordinates that went out.

#include <gtest/gtest.h>

#include "DriverRun.h"

namespace {

nedit::UploadPoint Point(const wchar_t* name, const wchar_t* code, double east, double north,
                         double height, bool hasHeight = true) {
    nedit::UploadPoint point;
    point.name = name;
    point.code = code;
    point.east = east;
    point.north = north;
    point.height = height;
    point.hasHeight = hasHeight;
    return point;
}

const std::vector<nedit::UploadPoint> kPoints = {
    Point(L"101", L"TREE", 1234.5678, 2345.6789, 98.7654),
    Point(L"P-2", L"", -12.3456, 0.0004, 0.0, false),
    Point(L"TOO LONG NAME", L"PEG", 1.0, 2.0, 3.0),
    Point(L"7", L"FENCE POST", 500000.0, 4000000.25, -3.5),
};

// Index, information (block number or unit), sign and 16 digits; a blank ends each word.
const std::string kBlocks =
    "*110001+0000000000000101 81...6+0000000012345678 82...6+0000000023456789 "
    "83...6+0000000000987654 71....+000000000000TREE \r\n"
    "*110002+0000000000000P-2 81...6-0000000000123456 82...6+0000000000000004 \r\n"
    "*110003+0000000000000007 81...6+0000005000000000 82...6+0000040000002500 "
    "83...6-0000000000035000 \r\n";

TEST(GsiUpload, PointsBecomeGsi16CoordinateBlocksAndWhatCannotGoIsNamed) {
    DriverRun gsi("gsi.so");
    std::vector<int> answers;
    const auto upload = gsi.Upload(kPoints, SXN_MODE_METRES, &answers);
    EXPECT_EQ(upload.sent, kBlocks);
    EXPECT_EQ(answers, (std::vector<int>{1, 1, 0, 1}));
    ASSERT_EQ(upload.messages.size(), 2u);
    EXPECT_NE(upload.messages[0].find("TOO LONG NAME was not uploaded"), std::string::npos);
    EXPECT_NE(upload.messages[1].find("7 was uploaded without its code FENCE POST"),
              std::string::npos);

    // Read back: the same names and coordinates; no height stays none (-10000).
    const auto back = gsi.Import(upload.sent, SXN_MODE_DMS | SXN_MODE_METRES);
    EXPECT_TRUE(back.messages.empty());
    EXPECT_EQ(CountOf(back.records, "PT "), 3);
    EXPECT_EQ(FirstOf(back.records, "PT ID=101,"),
              "PT ID=101,E=1234.5678,N=2345.6789,H=98.7654,CO=TREE");
    EXPECT_EQ(FirstOf(back.records, "PT ID=P-2,"),
              "PT ID=P-2,E=-12.3456,N=0.0004,H=-10000.000,CO=");
    EXPECT_EQ(FirstOf(back.records, "PT ID=7,"),
              "PT ID=7,E=500000.0000,N=4000000.2500,H=-3.5000,CO=");
}

TEST(GsiUpload, FeetGoAsUsSurveyFeetAndComeBackInTheJobsFeet) {
    DriverRun gsi("gsi.so");
    // 1000 international feet are 999.998 US survey feet (0.3048 m against 1200/3937 m).
    const std::vector<nedit::UploadPoint> point = {Point(L"F1", L"", 1000.0, 3280.84, 10.0)};
    const auto feet = gsi.Upload(point, SXN_MODE_FEET);
    EXPECT_EQ(feet.sent,
              "*110001+00000000000000F1 81...7+0000000009999980 82...7+0000000032808334 "
              "83...7+0000000000100000 \r\n");
    const auto usFeet = gsi.Upload(point, SXN_MODE_US_FEET);
    EXPECT_EQ(usFeet.sent.substr(25, 23), "81...7+0000000010000000");

    const auto back = gsi.Import(feet.sent, SXN_MODE_DMS | SXN_MODE_FEET);
    const std::string record = FirstOf(back.records, "PT ID=F1,");
    double east = 0.0;
    double north = 0.0;
    ASSERT_EQ(std::sscanf(record.c_str(), "PT ID=F1,E=%lf,N=%lf", &east, &north), 2) << record;
    // A tenth of a thousandth of a US foot is the step of the words.
    EXPECT_NEAR(east, 1000.0, 1e-4);
    EXPECT_NEAR(north, 3280.84, 1e-4);
}

TEST(NeutralUpload, PointsBecomePtRecordsAfterTheHeaderAndUnits) {
    DriverRun neutral("neutral.so");
    const auto upload =
        neutral.Upload({kPoints[0], kPoints[1], Point(L"A,B", L"X=Y", 1, 2, 3)}, SXN_MODE_US_FEET);
    EXPECT_EQ(upload.sent,
              "#VERSION-1.0 NEUTRAL FILE\n"
              "UNIT UL=U,UA=S\n"
              "PT ID=101,E=1234.5678,N=2345.6789,H=98.7654,CO=TREE\n"
              "PT ID=P-2,E=-12.3456,N=0.0004,H=-10000.000,CO=\n"
              "PT ID=A_B,E=1.0000,N=2.0000,H=3.0000,CO=X_Y\n");
    EXPECT_EQ(neutral.Import(upload.sent, SXN_MODE_DMS | SXN_MODE_US_FEET).records.size(), 5u);
}

TEST(Upload, DriversThatCannotUploadSayNothingOfIt) {
    EXPECT_FALSE(DriverRun("rw5.so").Functions().CanUpload());
}

}  // namespace
