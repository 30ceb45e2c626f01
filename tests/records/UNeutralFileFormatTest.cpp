#include <gtest/gtest.h>

#include "RecordFixture.h"
#include "platform/text/NumberText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

using nedit::TextToDouble;

using NeutralFormat = RecordFixture;

TEST_F(NeutralFormat, KeysAndFieldsAreKnownBothWays) {
    ASSERT_TRUE(format.IsKeysInitialised());
    const std::pair<int, const wchar_t*> records[] = {
        {99, L"#"},    {104, L"UNIT"}, {109, L"PT"},        {110, L"STN"},   {111, L"BKB"},
        {112, L"XYZ"}, {113, L"BS"},   {114, L"SS"},        {118, L"SCALE"}, {128, L"UNIT2"},
        {133, L"PSX"}, {135, L"YXZ"},  {136, L"TARGETHT2"}, {137, L"IMAGE"}, {139, L"ATTRIB"},
    };
    for (const auto& [type, key] : records) {
        std::wstring found_key;
        int found_type = 0;
        EXPECT_EQ(format.FindRecordKey(type, found_key), 1) << type;
        EXPECT_EQ(found_key, key);
        EXPECT_EQ(format.FindRecordKey(std::wstring(key), found_type), 1) << key;
        EXPECT_EQ(found_type, type);
    }
    std::wstring key;
    int id = 0;
    EXPECT_EQ(format.FindRecordKey(124, key), 0);
    EXPECT_EQ(format.FindRecordKey(L"WEATHER", id), 0);
    EXPECT_EQ(format.FindRecordField(fld::BkBearing, key), 1);
    EXPECT_EQ(key, L"BRG");
    EXPECT_EQ(format.FindRecordField(L"OR", id), 1);
    EXPECT_EQ(id, fld::OffsetRight);
    // A single-field record's key names its one field, under the record's type.
    EXPECT_EQ(format.FindRecordField(L"SCALE", id), 1);
    EXPECT_EQ(id, rec::Scale);
    int win_type = 0;
    EXPECT_EQ(format.FindFieldWinType(L"HA", win_type), 1);
    EXPECT_EQ(win_type, 7);
    EXPECT_EQ(format.FindFieldWinType(L"N1", win_type), 1);
    EXPECT_EQ(win_type, 1);
    EXPECT_EQ(format.FindFieldWinType(L"SD", win_type), 1);
    EXPECT_EQ(win_type, 3);
    EXPECT_EQ(format.FindFieldWinType(L"NOPE", win_type), 0);
}

TEST_F(NeutralFormat, RecordShapesSingleFieldsAndRowTypes) {
    EXPECT_EQ(format.FindFieldsArray(rec::Ss), 6);
    EXPECT_EQ(format.FindFieldsArray(rec::Scale), 1);
    EXPECT_EQ(format.FindFieldsArray(rec::Comment), 0);
    EXPECT_TRUE(format.IsKeyOfSingleField(rec::Targetht));
    EXPECT_FALSE(format.IsKeyOfSingleField(rec::Stn));
    EXPECT_EQ(format.GetFieldId(rec::Targetht), fld::HT);
    EXPECT_EQ(format.GetFieldId(rec::Targetht2), fld::HT);
    EXPECT_EQ(format.GetFieldId(rec::Insht), fld::HI);
    EXPECT_EQ(format.GetFieldId(rec::Swing), rec::Swing);
    EXPECT_EQ(format.GetFieldId(rec::Stn), 0);

    EXPECT_EQ(format.GetRecordType(L"SS        ID=P1"), rec::Ss);
    EXPECT_EQ(format.GetRecordType(L"  ss,ID=P1"), rec::Ss);
    EXPECT_EQ(format.GetRecordType(L"# A NOTE"), rec::Comment);
    EXPECT_EQ(format.GetRecordType(kAdjustedPointsMarker), rec::Comment);
    EXPECT_EQ(format.GetRecordType(L"WEATHER SUNNY"), rec::None);
    EXPECT_EQ(format.GetRecordType(L""), rec::None);

    EXPECT_TRUE(format.IsFileHeader(L"  #version-1.0 neutral file "));
    EXPECT_TRUE(format.IsFileHeader(L"#VERSION-2.1 NEUTRAL FILE"));
    EXPECT_FALSE(format.IsFileHeader(L"# VERSION-1.0 NEUTRAL FILE"));
    EXPECT_FALSE(format.IsFileHeader(L"STN ID=A"));

    std::wstring record;
    EXPECT_EQ(format.ExtractRecord(L" \t\x01  ", record), 0);
    EXPECT_EQ(format.ExtractRecord(L"SS\tID=P1\x07", record), 1);
    EXPECT_EQ(record, L"SS ID=P1");
}

