// The gate every row passes on its way into a document's rows.

#include <string>

#include "RecordFixture.h"
#include "platform/text/WideText.h"
#include "records/RecordText.h"

namespace {

struct GateCase {
    const wchar_t* text;
    const wchar_t* row;
};

class NormaliseRowGate : public RecordFixture, public ::testing::WithParamInterface<GateCase> {};
using RowGate = RecordFixture;

}  // namespace

INSTANTIATE_TEST_SUITE_P(
    Rows, NormaliseRowGate,
    ::testing::Values(
        // A known key is laid out with its key padded to ten places.
        GateCase{L"ss id=p1,ha=1.0000", L"SS        ID=P1,HA=1.0000"},
        GateCase{L"  scale 1.0  ", L"SCALE     1.0"},
        // The key ends at a comma too.
        GateCase{L"stn,id=a", L"STN       ,ID=A"},
        // A comment is only upper-cased; an unknown key becomes one, so nothing is lost.
        GateCase{L"#  note:  Keep", L"#  NOTE:  KEEP"},
        GateCase{L"weather sunny", L"# WEATHER SUNNY"},
        // Blanks go from the ends of each field and around its first "=", and nowhere else.
        GateCase{L"ss  id = p1 , ha= 1 =2 ,  co = a b ", L"SS        ID=P1,HA=1 =2,CO=A B"},
        GateCase{L"stn ,=5,, x", L"STN       ,=5,,X"},
        GateCase{L"offset oa=1,or=2,,ou=3,", L"OFFSET    OA=1,OR=2,,OU=3,"},
        GateCase{L"scale   1.5   m", L"SCALE     1.5   M"},
        GateCase{L"job   a\tb", L"JOB       A\tB"}, GateCase{L"stn", L"STN"},
        // A tab does not end a key; the key "STN\tID=A\tB" is no key.
        GateCase{L"stn\tid=a\tb,hi=1", L"# STN\tID=A\tB,HI=1"},
        // Nothing stays nothing.
        GateCase{L"", L""}, GateCase{L"   ", L""}));

TEST_P(NormaliseRowGate, LaysOutKnownRowsAndKeepsTheRest) {
    EXPECT_EQ(NormaliseRow(format, GetParam().text), GetParam().row);
}

TEST_F(RowGate, NoRowHoldsMoreThan255Characters) {
    EXPECT_EQ(NormaliseRow(format, L"x" + std::wstring(300, L'y')).size(), 255u);
    const std::wstring unknown = NormaliseRow(format, L"unknown" + std::wstring(260, L'z'));
    EXPECT_EQ(unknown.size(), 255u);
    EXPECT_EQ(unknown.substr(0, 9), L"# UNKNOWN");
}

namespace {

class NormaliseRowUtf8Gate : public RecordFixture,
                             public ::testing::WithParamInterface<const wchar_t*> {};

}  // namespace

INSTANTIATE_TEST_SUITE_P(Rows, NormaliseRowUtf8Gate,
                         ::testing::Values(L"ss id=p1,ha=1.0000", L"  scale 1.0  ", L"stn,id=a",
                                           L"#  note:  Keep", L"weather sunny", L"", L"   ",
                                           L"\tSS  ID = P1 ,  HA=1 ,CO=  kb\t",
                                           L"stn id=zürich,hi=1.5", L"xyz ID=Æ,E=1",
                                           L"ss id=p"
                                           L"\u00e9,co=caf\u00e9",
                                           L"insht 1.55", L"unit ul=m , ua=s",
                                           L"ss  id = p1 , ha= 1 =2 ,  co = a b ", L"stn ,=5,, x",
                                           L"stn\tid=a\tb,hi=1", L"stn", L"job   a\tb"));

// The gate of UTF-8 text is the gate of wide text: ASCII rows pass byte by byte, others
// through wide text, and both give the same row.
TEST_P(NormaliseRowUtf8Gate, GivesTheRowOfTheWideGate) {
    std::string row;
    NormaliseRowUtf8(format, nedit::ToUtf8(GetParam()), row);
    EXPECT_EQ(nedit::FromUtf8(row), NormaliseRow(format, GetParam()));
}

TEST_F(RowGate, AUtf8RowCutAt255CharactersIsCutAsTheWideOne) {
    for (const std::wstring& text :
         {L"ss id=" + std::wstring(248, L'p') + L" ,x", L"ss id=" + std::wstring(300, L'\u00e9'),
          L"unknown" + std::wstring(247, L'z') + L" q"}) {
        std::string row;
        NormaliseRowUtf8(format, nedit::ToUtf8(text), row);
        EXPECT_EQ(nedit::FromUtf8(row), NormaliseRow(format, text));
    }
}
