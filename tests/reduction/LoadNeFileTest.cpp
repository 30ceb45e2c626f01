#include <gtest/gtest.h>

#include <fstream>
#include <string>
#include <vector>

#include "../records/RecordFixture.h"
#include "../records/RowList.h"
#include "../support/HeadlessDialogHost.h"
#include "reduction/UNeditDatabase.h"

namespace {

class LoadNeFile : public RecordFixture {
  protected:
    int Load(const std::string& path) {
        return engine.LoadNeFile(std::wstring(path.begin(), path.end()));
    }

    int LoadBytes(const std::string& bytes) {
        // Named after the test, since test processes run side by side.
        const std::string path = ::testing::TempDir() +
                                 ::testing::UnitTest::GetInstance()->current_test_info()->name() +
                                 ".neu";
        std::ofstream(path, std::ios::binary) << bytes;
        return Load(path);
    }

    std::vector<std::wstring> Rows() const {
        std::vector<std::wstring> rows;
        for (int row = 0; row < list.GetItemCount(); ++row) rows.push_back(list.GetItemText(row));
        return rows;
    }

    std::vector<std::wstring> Messages() const {
        std::vector<std::wstring> texts;
        for (const auto& message : host.Messages()) texts.push_back(message.text);
        return texts;
    }

    nedit::test::RowList list{&format};
    nedit::HeadlessDialogHost host;
    UNeditDatabase engine{&format, &list, nullptr, &host};
};

const std::wstring kHeader = L"#VERSION-1.0 NEUTRAL FILE";

}  // namespace

TEST_F(LoadNeFile, ALowerCaseFieldFileBecomesTheRowsOfTheList) {
    std::vector<int> angle_types;
    engine.SetAngleTypeHandler([&](int type) { angle_types.push_back(type); });
    ASSERT_EQ(Load(SXNEDIT_TEST_DATA "/lowercase.neu"), 1);
    // The 300-character side shot is cut to 255 on reading; laid out with its key padded to
    // ten places it would grow by eight, and the row is cut to 255 again.
    const std::wstring long_row_start =
        L"SS        ID=P9,HA=10.0000,VA=90.0000,SD=5.000,HT=1.500,CO=";
    const std::wstring long_row = long_row_start + std::wstring(255 - long_row_start.size(), L'X');
    const std::vector<std::wstring> expected = {
        kHeader,
        L"UNIT      UL=M,UA=S",
        L"STN       ID=P1,HI=1.500,CO=STN",
        L"XYZ       ID=P1,E=1000.000,N=2000.000,H=50.000",
        L"# WEATHER SUNNY,WIND=LIGHT",
        L"SS        ID=P2,HA=123.4530,VA=89.5500,SD=35.214,HT=1.600,CO=FC01",
        long_row,
        L"# A REMARK FROM THE FIELD",
        L"SCALE     0.99960",
    };
    EXPECT_EQ(Rows(), expected);
    EXPECT_EQ(long_row.size(), 255u);
    EXPECT_TRUE(Messages().empty());
    EXPECT_TRUE(engine.GetOutput());
    EXPECT_EQ(angle_types, std::vector<int>{0});
}

TEST_F(LoadNeFile, CoordinateRecordsTakeTheNameOfTheStationAbove) {
    ASSERT_EQ(LoadBytes("#VERSION-1.0 NEUTRAL FILE\n"
                        "XYZ E=1,N=2,H=3\n"  // before any station: empty name
                        "STN ID=A,HI=1.5\n"
                        "XYZ E=10,N=20,H=30\n"
                        "XYZ ID=Q,E=11,N=21,H=31\n"  // three commas: its own name
                        "BKB ID=D,BRG=45.0000,HA=0.0000\n"
                        "XYZ E=12,N=22\n"  // takes the back station's name
                        "XYZ 5\n"),        // no comma: unchanged
              1);
    const std::vector<std::wstring> expected = {
        kHeader,
        L"XYZ       ,E=1,N=2,H=3",
        L"STN       ID=A,HI=1.5",
        L"XYZ       ID=A,E=10,N=20,H=30",
        L"XYZ       ID=Q,E=11,N=21,H=31",
        L"BKB       ID=D,BRG=45.0000,HA=0.0000",
        L"XYZ       ID=D,E=12,N=22",
        L"XYZ       5",
    };
    EXPECT_EQ(Rows(), expected);
}

