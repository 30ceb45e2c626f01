#include <gtest/gtest.h>
#include <sqlite3.h>
#include <sys/stat.h>

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
