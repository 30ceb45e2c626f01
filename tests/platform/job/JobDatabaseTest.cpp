#include <gtest/gtest.h>
#include <sqlite3.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include "JobTestSupport.h"
#include "platform/job/JobDatabase.h"
#include "platform/job/UDBPoint.h"

using namespace nedit;
using nedit::test::TempDir;

namespace {

// The message of the JobError that `open` throws; empty when it throws none.
template <class Action>
std::string ErrorOf(Action open) {
    try {
        open();
    } catch (const JobError& error) {
        return error.what();
    }
    return "";
}

}  // namespace

TEST(JobOpen, WhatIsNotAJobIsRefusedWithAClearMessage) {
    TempDir dir;
    dir.Write("notes.txt", "#VERSION-1.0 NEUTRAL FILE\nSTN ID=A\n" + std::string(2000, 'x'));
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Open(dir.File("notes.txt")); }),
              dir.File("notes.txt") + " is not a job file.");

    dir.Write("empty.job", "");
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Open(dir.File("empty.job")); }),
              dir.File("empty.job") + " is not a job file.");

    // An SQLite database of some other program.
    sqlite3* other = nullptr;
    ASSERT_EQ(sqlite3_open(dir.File("other.db").c_str(), &other), SQLITE_OK);
    sqlite3_exec(other, "CREATE TABLE t (x); PRAGMA user_version = 1;", nullptr, nullptr, nullptr);
    sqlite3_close(other);
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Open(dir.File("other.db")); }),
              dir.File("other.db") + " is not a job file.");

    EXPECT_EQ(ErrorOf([&] { JobDatabase::Open(dir.Path()); }),
              dir.Path() + " is a folder, not a job file.");
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Open(dir.File("none.job")); }),
              "Cannot open the job " + dir.File("none.job") + ": there is no such file.");
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Open(dir.File("gone/x.job")); }),
              "Cannot open the job " + dir.File("gone/x.job") + ": the folder " + dir.File("gone") +
                  " does not exist.");
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Create(dir.File("gone/x.job")); }),
              "Cannot create the job " + dir.File("gone/x.job") + ": the folder " +
                  dir.File("gone") + " does not exist.");
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Create(dir.File("notes.txt")); }),
              "Cannot create the job " + dir.File("notes.txt") + ": a file of that name exists.");
    // Refusing to create over a file must leave that file alone.
    struct stat info {};
    ASSERT_EQ(stat(dir.File("notes.txt").c_str(), &info), 0);
    EXPECT_GT(info.st_size, 2000);
}

TEST(JobOpen, ReadOnlyFileCanOnlyBeRead) {
    TempDir dir;
    const std::string path = dir.File("archive.job");
    {
        auto job = USurveyDoc::CreateJob(path, nullptr);
        UDBPoint point(job.get(), UWPoint(100.0, 200.0, 10.0));
        point.SetName(L"A");
        ASSERT_TRUE(point.Save());
    }
    ASSERT_EQ(chmod(path.c_str(), 0444), 0);
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Open(path); }),
              "The job " + path + " is read-only: it can be opened for reading only.");

    JobOpenOptions readOnly;
    readOnly.access = JobAccess::ReadOnly;
    USurveyDoc job(JobDatabase::Open(path, readOnly));
    EXPECT_TRUE(job.Database().IsReadOnly());
    const long id = job.GetPointId(UPointNumber(L"A"));
    UDBPoint point(&job, id);
    EXPECT_EQ(point.GetEast(), 100.0);
    point.SetEast(1.0);
    EXPECT_EQ(ErrorOf([&] { point.Save(); }),
              "The job " + path + " is open read-only and cannot be changed.");
    // Table look-ups that would add a name give 0 instead of failing.
    EXPECT_EQ(job.SymbolIndex(L"NEW"), 0);
}

namespace {

// A job that a program left in the middle of a transaction, as kill -9 leaves it: changed
// pages in the file, the old ones in its journal.
std::string JobLeftWithAHotJournal(const TempDir& dir) {
    const std::string path = dir.File("crashed.job");
    {
        auto job = USurveyDoc::CreateJob(path, nullptr);
        UDBPoint point(job.get(), UWPoint(1.0, 2.0, 3.0));
        point.SetName(L"KEPT");
        EXPECT_TRUE(point.Save());
    }
    const pid_t child = fork();
    if (child == 0) {
        JobDatabase job = JobDatabase::Open(path);
        job.Execute("PRAGMA cache_size = 1");  // so that changed pages reach the file
        job.BeginLevel();
        for (int i = 0; i < 2000; ++i) {
            job.Execute("INSERT INTO point (name, east, north) VALUES ('LOST" + std::to_string(i) +
                        "', 0, 0)");
        }
        _exit(0);  // no commit, no rollback, no close
    }
    int status = 0;
    waitpid(child, &status, 0);
    EXPECT_TRUE(WIFEXITED(status));
    struct stat journal {};
    EXPECT_EQ(stat((path + "-journal").c_str(), &journal), 0) << "no journal was left";
    return path;
}

long long PointCount(JobDatabase& job) {
    auto query = job.Query("SELECT count(*) FROM point");
    return query->Step() ? query->Int(0) : -1;
}

}  // namespace

TEST(JobOpen, AJobLeftInATransactionIsRolledBackWhenOpenedForReading) {
    TempDir dir;
    const std::string path = JobLeftWithAHotJournal(dir);
    JobOpenOptions readOnly;
    readOnly.access = JobAccess::ReadOnly;
    JobDatabase job = JobDatabase::Open(path, readOnly);
    EXPECT_EQ(PointCount(job), 1);
    EXPECT_TRUE(job.IsReadOnly());
    struct stat journal {};
    EXPECT_NE(stat((path + "-journal").c_str(), &journal), 0) << "the journal is still there";
}

TEST(JobOpen, AJobLeftInATransactionThatCannotBeWrittenNeedsRecovery) {
    TempDir dir;
    const std::string path = JobLeftWithAHotJournal(dir);
    ASSERT_EQ(chmod(path.c_str(), 0444), 0);
    JobOpenOptions readOnly;
    readOnly.access = JobAccess::ReadOnly;
    EXPECT_EQ(ErrorOf([&] { JobDatabase::Open(path, readOnly); }),
              "The job " + path +
                  " was left in the middle of a change by a program that stopped. It needs "
                  "recovery, which a program that may write the job does when it opens it: "
                  "make the file writable and open it again.");
}
