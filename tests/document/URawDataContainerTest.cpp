// The raw-data documents of a job as two programs and a crash see them: every document comes
// into being, and is renamed, in one transaction, and a name is never taken twice.

#include <gtest/gtest.h>
#include <sqlite3.h>

#include "../support/TestSupport.h"
#include "document/UListCtrl.h"
#include "document/URawDataContainer.h"
#include "platform/job/JobDatabase.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

namespace {

const char* const kDayOne = "#VERSION-1.0 NEUTRAL FILE\nSTN ID=A,HI=1.5\nSS ID=P1,HA=0\n";
const char* const kDayTwo = "#VERSION-1.0 NEUTRAL FILE\nSTN ID=B,HI=1.6\nSS ID=P2,HA=0\n";

/// One program's view of a job: the job open and its container.
struct Program {
    explicit Program(const std::string& path)
        : job(USurveyDoc::OpenJob(path)),
          container(std::make_unique<URawDataContainer>(job.get())) {
        EXPECT_EQ(container->Open(), 1);
    }
    std::vector<std::wstring> RowsOf(const std::wstring& name) {
        UNeditDoc* doc = container->GetNeditDoc(name);
        EXPECT_NE(doc, nullptr);
        return doc == nullptr ? std::vector<std::wstring>() : doc->OpenList().GetRows();
    }

    std::unique_ptr<USurveyDoc> job;
    std::unique_ptr<URawDataContainer> container;
};

int CountCommit(void* commits) {
    ++*static_cast<int*>(commits);
    return 0;
}

class RawDataContainer : public ::testing::Test {
  protected:
    void SetUp() override { USurveyDoc::CreateJob(dir.File("site.job"), nullptr); }

    std::wstring File(const std::string& name, const std::string& text) {
        dir.Write(name, text);
        return nedit::FromUtf8(dir.File(name));
    }
    /// Counts the transactions that `program` commits from now on.
    void CountCommits(Program& program) {
        sqlite3_commit_hook(program.job->Database().Handle(), CountCommit, &commits);
    }

    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    int commits = 0;
};

}  // namespace

TEST_F(RawDataContainer, AnImportAndARenameAreOneTransactionEach) {
    Program program(dir.File("site.job"));
    CountCommits(program);
    std::wstring name;
    ASSERT_EQ(program.container->CreateNEditDocFromNeutralFile(L"", File("a.neu", kDayOne), &name),
              1);
    EXPECT_EQ(commits, 1) << "the storage, its streams and its name in one transaction";
    commits = 0;
    ASSERT_TRUE(program.container->RenameNeditDoc(L"LOT 12", name));
    EXPECT_EQ(commits, 1) << "a rename is one transaction";
    commits = 0;
    ASSERT_EQ(program.container->CreateNEditDocNamed(L"DAY 2", File("b.neu", kDayTwo)), 1);
    EXPECT_EQ(commits, 1);

    Program later(dir.File("site.job"));
    EXPECT_EQ(later.container->GetDocumentNames(),
              (std::vector<std::wstring>{L"DAY 2", L"LOT 12"}));
    EXPECT_EQ(later.RowsOf(L"LOT 12").at(1), L"STN       ID=A,HI=1.5");
}

TEST_F(RawDataContainer, ANameAnotherProgramTookIsNeverOverwritten) {
    // Both programs open the job before either stores anything.
    Program first(dir.File("site.job"));
    Program second(dir.File("site.job"));
    ASSERT_EQ(first.container->CreateNEditDocNamed(L"SAME", File("a.neu", kDayOne)), 1);
    // The second does not know of it yet, and must still not replace it.
    EXPECT_EQ(second.container->CreateNEditDocNamed(L"SAME", File("b.neu", kDayTwo)), 0);
    EXPECT_TRUE(second.container->HasName(L"SAME"));
    std::wstring numbered;
    ASSERT_EQ(
        second.container->CreateNEditDocFromNeutralFile(L"", File("b.neu", kDayTwo), &numbered), 1);
    EXPECT_FALSE(second.container->RenameNeditDoc(L"SAME", numbered));
    // Without a name each takes the next free one.
    std::wstring other;
    ASSERT_EQ(first.container->CreateNEditDocFromNeutralFile(L"", File("a.neu", kDayOne), &other),
              1);
    EXPECT_NE(other, numbered);

    Program later(dir.File("site.job"));
    EXPECT_EQ(later.RowsOf(L"SAME").at(1), L"STN       ID=A,HI=1.5");
    EXPECT_EQ(later.RowsOf(numbered).at(1), L"STN       ID=B,HI=1.6");
    EXPECT_EQ(later.container->GetDocumentNames().size(), 3u);
}

TEST_F(RawDataContainer, ALatin1FileKeepsItsLettersThroughLoadSaveAndRename) {
    Program program(dir.File("site.job"));
    // "ÉCOLE" in Latin-1, as older field programs wrote it: no valid UTF-8.
    const std::string latin1 =
        "#VERSION-1.0 NEUTRAL FILE\nSTN ID=\xC9"
        "COLE,HI=1.5\nSS ID=P1,HA=0\n";
    ASSERT_EQ(program.container->CreateNEditDocNamed(L"OLD", File("old.neu", latin1)), 1);
    const std::wstring station = L"STN       ID=\u00C9COLE,HI=1.5";
    EXPECT_EQ(program.RowsOf(L"OLD").at(1), station);
    ASSERT_EQ(program.container->GetNeditDoc(L"OLD")->SaveDocument(), 1);
    ASSERT_TRUE(program.container->RenameNeditDoc(L"NEW", L"OLD"));

    Program later(dir.File("site.job"));
    EXPECT_EQ(later.RowsOf(L"NEW").at(1), station);
    // Saved again, the letters are stored as UTF-8.
    std::string stored;
    ASSERT_TRUE(later.container->GetNeditDoc(L"NEW")->GetStorage()->ReadStream(
        UNeditDoc::kNeutralDataStream, stored));
    EXPECT_NE(stored.find("ID=\xC3\x89"
                          "COLE"),
              std::string::npos);
}