TEST_F(LoadNeFile, FilesThatCannotBeReadSayWhy) {
    const std::string missing = ::testing::TempDir() + "missing.neu";
    EXPECT_EQ(Load(missing), 0);
    EXPECT_EQ(Messages(),
              std::vector<std::wstring>{L"Failed to open " +
                                        std::wstring(missing.begin(), missing.end()) + L"."});
    EXPECT_EQ(host.Messages()[0].flags & nedit::mb::IconMask, nedit::mb::IconStop);
    EXPECT_EQ(list.GetItemCount(), 0);

    // A comment before the header is no header.
    EXPECT_EQ(LoadBytes("\n# FIELD NOTES\n#VERSION-1.0 NEUTRAL FILE\nSTN ID=A\n"), 0);
    EXPECT_EQ(Messages().back(), L"Neutral file header not found.");
    EXPECT_EQ(list.GetItemCount(), 0);

    EXPECT_EQ(LoadBytes("STN ID=A\n"), 0);
    const char binary[] =
        "\x7F"
        "ELF\x02\x01\x01\0\0\0garbage\xFF\xFE";
    EXPECT_EQ(LoadBytes(std::string(binary, sizeof binary - 1)), 0);
    EXPECT_EQ(Messages().size(), 4u);

    // An empty file has no header to complain about: nothing is read and nothing is said.
    EXPECT_EQ(LoadBytes(""), 0);
    EXPECT_EQ(LoadBytes("\n   \n\t\n"), 0);
    EXPECT_EQ(Messages().size(), 4u);

    UNeditDatabase without_list(&format, nullptr, nullptr, &host);
    EXPECT_EQ(without_list.LoadNeFile(L"whatever.neu"), 0);
    EXPECT_FALSE(without_list.GetOutput());
}

TEST_F(LoadNeFile, OddEncodingsAndLineEndsStillReadWell) {
    // A byte-order mark, CR LF and lone CR line ends, a tab, and a Latin-1 code.
    ASSERT_EQ(
        LoadBytes("\xEF\xBB\xBF#version-1.0 neutral file\r\nstn\tid=a,co=caf\xE9\rpt id=b,e=1\r\n"),
        1);
    const std::vector<std::wstring> expected = {kHeader, L"STN       ID=A,CO=CAF\u00c9",
                                                L"PT        ID=B,E=1"};
    EXPECT_EQ(Rows(), expected);

    // UTF-8 stays UTF-8, upper-cased; binary junk after the header survives as comments.
    ASSERT_EQ(
        LoadBytes(
            "#VERSION-1.0 NEUTRAL FILE\nSS ID=\xC3\xA9t\xC3\xA9\n\x01\x02\x03\n\x80\x81junk\n"),
        1);
    const std::vector<std::wstring> junk = {kHeader, L"SS        ID=\u00c9T\u00c9",
                                            L"# \u0080\u0081JUNK"};
    EXPECT_EQ(Rows(), junk);
}

TEST_F(LoadNeFile, VeryLongLinesAreCutNotLost) {
    std::string bytes =
        "#VERSION-1.0 NEUTRAL FILE\nNOTE " + std::string(100000, 'n') + "\nSTN ID=Z\n";
    ASSERT_EQ(LoadBytes(bytes), 1);
    ASSERT_EQ(list.GetItemCount(), 3);
    EXPECT_EQ(list.GetItemText(1), L"NOTE      " + std::wstring(245, L'N'));
    EXPECT_EQ(list.GetItemText(2), L"STN       ID=Z");
}
