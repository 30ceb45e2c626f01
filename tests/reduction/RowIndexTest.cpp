// Two roads to the first row of a name: the index, and a walk down every row that parses each
// row of the types in turn, as the look-ups were first written. Both must give the same row and
// values and leave the format service with the same current values, through rows without a
// name of their own, rows without some values, rows in changing units, and rows put in or
// replaced after the index was made.

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "../records/RowList.h"
#include "platform/text/NameTable.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/RowIndex.h"

namespace {

struct Found {
    int row = -1;
    double e = 0.0, n = 0.0, h = 0.0;
};

// The walk: every row of the types is parsed; a row without an ID takes the one in force.
Found Walk(UNeutralFileFormat& format, const nedit::RowSource& rows, const std::wstring& name,
           const std::vector<int>& types) {
    FieldMap fields;
    auto value = [&](int id) {
        const auto own = fields.find(id);
        return own != fields.end() && !own->second.empty() ? own->second
                                                           : format.GetCurrentValue(id);
    };
    for (int row = 0; row < rows.GetItemCount(); ++row) {
        const std::wstring text = nedit::ToUpper(nedit::TrimView(rows.GetItemText(row)));
        const int type = format.GetRecordType(text);
        if (std::find(types.begin(), types.end(), type) == types.end()) continue;
        if (!format.ProcessRecord(type, text, fields) || value(fld::ID) != name) continue;
        return {row, nedit::TextToDouble(value(fld::E)), nedit::TextToDouble(value(fld::N)),
                nedit::TextToDouble(value(fld::H))};
    }
    return {};
}

class RowIndexTwoRoads : public ::testing::Test {
  protected:
    void SetUp() override {
        ASSERT_TRUE(walked.LoadNeutralFileDefinition(L"" SXNEDIT_DATA_DIR));
        ASSERT_TRUE(indexed.LoadNeutralFileDefinition(L"" SXNEDIT_DATA_DIR));
        // Rows before the first with an ID of its own take the ID in force at the start.
        walked.SetCurrentValue(fld::ID, L"Q");
        indexed.SetCurrentValue(fld::ID, L"Q");
        walked.SetCurrentValue(fld::H, L"7.5");
        indexed.SetCurrentValue(fld::H, L"7.5");
    }

    void Fill(const std::vector<std::wstring>& texts) {
        for (const std::wstring& text : texts) rows.AddRecord(rows.GetItemCount(), text);
    }

    // Looks `name` up both ways and compares what they give and leave.
    void ExpectSame(const std::wstring& name) {
        const Found walk = Walk(walked, rows, name, types);
        RecordFields fields;
        Found look;
        look.row = index_->Find(rows, name, fields);
        if (look.row >= 0) {
            auto number = [&](int id) {
                const RecordValue* own = fields.find(id);
                return own != nullptr && !own->empty() ? own->Number()
                                                       : indexed.CurrentValueOf(id).Number();
            };
            look = {look.row, number(fld::E), number(fld::N), number(fld::H)};
        }
        const std::string what = nedit::ToUtf8(name);
        EXPECT_EQ(look.row, walk.row) << what;
        EXPECT_EQ(look.e, walk.e) << what;
        EXPECT_EQ(look.n, walk.n) << what;
        EXPECT_EQ(look.h, walk.h) << what;
        for (int id : {fld::ID, fld::E, fld::N, fld::H, fld::HA, fld::BkBearing}) {
            EXPECT_EQ(indexed.GetCurrentValue(id), walked.GetCurrentValue(id))
                << what << ", current value of " << id;
        }
    }