TEST_F(NeutralFormat, ValuesAreReadInTheFilesUnitsAndGivenInWorkingUnits) {
    // ddd.mmss: 123°45'30" is 123.758333°; 89°55' is 89.916667°.
    ASSERT_EQ(format.ProcessRecord(
                  rec::Ss, L"SS ID=P1,HA=123.4530,VA=89.5500,SD=35.214,HT=1.600,CO=FC01", fields),
              1);
    EXPECT_EQ(fields[fld::ID], L"P1");
    EXPECT_NEAR(TextToDouble(fields[fld::HA]), 123.7583333333, 1e-9);
    EXPECT_NEAR(TextToDouble(fields[fld::VA]), 89.9166666667, 1e-9);
    EXPECT_EQ(fields[fld::SD], L"35.214");  // metres in a metre job: the text as written
    EXPECT_EQ(fields[fld::CO], L"FC01");

    // Gons and feet: 100 gon is 90°, 250 gon 225°; 100 ft is 30.48 m.
    ASSERT_EQ(format.ProcessRecord(rec::Unit, L"UNIT UL=F,UA=G", fields), 1);
    ASSERT_EQ(format.ProcessRecord(rec::Bs, L"BS ID=A,HA=250,VA=100,SD=100,HT=5", fields), 1);
    EXPECT_DOUBLE_EQ(TextToDouble(fields[fld::HA]), 225.0);
    EXPECT_DOUBLE_EQ(TextToDouble(fields[fld::VA]), 90.0);
    EXPECT_NEAR(TextToDouble(fields[fld::SD]), 30.48, 1e-12);
    EXPECT_NEAR(TextToDouble(fields[fld::HT]), 1.524, 1e-12);
    EXPECT_NEAR(format.ConvertDist(30.48, true), 100.0, 1e-12);
    EXPECT_NEAR(format.ConvertDist(100.0, false), 30.48, 1e-12);

    // Decimal degrees and US feet (1200/3937 m).
    format.ProcessRecord(rec::Unit2, L"UNIT2 UL=2,UA=1", fields);
    format.ProcessRecord(rec::Pt, L"PT ID=Q,E=3937,N=0", fields);
    EXPECT_NEAR(TextToDouble(fields[fld::E]), 1200.0, 1e-9);
    EXPECT_NEAR(format.ConvertAngle(12.5), 12.5, 1e-12);

    // A job kept in feet reads a metre file into feet.
    settings.SetLengthUnit(nedit::LengthUnit::Feet);
    format.ProcessRecord(rec::Unit, L"UNIT UL=M,UA=S", fields);
    format.ProcessRecord(rec::Insht, L"INSHT 0.3048", fields);
    EXPECT_NEAR(TextToDouble(fields[rec::Insht]), 1.0, 1e-12);
}

TEST_F(NeutralFormat, VerticalModesGiveZenithAngles) {
    // A nadir reading of 95° is measured from straight down: the zenith angle is 85°.
    format.ProcessRecord(rec::Amode, L"AMODE HM=A,VM=N", fields);
    EXPECT_DOUBLE_EQ(format.ConvertToZenithVA(95.0), 85.0);
    // 2°30' above the horizon is a zenith angle of 87°30'.
    format.ProcessRecord(rec::Amode, L"AMODE HM=A,VM=A", fields);
    EXPECT_DOUBLE_EQ(format.ConvertToZenithVA(2.5), 87.5);
    format.ProcessRecord(rec::Amode, L"AMODE HM=B,VM=Z", fields);
    EXPECT_DOUBLE_EQ(format.ConvertToZenithVA(92.25), 92.25);
    format.ResetCurrentValues();
    EXPECT_DOUBLE_EQ(format.ConvertToZenithVA(92.25), 92.25);

    wchar_t angle = 0, length = 0, hmode = 0, vmode = 0;
    settings.SetAngleUnit(nedit::AngleUnit::Gons);
    format.InitUnitsAndAngleModes(angle, length, hmode, vmode);
    EXPECT_EQ(angle, L'G');
    EXPECT_EQ(length, L'M');
    EXPECT_EQ(hmode, L'A');
    EXPECT_EQ(vmode, L'Z');
    EXPECT_NEAR(format.ConvertToAngleDisplayUnit(90.0), 100.0, 1e-12);
}

