// Field codes in a whole run: side shots filed under their strings across set-ups, made-up
// string numbers and undefined codes from the job's library, offsets written in a code.

#include <gtest/gtest.h>

#include "../support/TestSupport.h"
#include "ReductionFixture.h"
#include "platform/job/USurveyDoc.h"

namespace {

// Two set-ups 100 m apart on an East-West line, oriented by a bearing of 0 on a reading of 0,
// so that a reading is a bearing; every shot is level (zenith 90), so its plan distance is
// its slope distance.
const wchar_t* const kTwoSetups =
    L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
    L"STN ID=S1,HI=0\nXYZ ID=S1,E=1000,N=2000,H=50\nBKB ID=RO,BRG=0,HA=0\n"
    L"SS ID=1,HA=90,VA=90,SD=10,HT=0,CO=KB01\n"  // (1010, 2000)
    L"SS ID=2,HA=0,VA=90,SD=10,HT=0,CO=FE01\n"   // (1000, 2010)
    L"SS ID=3,HA=90,VA=90,SD=20,HT=0,CO=KB01\n"  // (1020, 2000)
    L"STN ID=S2,HI=0\nXYZ ID=S2,E=1100,N=2000,H=50\nBKB ID=RO,BRG=0,HA=0\n"
    L"SS ID=4,HA=0,VA=90,SD=10,HT=0,CO=FE01\n"     // (1100, 2010)
    L"SS ID=5,HA=270,VA=90,SD=70,HT=0,CO=kb01\n";  // (1030, 2000)

using FieldCodes = ReductionFixture;

std::vector<std::wstring> Names(const CStrNoList& string) {
    std::vector<std::wstring> names;
    for (const CStrList& element : string.StrList) names.push_back(element.PtName);
    return names;
}

TEST_F(FieldCodes, StringsRunOnAcrossSetupsInTheOrderOfTheRecords) {
    Rows(kTwoSetups);
    ASSERT_EQ(engine.Process(), 1);
    const std::vector<CStrNoList>& strings = engine.GetStrings();
    ASSERT_EQ(strings.size(), 2u);
    EXPECT_EQ(strings[0].Code, L"KB");
    EXPECT_EQ(Names(strings[0]), (std::vector<std::wstring>{L"1", L"3", L"5"}));
    EXPECT_EQ(Names(strings[1]), (std::vector<std::wstring>{L"2", L"4"}));
    ExpectPoint(L"5", 1030, 2000, 50);
    // The kerb restarts at 5 from 3, where it left off on the first set-up.
    EXPECT_GE(engine.GetLineIdx(L"1", L"3"), 0);
    EXPECT_GE(engine.GetLineIdx(L"3", L"5"), 0);
    EXPECT_GE(engine.GetLineIdx(L"2", L"4"), 0);
    const UNeditLine& line =
        engine.GetLineList()[static_cast<std::size_t>(engine.GetLineIdx(L"3", L"5"))];
    EXPECT_EQ(line.GetCode(), L"KB");
    EXPECT_EQ(line.GetStringNo(), L"KB01");
    EXPECT_EQ(line.GetStationLine(), 0);
}

TEST_F(FieldCodes, OffsetsWrittenInTheCodeMoveTheShot) {
    // 10 m East of S1, then 2 m along the line of sight (East) and 1.5 m to its right (South).
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"STN ID=S1,HI=0\nXYZ ID=S1,E=1000,N=2000,H=50\nBKB ID=RO,BRG=0,HA=0\n"
        L"SS ID=P,HA=90,VA=90,SD=10,HT=0,CO=POST @2:1.5:-0.25\n");
    ASSERT_EQ(engine.Process(), 1);
    ExpectPoint(L"P", 1012, 1998.5, 49.75);
}

TEST_F(FieldCodes, TheJobsLibraryGivesMadeUpNumbersAndNamesUndefinedCodes) {
    nedit::test::TempDir dir;
    USvyCodeLib library;
    std::wstring error;
    ASSERT_TRUE(library.LoadFile(std::string(SXNEDIT_DATA_DIR) + "/SurveyCodes.csv", error));
    std::unique_ptr<USurveyDoc> job = USurveyDoc::CreateJob(dir.File("site.job"), &library);
    UNeditDatabase on_job(&format, &list, job.get(), &host);
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"STN ID=S1,HI=0\nXYZ ID=S1,E=1000,N=2000,H=50\nBKB ID=RO,BRG=0,HA=0\n"
        L"SS ID=1,HA=90,VA=90,SD=10,HT=0,CO=KB\n"   // a string code without a number
        L"SS ID=2,HA=0,VA=90,SD=10,HT=0,CO=TREE\n"  // no string code
        L"SS ID=3,HA=90,VA=90,SD=20,HT=0,CO=KB\n"
        L"SS ID=4,HA=90,VA=90,SD=30,HT=0,CO=ZZ01\n");  // no library defines ZZ
    ASSERT_EQ(on_job.Process(), 1);
    const std::vector<CStrNoList>& strings = on_job.GetStrings();
    ASSERT_EQ(strings.size(), 3u);
    EXPECT_EQ(strings[0].StrNo, L"10000");
    EXPECT_EQ(Names(strings[0]), (std::vector<std::wstring>{L"1", L"3"}));
    EXPECT_EQ(strings[1].StrNo, L"");
    EXPECT_GE(on_job.GetLineIdx(L"1", L"3"), 0);
    EXPECT_EQ(on_job.GetLineIdx(L"2", L"3"), -1);
    EXPECT_EQ(on_job.GetUndefinedCodes().size(), 1u);
    EXPECT_EQ(on_job.GetUndefinedCodes().count(L"ZZ"), 1u);
    // A line takes the look of its code from the library.
    const UNeditLine& kerb =
        on_job.GetLineList()[static_cast<std::size_t>(on_job.GetLineIdx(L"1", L"3"))];
    EXPECT_EQ(kerb.GetLayer(), L"ROADS");
    EXPECT_EQ(kerb.GetColor(), 3);
}

TEST_F(FieldCodes, ARunThatCannotMakeWhatACodeAsksTellsOnce) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"STN ID=S1,HI=0\nXYZ ID=S1,E=1000,N=2000,H=50\nBKB ID=RO,BRG=0,HA=0\n"
        L"SS ID=1,HA=90,VA=90,SD=10,HT=0,CO=SH01*RECT\n"
        L"SS ID=2,HA=90,VA=90,SD=20,HT=0,CO=TR01/OLD*CR\n");
    ASSERT_EQ(engine.Process(), 1);
    EXPECT_EQ(engine.GetCodeNotices().size(), 2u);
    ASSERT_EQ(host.Messages().size(), 1u);
    EXPECT_NE(host.Messages()[0].text.find(L"CR"), std::wstring::npos);
    EXPECT_TRUE(engine.GetCircleList().empty());
}

}  // namespace
