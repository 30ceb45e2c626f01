// Raw-data documents stored in a job: import, load, save, reopen, export, and the container.

#include <gtest/gtest.h>

#include <fstream>

#include "../support/HeadlessDialogHost.h"
#include "../support/TestSupport.h"
#include "document/UListCtrl.h"
#include "document/URawDataContainer.h"
#include "platform/job/USurveyDoc.h"
#include "platform/storage/UStreamFile.h"
#include "reduction/UCoordEntryDlg.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

namespace {

class RawDataDocuments : public ::testing::Test {
  protected:
    void SetUp() override {
        job = USurveyDoc::CreateJob(dir.File("site.job"), nullptr);
        container = std::make_unique<URawDataContainer>(job.get());
        ASSERT_EQ(container->Open(), 1);
    }

    /// Closes everything and opens the job again, as a later session would.
    void Reopen() {
        container.reset();
        job.reset();
        job = USurveyDoc::OpenJob(dir.File("site.job"));
        container = std::make_unique<URawDataContainer>(job.get());
        ASSERT_EQ(container->Open(), 1);
    }

    std::wstring File(const std::string& name, const std::string& text) {
        dir.Write(name, text);
        const std::string path = dir.File(name);
        return std::wstring(path.begin(), path.end());
    }

    std::vector<std::wstring> RowsOf(const std::wstring& name) {
        UNeditDoc* doc = container->GetNeditDoc(name);
        EXPECT_NE(doc, nullptr);
        return doc == nullptr ? std::vector<std::wstring>() : doc->OpenList().GetRows();
    }

    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    std::unique_ptr<USurveyDoc> job;
    std::unique_ptr<URawDataContainer> container;
};

const char* const kSurvey =
    "#VERSION-1.0 NEUTRAL FILE\n\nunit ul=m,ua=d\nstn id=k,hi=1.0\nxyz e=5,n=6,h=7\n\nss "
    "id=q,ha=0,va=90,sd=10,ht=1\n";

}  // namespace

TEST_F(RawDataDocuments, ImportSaveReopenAndExportKeepEveryRow) {
    std::wstring name;
    ASSERT_EQ(container->CreateNEditDocFromNeutralFile(L"", File("field.neu", kSurvey), &name), 1);
    EXPECT_EQ(name, L"Data1");
    // Blank lines of the file are left out, so no row after them is lost.
    const std::vector<std::wstring> rows = {
        L"#VERSION-1.0 NEUTRAL FILE",
        L"UNIT      UL=M,UA=D",
        L"STN       ID=K,HI=1.0",
        L"XYZ       ID=K,E=5,N=6,H=7",
        L"SS        ID=Q,HA=0,VA=90,SD=10,HT=1",
    };
    EXPECT_EQ(RowsOf(L"Data1"), rows);

    UNeditDoc* doc = container->GetNeditDoc(L"Data1");
    doc->OpenList().AddRecord(5, L"note checked by the office");
    doc->GetNeditSettings().Set(UNeditSettings::ShowPointCodes, 1);
    ASSERT_EQ(doc->SaveDocument(), 1);
    Reopen();
    std::vector<std::wstring> saved = rows;
    saved.push_back(L"NOTE      CHECKED BY THE OFFICE");
    EXPECT_EQ(RowsOf(L"Data1"), saved);
    doc = container->GetNeditDoc(L"Data1");
    EXPECT_EQ(doc->GetNeditSettings().Get(UNeditSettings::ShowPointCodes), 1);
    EXPECT_EQ(doc->GetNeditSettings().Get(UNeditSettings::ShowPoints), 1);

    ASSERT_EQ(doc->Save(File("out.neu", ""), &doc->OpenList()), 1);
    std::string expected;
    for (const std::wstring& row : saved) expected += std::string(row.begin(), row.end()) + "\n";
    EXPECT_EQ(dir.Read("out.neu"), expected);
    EXPECT_EQ(doc->Save(std::wstring(L"/no/such/dir/out.neu"), &doc->OpenList()), 0);
}