    UJobSettings settings;
    UNeutralFileFormat walked{&settings};
    UNeutralFileFormat indexed{&settings};
    nedit::test::RowList rows{&walked};
    nedit::NameTable names;
    std::vector<int> types{rec::Xyz, rec::Yxz};
    RowIndex index{indexed, names, types};
    RowIndex* index_ = &index;
};

const std::vector<std::wstring> kRows = {
    L"#VERSION-1.0 NEUTRAL FILE",
    L"XYZ       ,E=1,N=2,H=3",  // no name: the one in force
    L"XYZ       E=4",           // nor here, and its N and H are those in force
    L"XYZ       ID=A,E=10,N=20,H=30",
    L"XYZ       ID=,E=11",             // takes A as its name
    L"yxz       id=b,n=5,e=6",         // N first; H in force
    L"XYZ       ID=A,E=99,N=99,H=99",  // A again: never the first
    L"STN       ID=S1,HI=1.5",
    L"BKB       ID=A,HA=1.0000",
    L"XYZ       ID=C,E=1,N=2",
    L"XYZ       C,5,6,7",  // by place
};

}  // namespace

TEST_F(RowIndexTwoRoads, GiveTheWalksRowsValuesAndCurrentValues) {
    Fill(kRows);
    for (const wchar_t* name :
         {L"Q", L"A", L"B", L"C", L"A", L"Z", L"Q", L"C", L"S1", L"", L"A", L"Q"}) {
        ExpectSame(name);
    }
}

TEST_F(RowIndexTwoRoads, FollowRowsPutInAndReplacedAfterTheyWereIndexed) {
    Fill(kRows);
    ExpectSame(L"A");
    // Put in at the end, in the middle, before the first row of the types; replaced with the
    // same name and other fields, and with another name; all told to the index.
    auto insert = [&](int row, const std::wstring& text) {
        const std::uint64_t before = rows.GetRevision();
        const int at = rows.AddRecord(row, text);
        index_->Inserted(rows, at, before);
    };
    auto replace = [&](int row, const std::wstring& text) {
        const std::uint64_t before = rows.GetRevision();
        const std::string old = std::string(rows.GetRowUtf8(row));
        rows.DeleteItem(row);
        rows.AddRecord(row, text);
        index_->Replaced(rows, row, old, before);
    };
    insert(rows.GetItemCount(), L"XYZ       ID=D,E=7,N=8,H=9");
    ExpectSame(L"D");
    insert(4, L"XYZ       ID=D,E=1,N=1,H=1");
    ExpectSame(L"D");
    ExpectSame(L"A");
    insert(1, L"XYZ       ID=E,E=2,N=2");
    ExpectSame(L"Q");
    ExpectSame(L"E");
    replace(5, L"XYZ       ID=A,E=50,N=60");
    ExpectSame(L"A");
    ExpectSame(L"D");
    replace(5, L"XYZ       ID=F,E=1,N=2,H=3");
    ExpectSame(L"F");
    ExpectSame(L"A");
    // A change the index was not told of: it is made again.
    rows.DeleteItem(2);
    ExpectSame(L"A");
    ExpectSame(L"Q");
}

TEST_F(RowIndexTwoRoads, RowsThatChangeUnitsAreWalked) {
    // A coordinate record that names a unit changes how the values after it are read.
    Fill({L"#VERSION-1.0 NEUTRAL FILE", L"XYZ       ID=A,E=10,N=20,H=30",
          L"XYZ       ID=U,UL=F,E=10,N=20,H=30", L"XYZ       ID=B,E=10,N=20,H=30",
          L"XYZ       ID=C,UL=M,E=10"});
    for (const wchar_t* name : {L"B", L"A", L"C", L"U", L"B"}) ExpectSame(name);
}

TEST_F(RowIndexTwoRoads, OneTypeOnlyForFindRecord) {
    types = {rec::Bkb};
    RowIndex backs(indexed, names, types);
    index_ = &backs;
    Fill({L"#VERSION-1.0 NEUTRAL FILE", L"BKB       ID=A,HA=1", L"XYZ       ID=B,E=1",
          L"BKB       ,BRG=45", L"BKB       ID=B,HA=2,BRG=3"});
    for (const wchar_t* name : {L"B", L"A", L"B", L"Q", L"X"}) ExpectSame(name);
}
