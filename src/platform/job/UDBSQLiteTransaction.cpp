#include "platform/job/UDBSQLiteTransaction.h"

#include <stdexcept>

#include "platform/job/JobDatabase.h"
#include "platform/job/USurveyDoc.h"

UDBSQLiteTransaction::UDBSQLiteTransaction(USurveyDoc* job)
    : job_(job != nullptr ? &job->Database() : nullptr) {
    if (job_ != nullptr) {
        job_->BeginLevel();
        depth_ = job_->TransactionDepth();
    }
}

UDBSQLiteTransaction::UDBSQLiteTransaction(nedit::JobDatabase& job) : job_(&job) {
    job_->BeginLevel();
    depth_ = job_->TransactionDepth();
}

UDBSQLiteTransaction::~UDBSQLiteTransaction() {
    Rollback();
}

void UDBSQLiteTransaction::Commit() {
    if (!IsActive()) return;
    if (job_->TransactionDepth() != depth_) {
        throw std::logic_error("a transaction was committed while an inner one was still open");
    }
    done_ = true;
    job_->CommitLevel();
}

void UDBSQLiteTransaction::Rollback() noexcept {
    if (!IsActive()) return;
    done_ = true;
    // Inner transactions still open (they can only outlive this one through misuse) are
    // undone with it.
    while (job_->TransactionDepth() >= depth_) job_->RollbackLevel();
}