TEST_F(RawDataDocuments, AReductionAddsTheCoordinatesItWasGiven) {
    ASSERT_EQ(container->CreateNEditDocFromNeutralFile(
                  L"", File("unknown.neu",
                            "#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\nSTN ID=NEW,HI=1\nSS "
                            "ID=Q,HA=0,VA=90,SD=10,HT=1\n")),
              1);
    UNeditDoc* doc = container->GetNeditDoc(L"Data1");
    nedit::HeadlessDialogHost host;
    host.SetFace<UCoordEntryDlg>([](UCoordEntryDlg& dialog) {
        dialog.InitXYZ(100.0, 200.0, 30.0, L"");
        return dialog.OnOK() ? nedit::mb::IdOk : nedit::mb::IdCancel;
    });
    doc->SetDialogHost(&host);
    UListCtrl& list = doc->OpenList();
    ASSERT_EQ(doc->SetupDataBase(&list), 1);
    EXPECT_EQ(list.GetItemText(list.GetItemCount() - 1),
              L"XYZ       ID=NEW,E=100.000,N=200.000,H=30.000");
    EXPECT_NE(doc->GetNReport()->GetText().find(L"Main Report"), std::wstring::npos);
    ASSERT_EQ(doc->SaveDocument(), 1);
    Reopen();
    EXPECT_EQ(RowsOf(L"Data1").back(), L"XYZ       ID=NEW,E=100.000,N=200.000,H=30.000");
    // The second run finds the station in its rows: the user confirms it, and nothing is added.
    doc = container->GetNeditDoc(L"Data1");
    doc->SetDialogHost(&host);
    ASSERT_EQ(doc->SetupDataBase(&doc->OpenList()), 1);
    EXPECT_EQ(doc->OpenList().GetItemCount(), 5);
}

TEST_F(RawDataDocuments, NamesRenamesAndDeletes) {
    EXPECT_EQ(container->GetUntitledName(), L"Data1");
    ASSERT_EQ(container->CreateNEditDocFromNeutralFile(L"", File("a.neu", kSurvey)), 1);
    ASSERT_EQ(container->CreateNEditDocFromNeutralFile(L"Lot ", File("a.neu", kSurvey)), 1);
    EXPECT_EQ(container->GetUntitledName(), L"Data2");
    EXPECT_EQ(container->GetDocumentNames(), (std::vector<std::wstring>{L"Data1", L"Lot 1"}));
    EXPECT_FALSE(container->RenameNeditDoc(L"Data1", L"Lot 1"));  // the name is taken
    EXPECT_FALSE(container->RenameNeditDoc(L"Z", L"Nobody"));
    ASSERT_TRUE(container->RenameNeditDoc(L"Zone \u00c9st", L"Lot 1"));
    EXPECT_EQ(RowsOf(L"Zone \u00c9st").size(), 5u);
    EXPECT_FALSE(container->DeleteNeditDoc(L"Nobody"));
    ASSERT_TRUE(container->DeleteNeditDoc(L"Data1"));
    Reopen();
    EXPECT_EQ(container->GetDocumentNames(), std::vector<std::wstring>{L"Zone \u00c9st"});
    EXPECT_EQ(container->CreateNEditDocFromNeutralFile(L"", File("missing.neu", "") + L"x"), 0);
}

TEST_F(RawDataDocuments, AStreamReadStopsAtAnEmptyLineAndSaysSo) {
    auto doc = std::make_unique<UNeditDoc>(job.get());
    ASSERT_EQ(doc->CreateDocument(L"Hand", container.get()), 1);
    UStreamFile stream;
    ASSERT_EQ(stream.CreateStream(*doc->GetStorage(), UNeditDoc::kNeutralDataStream, 4113), 1);
    for (const wchar_t* line :
         {L"#VERSION-1.0 NEUTRAL FILE", L"STN ID=A", L"", L"SS ID=B", L"SS ID=C"}) {
        stream.WriteString(line);
    }
    stream.Close();
    nedit::HeadlessDialogHost host;
    doc->SetDialogHost(&host);
    UListCtrl list(doc.get());
    ASSERT_EQ(doc->Load(&list), 1);
    EXPECT_EQ(list.GetItemCount(), 2);
    ASSERT_EQ(host.Messages().size(), 1u);
    EXPECT_EQ(host.Messages()[0].text,
              L"The records of Hand end at an empty line; 2 further lines were not read.");
    // A document whose stream is missing loads nothing.
    auto empty = std::make_unique<UNeditDoc>(job.get());
    ASSERT_EQ(empty->CreateDocument(L"Empty", container.get()), 1);
    UListCtrl none(empty.get());
    EXPECT_EQ(empty->Load(&none), 0);
    EXPECT_EQ(none.GetItemCount(), 0);
    // Saving without a list and with no text writes nothing and succeeds.
    EXPECT_EQ(empty->Save(nullptr, 0), 1);
}

