#pragma once
// One transaction on the job's database for the life of the object. It rolls back unless
// Commit was called, so an exception or an early return never leaves half a change behind.
// Transactions nest: an inner one is a savepoint inside the outer one, and rolling it back
// undoes only its own changes.
//
// A run that must keep what it saved even when it stops on a failure (the transfer to the
// job keeps the objects saved before the failure) calls Commit on that path as well.

class USurveyDoc;

namespace nedit {
class JobDatabase;
}

class UDBSQLiteTransaction {
  public:
    /// Begins a transaction on the job; with a null job the object does nothing, so callers
    /// that may run without a job need no test of their own. Throws nedit::JobError when the
    /// job stays busy for longer than its busy timeout.
    explicit UDBSQLiteTransaction(USurveyDoc* job);
    explicit UDBSQLiteTransaction(nedit::JobDatabase& job);
    ~UDBSQLiteTransaction();
    UDBSQLiteTransaction(const UDBSQLiteTransaction&) = delete;
    UDBSQLiteTransaction& operator=(const UDBSQLiteTransaction&) = delete;

    /// Makes the changes lasting (an inner transaction hands them to the outer one). Throws
    /// nedit::JobError when the commit fails; everything of this transaction is then undone.
    /// Committing twice, or with no job, does nothing.
    void Commit();
    /// Undoes the changes now rather than at destruction.
    void Rollback() noexcept;
    bool IsActive() const { return job_ != nullptr && !done_; }

  private:
    nedit::JobDatabase* job_ = nullptr;
    int depth_ = 0;  // the nesting level this transaction opened
    bool done_ = false;
};
