#include <gtest/gtest.h>
#include <sqlite3.h>

#include <fstream>
#include <sstream>

#include "JobTestSupport.h"
#include "platform/job/JobDatabase.h"
#include "platform/job/JobSchema.h"

using namespace nedit;
using nedit::test::TempDir;

namespace {

std::wstring PragmaText(JobDatabase& job, const char* pragma) {
    auto query = job.Query(pragma);
    return query->Step() ? query->Text(0) : L"";
}

bool HasTable(JobDatabase& job, const char* name) {
    auto query = job.Query("SELECT 1 FROM sqlite_master WHERE type = 'table' AND name = ?");
    query->BindUtf8(1, name);
    return query->Step();
}

}  // namespace

TEST(JobSchema, ProgramCarriesTheReviewedScripts) {
    ASSERT_EQ(JobSchemaSteps().size(), 1u);
    EXPECT_EQ(JobSchemaSteps().back().version, kJobSchemaVersion);
}

TEST(JobSchema, NewJobIsMarkedVersionedAndPassesTheDatabaseChecks) {
    TempDir dir;
    JobDatabase job = JobDatabase::Create(dir.File("new.job"));
    EXPECT_EQ(job.SchemaVersion(), kJobSchemaVersion);
    EXPECT_EQ(PragmaText(job, "PRAGMA application_id"), std::to_wstring(kJobApplicationId));
    EXPECT_EQ(PragmaText(job, "PRAGMA integrity_check"), L"ok");
    EXPECT_EQ(PragmaText(job, "PRAGMA foreign_key_check"), L"");
    EXPECT_EQ(PragmaText(job, "PRAGMA foreign_keys"), L"1");
    EXPECT_EQ(PragmaText(job, "PRAGMA journal_mode"), L"delete");
}

TEST(JobSchema, UpgradeIsAllOrNothingAndANewerJobIsRefused) {
    TempDir dir;
    const std::string path = dir.File("old.job");
    {
        JobDatabase job = JobDatabase::Create(path);
        std::vector<SchemaStep> steps = JobSchemaSteps();
        steps.push_back({2, "CREATE TABLE added (x); INSERT INTO added VALUES (1);"});
        steps.push_back({3, "INSERT INTO no_such_table VALUES (1);"});
        EXPECT_THROW(ApplySchemaSteps(job, steps), JobError);
        EXPECT_EQ(job.SchemaVersion(), 1);  // step 2 went back with step 3
        EXPECT_FALSE(HasTable(job, "added"));
        EXPECT_EQ(job.TransactionDepth(), 0);

        steps.pop_back();
        ApplySchemaSteps(job, steps);
        EXPECT_EQ(job.SchemaVersion(), 2);
        EXPECT_TRUE(HasTable(job, "added"));
    }
    try {
        JobDatabase::Open(path);
        FAIL() << "a job of a newer schema was opened";
    } catch (const JobError& error) {
        EXPECT_EQ(std::string(error.what()),
                  "The job " + path +
                      " was saved by a newer version of SXNedit (job schema 2); "
                      "this version reads schemas up to 1.");
    }
}