// A save writes the stream again only when it does not hold the rows as the list has them;
// whether it was written or not, the stream then holds them, a line feed after each.
TEST_F(RawDataDocuments, ASavedStreamHoldsTheRowsAsTheListHasThem) {
    auto stored_text = [](UNeditDoc& doc) {
        std::string text;
        doc.GetStorage()->ReadStream(UNeditDoc::kNeutralDataStream, text);
        return text;
    };
    auto doc = std::make_unique<UNeditDoc>(job.get());
    ASSERT_EQ(doc->CreateDocument(L"Hand", container.get()), 1);
    UStreamFile stream;
    ASSERT_EQ(stream.CreateStream(*doc->GetStorage(), UNeditDoc::kNeutralDataStream, 4113), 1);
    const std::string hand = "#VERSION-1.0 NEUTRAL FILE\r\nstn id=a\r\nss id=b,ha=1\r\n";
    stream.Write(hand.data(), hand.size());
    stream.Close();
    const std::string laid_out = "#VERSION-1.0 NEUTRAL FILE\nSTN       ID=A\nSS        ID=B,HA=1\n";
    UListCtrl& list = doc->OpenList();
    ASSERT_EQ(doc->SaveDocument(), 1);
    EXPECT_EQ(stored_text(*doc), laid_out);
    // Saved again unchanged, and after a row was added.
    ASSERT_EQ(doc->SaveDocument(), 1);
    EXPECT_EQ(stored_text(*doc), laid_out);
    list.AddRecord(list.GetItemCount(), L"ss id=c");
    ASSERT_EQ(doc->SaveDocument(), 1);
    EXPECT_EQ(stored_text(*doc), laid_out + "SS        ID=C\n");
    // A document read again from a stream that holds its rows saves them as they are.
    doc.reset();
    Reopen();
    UNeditDoc* again = container->GetNeditDoc(L"Hand");
    ASSERT_NE(again, nullptr);
    again->OpenList().SetRecord(1, L"stn id=z");
    ASSERT_EQ(again->SaveDocument(), 1);
    EXPECT_EQ(stored_text(*again),
              "#VERSION-1.0 NEUTRAL FILE\nSTN       ID=Z\nSS        ID=B,HA=1\nSS        ID=C\n");
}

TEST_F(RawDataDocuments, AJobHolds1023DocumentsAndNoMore) {
    UStorage* storage = container->GetStorage();
    ASSERT_NE(storage, nullptr);
    for (int number = 1; number <= 1023; ++number) {
        UStorage child;
        ASSERT_EQ(child.Create(*storage, L"Data" + std::to_wstring(number), 69650), 1);
        child.Release();
    }
    // The search for a free name ends at 1023, though that name is taken.
    EXPECT_EQ(container->GetUntitledName(), L"Data1023");
    EXPECT_EQ(container->CreateNEditDocFromNeutralFile(L"", File("b.neu", kSurvey)), 0);
}

TEST(RawDataDocument, RecordTemplatesInputsAndCommands) {
    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    UNeditDoc doc(nullptr);
    EXPECT_EQ(doc.FormRecBuf(110), L"STN ID=,HI=,CO=");
    EXPECT_EQ(doc.FormRecBuf(118), L"SCALE ");
    EXPECT_EQ(doc.FormRecBuf(132), L"##########ADJUSTED-POINTS");
    EXPECT_EQ(doc.FormRecBuf(124), L"");

    struct Input : XInput {
        void Terminate(int command) override { ended = command; }
        int ended = 0;
    };
    Input input;
    EXPECT_EQ(doc.Push(nullptr), 0);
    EXPECT_EQ(doc.OnCmdMsg(32968, 0, &input), 1);
    EXPECT_EQ(doc.IsOptionActive(), 1);
    EXPECT_EQ(doc.OnCmdMsg(33575, 0, nullptr), 1);
    EXPECT_EQ(input.ended, 33575);
    int value = 42;
    doc.OnCmdMsg(32777, 0, &value);
    int read = 0;
    doc.OnCmdMsg(32778, 0, &read);
    EXPECT_EQ(read, 42);
    doc.SetModalOptionActive(1);
    doc.OnAbortModalOption();
    EXPECT_EQ(input.ended, 2);
    EXPECT_EQ(doc.Top(), nullptr);
    EXPECT_EQ(doc.OnCmdMsg(40000, 0, nullptr), 0);
    EXPECT_EQ(doc.OnCmdMsg(32776, 1, nullptr), 0);  // another code goes to the base
}

TEST(RawDataDocument, SettingsHaveTheirDefaultsAndRoundTrip) {
    UNeditSettings settings;
    EXPECT_EQ(settings.Write(), "1,1,1\n2,1,1\n3,1,0\n4,1,0\n5,1,0\n6,1,0\n7,4,0\n");
    settings.Set(UNeditSettings::TextSize, 1);
    UNeditSettings read;
    ASSERT_TRUE(read.Read(settings.Write()));
    EXPECT_EQ(read.Get(UNeditSettings::TextSize), 1);
    EXPECT_FALSE(read.Read("9,1,1\n"));
    EXPECT_FALSE(read.Read("garbage"));
    EXPECT_EQ(read.Get(UNeditSettings::TextSize), 1);
}
