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
    ASSERT_EQ(JobSchemaSteps().size(), 2u);
    EXPECT_EQ(JobSchemaSteps().back().version, kJobSchemaVersion);
    const char* const files[] = {"001_initial.sql", "002_transfers.sql"};
    for (std::size_t i = 0; i < JobSchemaSteps().size(); ++i) {
        std::ifstream in(nedit::test::DataDir() + "/schema/" + files[i]);
        std::stringstream text;
        text << in.rdbuf();
        EXPECT_EQ(text.str(), std::string(JobSchemaSteps()[i].sql)) << files[i];
        EXPECT_EQ(JobSchemaSteps()[i].version, static_cast<int>(i) + 1);
    }
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
        steps.push_back({3, "CREATE TABLE added (x); INSERT INTO added VALUES (1);"});
        steps.push_back({4, "INSERT INTO no_such_table VALUES (1);"});
        EXPECT_THROW(ApplySchemaSteps(job, steps), JobError);
        EXPECT_EQ(job.SchemaVersion(), 2);  // step 3 went back with step 4
        EXPECT_FALSE(HasTable(job, "added"));
        EXPECT_EQ(job.TransactionDepth(), 0);

        steps.pop_back();
        ApplySchemaSteps(job, steps);
        EXPECT_EQ(job.SchemaVersion(), 3);
        EXPECT_TRUE(HasTable(job, "added"));
    }
    try {
        JobDatabase::Open(path);
        FAIL() << "a job of a newer schema was opened";
    } catch (const JobError& error) {
        EXPECT_EQ(std::string(error.what()),
                  "The job " + path +
                      " was saved by a newer version of SXNedit (job schema 3); "
                      "this version reads schemas up to 2.");
    }
}

namespace {

// A job as the first schema made it, with a point, and `extra` SQL after it.
void MakeFirstSchemaJob(const std::string& path, const std::string& extra) {
    sqlite3* raw = nullptr;
    ASSERT_EQ(sqlite3_open(path.c_str(), &raw), SQLITE_OK);
    const std::string sql =
        std::string(kJobSchemaV1) +
        "; PRAGMA user_version = 1; PRAGMA application_id = " + std::to_string(kJobApplicationId) +
        "; INSERT INTO point (name, east, north) VALUES ('P1', 1.5, 2.5); " + extra;
    EXPECT_EQ(sqlite3_exec(raw, sql.c_str(), nullptr, nullptr, nullptr), SQLITE_OK);
    sqlite3_close(raw);
}

// The version and the tables of a job, read without upgrading it.
std::string RawState(const std::string& path) {
    sqlite3* raw = nullptr;
    sqlite3_open(path.c_str(), &raw);
    std::string state;
    auto collect = [](void* out, int, char** values, char**) {
        *static_cast<std::string*>(out) += std::string(values[0] ? values[0] : "") + ";";
        return 0;
    };
    sqlite3_exec(raw,
                 "PRAGMA user_version; SELECT name FROM sqlite_master WHERE name LIKE 'transfer%' "
                 "ORDER BY name; SELECT name FROM point",
                 collect, &state, nullptr);
    sqlite3_close(raw);
    return state;
}

}  // namespace

// A job of the first schema, with a point in it, takes the transfers' tables when it is
// opened, in one transaction with its version; an upgrade that fails half-way leaves it as it
// was.
TEST(JobSchema, JobOfTheFirstSchemaUpgradesInOneTransaction) {
    TempDir dir;
    const std::string path = dir.File("v1.job");
    MakeFirstSchemaJob(path, "");
    EXPECT_EQ(RawState(path), "1;P1;");
    {
        JobDatabase job = JobDatabase::Open(path);
        EXPECT_EQ(job.SchemaVersion(), 2);
        EXPECT_EQ(PragmaText(job, "PRAGMA integrity_check"), L"ok");
        EXPECT_EQ(PragmaText(job, "PRAGMA foreign_key_check"), L"");
    }
    EXPECT_EQ(RawState(path), "2;transfer;transfer_left;P1;");

    // A table of the second one's name is in the way: its first table is made, its second
    // is not, and the whole step goes back.
    const std::string blocked = dir.File("blocked.job");
    MakeFirstSchemaJob(blocked, "CREATE TABLE transfer_left (x);");
    EXPECT_THROW(JobDatabase::Open(blocked), JobError);
    EXPECT_EQ(RawState(blocked), "1;transfer_left;P1;");
}
