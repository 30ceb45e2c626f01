#include <gtest/gtest.h>

#include "JobTestSupport.h"
#include "platform/job/JobSettingsStore.h"
#include "platform/job/SettingsTable.h"
#include "platform/job/UDBLayer.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

using namespace nedit;
using nedit::test::JobTest;
using nedit::test::TempDir;

using USurveyDocTest = JobTest;

TEST(ObjectKind, TopSixBitsWithTheVariantsOfPointsAndPolylines) {
    EXPECT_EQ(ObjectKindOf((2L << 26) + 5), 2);
    EXPECT_EQ(ObjectKindOf((3L << 26) + 1), 3);
    EXPECT_EQ(ObjectKindOf((13L << 26) + 1), 1);
    EXPECT_EQ(ObjectKindOf((21L << 26) + 1), 16);
    EXPECT_EQ(ObjectKindOf((17L << 26) + 1), 17);
    EXPECT_EQ(ObjectKindOf(0xFFFFFFFFL), 63);
}

TEST_F(USurveyDocTest, NextPointNumberCountsOnSkipsTakenNamesAndLeavesTheCounter) {
    EXPECT_EQ(job->GetNextPointNumber(), L"1");
    for (const wchar_t* name : {L"1", L"2", L"P10"}) {
        UDBPoint point(job.get(), UWPoint(0, 0, 0));
        point.SetName(name);
        ASSERT_TRUE(point.Save());
    }
    EXPECT_EQ(job->GetNextPointNumber(), L"3");
    EXPECT_EQ(job->GetNextPointNumber(), L"3");
    job->SetCurrentPointNumber(L"P09");
    EXPECT_EQ(job->GetNextPointNumber(L""), L"P11");  // P10 is taken
    EXPECT_EQ(job->GetNextPointNumber(L"P99"), L"P100");
    EXPECT_EQ(job->GetNextPointNumber(L"ABC"), L"ABC1");
    EXPECT_EQ(job->GetNextPointNumber(L"A9B099"), L"A9B100");
    Reopen();
    EXPECT_EQ(job->GetCurrentPointNumber(), L"P09");
}

TEST_F(USurveyDocTest, LayersLockAndSwitchOnByIdentifier) {
    EXPECT_EQ(job->GetLayerId(L"ROADS"), 0);
    UDBLayer roads(job.get(), L"ROADS");
    roads.SetColour(3);
    roads.SetLocked(true);
    roads.SetActive(false);
    ASSERT_TRUE(roads.Save());
    const long id = job->GetLayerId(L"ROADS");
    EXPECT_EQ(id, roads.GetId());
    EXPECT_EQ(job->GetLayerId(L"roads"), 0);
    EXPECT_TRUE(job->IsLayerLocked(id));
    EXPECT_FALSE(job->CanSaveLayer(id));
    EXPECT_TRUE(job->ClearLayerLocked(id));
    EXPECT_TRUE(job->CanSaveLayer(id));
    EXPECT_TRUE(job->SetLayerActive(id));
    const UDBLayer loaded(job.get(), L"ROADS");
    EXPECT_TRUE(loaded.IsActive());
    EXPECT_FALSE(loaded.IsLocked());
    EXPECT_EQ(loaded.GetColour(), 3);
    EXPECT_FALSE(job->CanSaveLayer(0));
    EXPECT_FALSE(job->SetLayerActive(id + 50));

    UDBLayer twin(job.get(), id);
    twin.SetName(L"OTHER");
    ASSERT_TRUE(twin.Save());
    EXPECT_EQ(job->GetLayerId(L"OTHER"), id);  // renamed, not copied
    UDBLayer clash(job.get(), L"NEW");
    clash.SetName(L"OTHER");
    EXPECT_FALSE(clash.Save());
}

