// Two roads to the fields of a record: ProcessRecord on wide text and ReadRecord on UTF-8
// give the same values, read as the same numbers, and leave the same current values behind,
// whatever units the rows switch to on the way.

#include <string>
#include <vector>

#include "RecordFixture.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"

namespace {

class ReadRecordTwoRoads : public RecordFixture {
  protected:
    void SetUp() override {
        RecordFixture::SetUp();
        ASSERT_TRUE(utf8.LoadNeutralFileDefinition(L"" SXNEDIT_DATA_DIR));
    }

    UNeutralFileFormat utf8{&settings};
    RecordFields read;
};

}  // namespace

TEST_F(ReadRecordTwoRoads, GiveTheSameValuesAndCurrentValues) {
    settings.SetLengthUnit(nedit::LengthUnit::Feet);
    const std::vector<std::wstring> rows = {
        L"UNIT      UL=M,UA=S",
        L"SS        ID=P1,HA=123.4530,VA=89.5500,SD=35.214,HT=1.600,CO=FC01",
        L"SS        ID=P2,HA=,VA=90,SD=,HT=2,CO=",
        L"SS        P3,10.3000,90.0000,12.5M,1.5,KB 1",
        L"SS        ID=A,ID=B,HA=1e400,SD=-0,co=lower",
        L"UNIT      UL=F,UA=G",
        L"SS        ID=P4,HA=100.0000,VA=100,SD=10,HT=1.5,UNKNOWN=7",
        L"STN       ID=Ä,HI=1.55,CO=STN",
        L"INSHT     1.555",
        L"TARGETHT  2.5",
        L"SCALE     1.00010",
        L"UNIT      UL=U,UA=D",
        L"XYZ       ID=Q,E=1e308,N=-3,H=",
        L"BKB       ID=R,BRG=45.5,HA=",
        L"AMODE     HM=b,VM=n",
        L"SS        ID=,HA=  7.25  ,VA=  ,SD=  1.5e3 ,HT=x"};
    for (const std::wstring& row : rows) {
        const int type = format.GetRecordType(row);
        const std::string bytes = nedit::ToUtf8(row);
        ASSERT_EQ(utf8.GetRecordTypeUtf8(bytes), type) << bytes;
        ASSERT_EQ(format.ProcessRecord(type, row, fields), utf8.ReadRecord(type, bytes, read))
            << bytes;
        EXPECT_EQ(fields.size(), read.size()) << bytes;
        for (const auto& [id, value] : fields) {
            const RecordValue* other = read.find(id);
            ASSERT_NE(other, nullptr) << bytes << " field " << id;
            EXPECT_EQ(other->WideText(), value) << bytes << " field " << id;
            EXPECT_EQ(other->Number(), nedit::TextToDouble(value)) << bytes << " field " << id;
        }
        for (int id : {fld::ID, fld::HA, fld::VA, fld::SD, fld::HT, fld::HI, fld::CO, fld::E,
                       fld::N, fld::H, fld::UL, fld::UA, fld::HMode, fld::VMode, fld::BkBearing,
                       rec::Insht, rec::Targetht, rec::Scale}) {
            EXPECT_EQ(utf8.GetCurrentValue(id), format.GetCurrentValue(id))
                << bytes << " current " << id;
            EXPECT_EQ(utf8.CurrentValueOf(id).Number(),
                      nedit::TextToDouble(format.GetCurrentValue(id)))
                << bytes << " current " << id;
        }
    }
    EXPECT_EQ(utf8.ConvertToZenithVA(10.0), 170.0);
}