TEST_F(NeutralFormat, LeftOutFieldsTakeTheirCurrentValue) {
    format.ProcessRecord(rec::Ss, L"SS ID=P1,HA=10.0000,VA=90.0000,SD=5.000,HT=1.600,CO=A", fields);
    format.ProcessRecord(rec::Ss, L"SS ID=P2,HA=20.0000,VA=90.0000,SD=6.000,HT=,CO=B", fields);
    EXPECT_EQ(fields[fld::HT], L"");
    EXPECT_EQ(fields.count(fld::CO), 1u);
    EXPECT_EQ(format.GetCurrentValue(fld::HT), L"1.600");
    EXPECT_EQ(format.GetCurrentValue(fld::ID), L"P2");
    format.SetCurrentValue(fld::HT, L"2.000");
    EXPECT_EQ(format.GetCurrentValue(fld::HT), L"2.000");
    // Single-field records keep their value under their own type.
    format.ProcessRecord(rec::Scale, L"SCALE 0.99960", fields);
    EXPECT_EQ(fields[rec::Scale], L"0.99960");
    EXPECT_EQ(format.GetCurrentValue(rec::Scale), L"0.99960");
    format.ResetCurrentValues();
    EXPECT_EQ(format.GetCurrentValue(fld::HT), L"");
}

TEST_F(NeutralFormat, FieldsAreNamedOrPositional) {
    // Without "KEY=", a value is the field at its place in the record's layout.
    ASSERT_EQ(format.ProcessRecord(rec::Stn, L"STN A,1.550,STN", fields), 1);
    EXPECT_EQ(fields[fld::ID], L"A");
    EXPECT_EQ(fields[fld::HI], L"1.550");
    EXPECT_EQ(fields[fld::CO], L"STN");
    // A coordinate record without a name: the first place is empty, the rest named.
    ASSERT_EQ(format.ProcessRecord(rec::Xyz, L"XYZ       ,E=1.5,N=2.5,H=3.5", fields), 1);
    EXPECT_EQ(fields.count(fld::ID), 0u);
    EXPECT_EQ(fields[fld::N], L"2.5");
    // Unknown field keys are passed over; an unknown type or a comment does not parse.
    ASSERT_EQ(format.ProcessRecord(rec::Stn, L"STN ID=B,FOO=1", fields), 1);
    EXPECT_EQ(fields.size(), 1u);
    EXPECT_EQ(format.ProcessRecord(rec::Comment, L"# X", fields), 0);
    EXPECT_EQ(format.ProcessRecord(124, L"X", fields), 0);
    EXPECT_TRUE(fields.empty());
}

TEST_F(NeutralFormat, RecordsAreLaidOutTheStandardWay) {
    EXPECT_EQ(format.FormatRecord(rec::Ss, L"SS ID=P2 , HA = 123.4530,VA=89.5500"),
              L"SS        ID=P2,HA=123.4530,VA=89.5500");
    EXPECT_EQ(format.FormatRecord(rec::Stn, L"STN       ID=A,HI=0.000,CO= "),
              L"STN       ID=A,HI=0.000,CO=");
    EXPECT_EQ(format.FormatRecord(rec::Scale, L"SCALE 0.99960"), L"SCALE     0.99960");
    EXPECT_EQ(format.FormatRecord(rec::Targetht2, L"TARGETHT2 1.5"), L"TARGETHT2 1.5");
    EXPECT_EQ(format.FormatRecord(rec::Stn, L"STN"), L"STN");
    EXPECT_EQ(format.FormatRecord(rec::Comment, L"#  KEEP   AS IS"), L"#  KEEP   AS IS");

    EXPECT_EQ(format.ReformatRecord(L"XYZ E=1000.000,N=2000.000,H=50.000", L"ID=P1"),
              L"XYZ       ID=P1,E=1000.000,N=2000.000,H=50.000");
    EXPECT_EQ(format.ReformatRecord(L"XYZ       E=1,N=2", L""), L"XYZ       ,E=1,N=2");
    EXPECT_EQ(format.ReformatRecord(L"XYZ 1000", L"ID=P1"), L"XYZ 1000");
    EXPECT_EQ(format.GetStringCount(L"XYZ       ID=A,E=1,N=2,H=3", L','), 3);
    EXPECT_EQ(format.MakeUpperCaseString(L"stn id=\u00e9"), L"STN ID=\u00c9");
}

TEST(NeutralFormatDefinition, BadDefinitionsAreRefusedWithTheLine) {
    UNeutralFileFormat format(nullptr);
    EXPECT_FALSE(format.LoadNeutralFileDefinition(L"/no/such/dir"));
    EXPECT_FALSE(format.IsKeysInitialised());
    EXPECT_FALSE(format.LoadDefinitionText(L"FIELD 800 ID text\nRECORD 110 STN 800 807\n"));
    EXPECT_NE(format.LastDefinitionError().find(L"line 2"), std::wstring::npos);
    EXPECT_FALSE(format.LoadDefinitionText(L"FIELD 800 ID colour\n"));
    EXPECT_FALSE(format.LoadDefinitionText(L"# nothing but a comment\n"));
    EXPECT_TRUE(format.LoadDefinitionText(L"FIELD 800 ID text\nRECORD 110 stn 800\n"));
    int type = 0;
    EXPECT_EQ(format.FindRecordKey(L"STN", type), 1);
}