TEST_F(USurveyDocTest, SettingsAreStoredInTheJobAndBadValuesKeepTheDefaults) {
    EXPECT_TRUE(job->CoordsOrderXY());
    UJobSettings& settings = job->GetSettings();
    settings.SetLengthUnit(LengthUnit::USFeet);
    settings.SetAngleUnit(AngleUnit::Gons);
    settings.SetLengthDecimals(4);
    settings.SetAngleDecimals(5);
    settings.SetCoordinateOrder(UJobSettings::kNorthEast);
    settings.SetPickAperture(UJobSettings::kApertureLarge);
    settings.SetShowHeight(true);
    settings.SetAngleFormat(UJobSettings::kAngleMarked);
    settings.SetFootFormat(UJobSettings::kFeetAndInches);
    settings.SetFootInchPrecision(32);
    const UJobSettings saved = settings;
    job->SaveSettings();
    CodeSettings codes;
    codes.CodeSeparator = L"/";
    codes.StrNoDigits = 3;
    codes.ContourDigit = 1;
    job->SetCodeSettings(codes);

    Reopen();
    EXPECT_EQ(job->GetSettings(), saved);
    EXPECT_FALSE(job->CoordsOrderXY());
    EXPECT_EQ(job->GetCodeSettings(), codes);
    EXPECT_EQ(job->GetCodeSettings().Keyword(1), L"/");
    EXPECT_EQ(job->GetCodeSettings().Keyword(7), L"CHK");
    EXPECT_EQ(job->GetCodeSettings().Keyword(12), L"");

    WriteSettings(job->Database(), L"job",
                  {{L"length_decimals", L"forty"},
                   {L"coordinate_order", L"7"},
                   {L"foot_inch_precision", L"12"}});
    const UJobSettings read = LoadJobSettings(job->Database());
    EXPECT_EQ(read.GetLengthDecimals(), 3);
    EXPECT_EQ(read.GetCoordinateOrder(), UJobSettings::kEastNorth);
    EXPECT_EQ(read.GetFootInchPrecision(), 16);
    EXPECT_EQ(read.GetAngleUnit(), AngleUnit::Gons);  // the others stand

    // Regen takes what another connection stored.
    {
        JobDatabase other = JobDatabase::Open(path);
        WriteSettings(other, L"job", {{L"coordinate_order", L"0"}});
    }
    EXPECT_FALSE(job->CoordsOrderXY());
    job->Regen();
    EXPECT_TRUE(job->CoordsOrderXY());
}

TEST(USvyCodeLib, LibraryFilesAreReadByTheirHeaderAndCodesFoundWithoutCase) {
    USvyCodeLib library;
    std::wstring error;
    ASSERT_TRUE(library.LoadFile(nedit::test::DataDir() + "/SurveyCodes.csv", error))
        << ToUtf8(error);
    EXPECT_EQ(library.FindSvyCode(L"fnc"), 1);
    EXPECT_EQ(library.FindSvyCode(L" FNC "), 1);
    EXPECT_EQ(library.FindSvyCode(L"FNC01"), 0);
    EXPECT_EQ(library.FindSvyCode(nullptr), 0);
    const USvyCode* fence = library.GetSvyCode(L"FNC");
    ASSERT_NE(fence, nullptr);
    EXPECT_EQ(fence->Layer, L"FENCES");
    EXPECT_EQ(fence->LineType, L"FENCE");
    EXPECT_EQ(fence->IsString, 1);
    ASSERT_NE(library.GetSvyCode(USvyCode::kDefaultCode), nullptr);
    EXPECT_FALSE(library.IsModified());

    TempDir dir;
    // Columns in any order, unknown ones ignored, quoted fields, a later row replaces.
    dir.Write("codes.csv",
              "# office codes\n"
              "layer,code,colour_of_the_day,description,is_string\n"
              "WALLS,WALL,red,\"Wall, stone\",1\n"
              "WALLS2,wall,blue,\"Wall \"\"new\"\"\",0\n");
    ASSERT_TRUE(library.LoadFile(dir.File("codes.csv"), error)) << ToUtf8(error);
    ASSERT_EQ(library.GetCount(), 1);
    EXPECT_EQ(library.GetSvyCode(L"WALL")->Description, L"Wall \"new\"");
    EXPECT_EQ(library.GetSvyCode(L"WALL")->Layer, L"WALLS2");

    // A file that cannot be read leaves the library as it was and says where.
    dir.Write("bad.csv", "code,layer\nKB,ROADS\n\"KB2,ROADS\n");
    EXPECT_FALSE(library.LoadFile(dir.File("bad.csv"), error));
    EXPECT_EQ(error, FromUtf8(dir.File("bad.csv")) + L" line 3: a quoted field does not end.");
    dir.Write("noheader.csv", "KB,ROADS\n");
    EXPECT_FALSE(library.LoadFile(dir.File("noheader.csv"), error));
    EXPECT_EQ(library.GetCount(), 1);

    // Written and read back whole.
    USvyCode odd;
    odd.Code = L"Ö,1";
    odd.Description = L" spaced ";
    odd.PointFlag3 = 1;
    ASSERT_TRUE(library.SetSvyCode(odd));
    ASSERT_TRUE(library.SaveFile(dir.File("out.csv"), error));
    USvyCodeLib again;
    ASSERT_TRUE(again.LoadFile(dir.File("out.csv"), error)) << ToUtf8(error);
    ASSERT_EQ(again.GetCount(), 2);
    EXPECT_EQ(again.GetSvyCode(L"Ö,1")->PointFlag3, 1);
    EXPECT_EQ(again.GetSvyCode(L"Ö,1")->Description, L"spaced");  // values are trimmed
}

