#include <gtest/gtest.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include "JobTestSupport.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/UDBSQLiteTransaction.h"

using namespace nedit;
using nedit::test::JobTest;

namespace {

bool SavePoint(USurveyDoc* job, const std::wstring& name) {
    UDBPoint point(job, UWPoint(1.0, 2.0, UWPoint::kNoHeight));
    point.SetName(name);
    return point.Save();
}

long long CountPoints(USurveyDoc& job) {
    auto query = job.Database().Query("SELECT count(*) FROM point");
    return query->Step() ? query->Int(0) : -1;
}

}  // namespace

using JobTransaction = JobTest;

TEST_F(JobTransaction, RollsBackUnlessCommittedAndInnerOnesUndoOnlyTheirOwn) {
    {
        UDBSQLiteTransaction outer(job.get());
        ASSERT_TRUE(SavePoint(job.get(), L"A"));
        {
            UDBSQLiteTransaction inner(job.get());
            ASSERT_TRUE(SavePoint(job.get(), L"B"));
        }  // not committed: B goes
        {
            UDBSQLiteTransaction inner(job.get());
            ASSERT_TRUE(SavePoint(job.get(), L"C"));
            inner.Commit();
        }
        EXPECT_NE(job->GetPointId(UPointNumber(L"C")), 0);
        EXPECT_EQ(job->GetPointId(UPointNumber(L"B")), 0);
    }  // the outer one was not committed: nothing stays
    EXPECT_EQ(CountPoints(*job), 0);

    {
        UDBSQLiteTransaction outer(job.get());
        ASSERT_TRUE(SavePoint(job.get(), L"A"));
        {
            UDBSQLiteTransaction inner(job.get());
            ASSERT_TRUE(SavePoint(job.get(), L"B"));
            inner.Rollback();
        }
        ASSERT_TRUE(SavePoint(job.get(), L"C"));
        outer.Commit();
        outer.Commit();  // a second commit does nothing
    }
    Reopen();
    EXPECT_NE(job->GetPointId(UPointNumber(L"A")), 0);
    EXPECT_EQ(job->GetPointId(UPointNumber(L"B")), 0);
    EXPECT_NE(job->GetPointId(UPointNumber(L"C")), 0);
    EXPECT_EQ(job->Database().TransactionDepth(), 0);

    // Without a job a transaction does nothing, so callers need no test of their own.
    UDBSQLiteTransaction none(static_cast<USurveyDoc*>(nullptr));
    EXPECT_FALSE(none.IsActive());
    none.Commit();
}

TEST_F(JobTransaction, AWriterKilledMidTransactionLeavesTheLastCommittedState) {
    ASSERT_TRUE(SavePoint(job.get(), L"KEPT"));
    job.reset();

    int ready[2];
    ASSERT_EQ(pipe(ready), 0);
    const pid_t writer = fork();
    ASSERT_GE(writer, 0);
    if (writer == 0) {
        close(ready[0]);
        try {
            auto child = USurveyDoc::OpenJob(path);
            // A tiny page cache makes SQLite write changed pages into the job file before the
            // commit, so the kill leaves a half-written file that only the journal can mend.
            child->Database().Execute("PRAGMA cache_size = 5");
            UDBSQLiteTransaction transaction(child.get());
            for (int i = 0; i < 5000; ++i) SavePoint(child.get(), L"LOST" + std::to_wstring(i));
            UDBPoint kept(child.get(), child->GetPointId(UPointNumber(L"KEPT")));
            kept.SetEast(-1.0);
            kept.Save();
            const char byte = 'w';
            if (write(ready[1], &byte, 1) != 1) _exit(2);
            pause();  // killed here, with the transaction open
        } catch (...) {
        }
        _exit(1);
    }
    close(ready[1]);
    char byte = 0;
    ASSERT_EQ(read(ready[0], &byte, 1), 1) << "the writer failed before its transaction";
    close(ready[0]);
    ASSERT_EQ(kill(writer, SIGKILL), 0);
    int status = 0;
    ASSERT_EQ(waitpid(writer, &status, 0), writer);
    ASSERT_TRUE(WIFSIGNALED(status));
    // The killed writer left its journal behind: opening the job must roll it back.
    EXPECT_EQ(access((path + "-journal").c_str(), F_OK), 0);

    Reopen();
    EXPECT_EQ(CountPoints(*job), 1);
    UDBPoint kept(job.get(), job->GetPointId(UPointNumber(L"KEPT")));
    EXPECT_EQ(kept.GetEast(), 1.0);
    auto check = job->Database().Query("PRAGMA integrity_check");
    ASSERT_TRUE(check->Step());
    EXPECT_EQ(check->Text(0), L"ok");
}

TEST_F(JobTransaction, ASecondProcessWaitsForTheWriterInsteadOfFailing) {
    // No connection may cross the fork: SQLite keeps per-process lock state.
    job.reset();
    int toSecond[2];
    int toFirst[2];
    ASSERT_EQ(pipe(toSecond), 0);
    ASSERT_EQ(pipe(toFirst), 0);
    const pid_t second = fork();
    ASSERT_GE(second, 0);
    if (second == 0) {
        close(toSecond[1]);
        close(toFirst[0]);
        int result = 1;
        try {
            char byte = 0;
            if (read(toSecond[0], &byte, 1) != 1) _exit(2);  // the first process is writing
            // With no patience the job is busy at once: that is what the timeout prevents.
            JobOpenOptions impatient;
            impatient.busyTimeoutMs = 0;
            auto hurried = USurveyDoc::OpenJob(path, impatient);
            try {
                UDBSQLiteTransaction attempt(hurried.get());
                _exit(3);
            } catch (const JobError& error) {
                if (!error.IsBusy()) _exit(4);
            }
            hurried.reset();

            auto other = USurveyDoc::OpenJob(path);  // the default busy timeout
            if (write(toFirst[1], &byte, 1) != 1) _exit(2);
            UDBSQLiteTransaction waiting(other.get());  // waits until the first one commits
            // It sees what the first process committed, and writes after it.
            if (other->GetPointId(UPointNumber(L"FIRST")) == 0) _exit(5);
            if (!SavePoint(other.get(), L"SECOND")) _exit(6);
            waiting.Commit();
            result = 0;
        } catch (...) {
            result = 7;
        }
        _exit(result);
    }
    close(toSecond[0]);
    close(toFirst[1]);
    Reopen();
    {
        UDBSQLiteTransaction transaction(job.get());
        ASSERT_TRUE(SavePoint(job.get(), L"FIRST"));
        const char byte = 'w';
        ASSERT_EQ(write(toSecond[1], &byte, 1), 1);
        char answer = 0;
        ASSERT_EQ(read(toFirst[0], &answer, 1), 1) << "the second process failed to open the job";
        usleep(300 * 1000);  // the second process is now waiting on the lock
        transaction.Commit();
    }
    close(toSecond[1]);
    close(toFirst[0]);

    int status = 0;
    ASSERT_EQ(waitpid(second, &status, 0), second);
    ASSERT_TRUE(WIFEXITED(status));
    EXPECT_EQ(WEXITSTATUS(status), 0);
    const long first = job->GetPointId(UPointNumber(L"FIRST"));
    const long later = job->GetPointId(UPointNumber(L"SECOND"));
    ASSERT_NE(later, 0);
    EXPECT_GT(later, first);
}
