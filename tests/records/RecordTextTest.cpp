#include <gtest/gtest.h>

#include "records/RecordText.h"

TEST(RecordText, TokensCountEverySeparator) {
    const std::wstring row = L"stn  id=a,hi=1.5";
    EXPECT_EQ(GetToken(row, 0), L"STN");
    EXPECT_EQ(GetToken(row, 1), L"");  // the second blank makes an empty token
    EXPECT_EQ(GetToken(row, 2), L"ID=A");
    EXPECT_EQ(GetToken(row, 3), L"HI=1.5");
    EXPECT_EQ(GetToken(row, 4), L"");
    EXPECT_EQ(GetToken(row, -1), L"");
    EXPECT_EQ(GetDelimToken(L"CO=A B, HI=1.500 ,", 1, L","), L"HI=1.500");
    EXPECT_EQ(GetDelimToken(L"CO=a b, HI=1.500 ,", 0, L","), L"CO=A B");
}

TEST(RecordText, ReplaceTokenKeepsEverythingElse) {
    const std::wstring row = L"SS        ID=P1,HA=1,VA=2,SD=3,HT=1.600,CO=FC";
    EXPECT_EQ(ReplaceToken(row, 4, L"HT=2.000"), L"SS        ID=P1,HA=1,VA=2,SD=3,HT=2.000,CO=FC");
    EXPECT_EQ(ReplaceToken(row, 5, L"CO=TR"), L"SS        ID=P1,HA=1,VA=2,SD=3,HT=1.600,CO=TR");
    EXPECT_EQ(ReplaceToken(L"STN       ID=A", 2, L"CO=X"), L"STN       ID=A,,CO=X");
    EXPECT_EQ(ReplaceToken(L"STN       ID=A,HI=1", 0, L"ID=B"), L"STN       ID=B,HI=1");
}

TEST(RecordText, IdText) {
    EXPECT_EQ(GetIdText(L"STN       ID=P1,HI=1.500,CO=STN"), L"ID=P1");
    EXPECT_EQ(GetIdText(L"BKB       ID=D,BRG=45.0000"), L"ID=D");
    EXPECT_EQ(GetIdText(L"STN       ID=P1"), L"ID=P1");
    EXPECT_EQ(GetIdText(L"STN"), L"");
    EXPECT_EQ(GetIdTextUtf8("STN       ID=Ü1,HI=1.500"), "ID=Ü1");
    EXPECT_EQ(GetIdTextUtf8("STN       ID=P1"), "ID=P1");
}

namespace {

struct AngleTypeCase {
    const wchar_t* row;
    int type;
};

class AngleTypeOfARow : public ::testing::TestWithParam<AngleTypeCase> {};

}  // namespace

INSTANTIATE_TEST_SUITE_P(UnitRows, AngleTypeOfARow,
                         ::testing::Values(AngleTypeCase{L"UNIT      UL=M,UA=D", 1},
                                           AngleTypeCase{L"UNIT      UL=M,UA= 2", 2},
                                           AngleTypeCase{L"UNIT      UA=G,UL=F", 2},
                                           AngleTypeCase{L"UNIT      UL=M,UA=S", 0},
                                           AngleTypeCase{L"UNIT      UL=M", 0},
                                           AngleTypeCase{L"UNIT      UA=", 0}));

TEST_P(AngleTypeOfARow, IsTheUnitOfItsUAField) {
    EXPECT_EQ(GetAngleType(GetParam().row), GetParam().type);
}