TEST(USurveyDocCodes, JobLibraryFirstThenTheSharedOneThenTheDefault) {
    TempDir dir;
    USvyCodeLib defaults;
    std::wstring error;
    ASSERT_TRUE(defaults.LoadFile(nedit::test::DataDir() + "/SurveyCodes.csv", error));
    auto job = USurveyDoc::CreateJob(dir.File("codes.job"), &defaults);
    dir.Write("shared.csv",
              "code,layer,point_colour,line_colour\nFNC,SHARED-FENCES,12,12\nHEDGE,VEG,2,11\n");
    job->SetSharedCodeLibraryPath(dir.File("shared.csv"));

    EXPECT_EQ(job->GetJobCodeLibrary()->GetCount(), defaults.GetCount());
    int answer = -1;
    EXPECT_EQ(job->GetSurveyCodeEx(L"fnc", answer).Layer, L"FENCES");
    EXPECT_EQ(answer, USurveyDoc::kCodeFromJob);
    EXPECT_EQ(job->GetSurveyCodeEx(L"HEDGE", answer).Layer, L"VEG");
    EXPECT_EQ(answer, USurveyDoc::kCodeFromShared);
    EXPECT_EQ(job->GetSurveyCodeEx(L"XYZ", answer, false, true, false, nullptr).Code, L"$$DEFAULT");
    EXPECT_EQ(answer, USurveyDoc::kCodeUndefined);
    EXPECT_EQ(job->GetSurveyCodeEx(L"XYZ", answer, false, false).Layer, L"");
    EXPECT_FALSE(job->GetJobCodeLibrary()->IsModified());

    const USvyCode added = job->GetSurveyCodeEx(L"XYZ", answer, true, false, false, L"NEWCODES");
    EXPECT_EQ(answer, USurveyDoc::kCodeAdded);
    EXPECT_EQ(added.Layer, L"NEWCODES");
    EXPECT_EQ(added.PointMark, L"1");  // the look of the default definition
    EXPECT_TRUE(job->GetJobCodeLibrary()->IsModified());
    EXPECT_EQ(job->GetJobCodeLibrary()->Save(false, true), 1);

    // Display values by a whole code field: its feature code when the field is no code.
    EXPECT_EQ(job->GetPenColourBySvyCode(L"01FNC*AS/corner", true, false), 6);
    EXPECT_EQ(job->GetPenColourBySvyCode(L"HEDGE", false, false), 11);
    EXPECT_EQ(job->GetPenColourBySvyCode(L"NOTHING", true, false), 15);
    EXPECT_EQ(job->GetPointMarkBySvyCode(L"TREE"), 5);
    EXPECT_EQ(job->LineTypeName(job->GetLineTypeBySvyCode(L"FNC")), L"FENCE");
    EXPECT_EQ(job->LineThicknessName(job->GetLineThicknessBySvyCode(L"FNC")), L"0.25");
    EXPECT_EQ(job->GetLineTypeBySvyCode(L"KB"), 0);
    EXPECT_EQ(job->LineTypeIndex(L"solid"), 0);
    EXPECT_EQ(job->LineTypeIndex(L"FENCE"), job->GetLineTypeBySvyCode(L"FNC"));
    UDBLayer fences(job.get(), L"VEG");
    fences.SetColour(9);
    ASSERT_TRUE(fences.Save());
    dir.Write("shared.csv", "code,layer\nHEDGE,VEG\n");
    ASSERT_NE(job->GetSurveyCodeLibrary(true), nullptr);
    EXPECT_EQ(job->GetPenColourBySvyCode(L"HEDGE", true, true), 9);  // by its layer

    const std::string path = job->GetPathName();
    job.reset();
    job = USurveyDoc::OpenJob(path);
    job->SetSharedCodeLibraryPath(dir.File("none.csv"));
    EXPECT_EQ(job->GetSurveyCodeLibrary(), nullptr);
    EXPECT_EQ(job->GetSurveyCodeEx(L"xyz", answer).Layer, L"NEWCODES");
    EXPECT_EQ(answer, USurveyDoc::kCodeFromJob);
    EXPECT_EQ(job->GetSurveyCodeLibraryFromJob(), job->GetJobCodeLibrary());

    // A shared file that cannot be read gives no library and says why.
    dir.Write("broken.csv", "layer\nX\n");
    job->SetSharedCodeLibraryPath(dir.File("broken.csv"));
    EXPECT_EQ(job->GetSurveyCodeLibrary(), nullptr);
    EXPECT_FALSE(job->SharedLibraryError().empty());
}
