#pragma once
// One job file: an SQLite database holding the survey database and the raw-data storage of
// a job. This class owns the connection and checks, on opening, that the file is a job of a
// schema this program can read; it upgrades an older schema in one transaction.
//
// Decisions:
// - Rollback journal (not WAL), synchronous FULL. A job is one file that surveyors copy,
//   mail and keep on network shares; after every commit the file alone is complete, and no
//   -wal/-shm files must travel with it. A transaction that was under way when the process
//   died is rolled back by the next open, from the journal. Only a connection that may write
//   can do that, so a job opened for reading is first opened for writing when it needs it;
//   where the file cannot be written, the open is refused with a message that says so.
// - Foreign keys on; every change runs in a transaction (see UDBSQLiteTransaction).
// - A busy timeout (10 s by default): a second program that opens a job while another is
//   writing waits for it instead of failing at once.
// - The file is marked as a job by PRAGMA application_id, and its schema version is
//   PRAGMA user_version. A file that is no SQLite database, or one of another program, is
//   "not a job file"; a newer schema is refused with the versions named.

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "platform/job/JobError.h"
#include "platform/job/Statement.h"

struct sqlite3;

namespace nedit {

/// The schema version that this program writes, and the marker of a job file ("SXNJ").
constexpr int kJobSchemaVersion = 2;
constexpr int kJobApplicationId = 0x53584E4A;

enum class JobAccess { ReadWrite, ReadOnly };

struct JobOpenOptions {
    JobAccess access = JobAccess::ReadWrite;
    /// How long a statement waits for another process to release the job, in milliseconds.
    int busyTimeoutMs = 10000;
};

/// One step of the schema's history: the SQL that brings a job from version - 1 to version.
struct SchemaStep {
    int version;
    std::string_view sql;
};

/// The schema's history as this program knows it, oldest first.
const std::vector<SchemaStep>& JobSchemaSteps();

/// A cached statement in use; it is reset when this goes out of scope, so that no read stays
/// open and holds the job's lock.
class StatementUse {
  public:
    explicit StatementUse(Statement& statement) : statement_(&statement) {}
    StatementUse(StatementUse&& other) noexcept : statement_(other.statement_) {
        other.statement_ = nullptr;
    }
    StatementUse& operator=(StatementUse&&) = delete;
    ~StatementUse() {
        if (statement_ != nullptr) statement_->Reset();
    }
    Statement* operator->() const { return statement_; }
    Statement& operator*() const { return *statement_; }

  private:
    Statement* statement_;
};

class JobDatabase {
  public:
    /// Makes a new job at `path` (UTF-8) with the current schema. `fill`, when given, runs in
    /// the same transaction, so a job is either created whole or not at all: on any failure
    /// the file is removed again. Throws JobError when the folder does not exist, a file of
    /// that name exists, or the file cannot be written.
    static JobDatabase Create(const std::string& path,
                              const std::function<void(JobDatabase&)>& fill = {},
                              const JobOpenOptions& options = {});

    /// Opens an existing job. Throws JobError when there is no such file, it is not a job, its
    /// schema is newer than kJobSchemaVersion, it is read-only (or in a read-only folder)
    /// and options.access asks for writing, or a program stopped in the middle of a change
    /// and the file cannot be written to undo it. An older schema is upgraded in one
    /// transaction.
    static JobDatabase Open(const std::string& path, const JobOpenOptions& options = {});

    JobDatabase(JobDatabase&& other) noexcept;
    JobDatabase& operator=(JobDatabase&& other) noexcept;
    ~JobDatabase();

    const std::string& Path() const;
    bool IsReadOnly() const;
    /// The version recorded in the file.
    int SchemaVersion() const;

    /// A prepared statement for `sql`, compiled once per connection and kept.
    StatementUse Query(std::string_view sql);
    /// Runs one or more statements without results (schema scripts, pragmas).
    void Execute(std::string_view sql);
    long long LastInsertId() const;
    /// Rows changed by the last statement.
    int Changes() const;

    /// Transactions nest: the outermost level is BEGIN IMMEDIATE (BEGIN on a read-only job),
    /// inner levels are savepoints. UDBSQLiteTransaction is the way to use these.
    int TransactionDepth() const;
    void BeginLevel();
    /// Throws JobError when the commit fails; the level is then rolled back.
    void CommitLevel();
    void RollbackLevel() noexcept;

    /// Throws JobError("<path> is open read-only ...") when the job cannot be written.
    void RequireWritable() const;

    /// A JobError for the connection's last failure: "<path>: <action>: <SQLite's message>".
    JobError Failure(const std::string& action) const;
    /// Throws when `rc` is not SQLITE_OK, SQLITE_ROW or SQLITE_DONE.
    void Check(int rc, const std::string& action) const;

    sqlite3* Handle() const;

  private:
    struct Impl;
    /// Open without the recovery of a change that a stopped program left.
    static JobDatabase OpenConnection(const std::string& path, const JobOpenOptions& options);
    explicit JobDatabase(std::unique_ptr<Impl> impl);
    std::unique_ptr<Impl> impl_;
};

/// Brings the job from its recorded version to the last version of `steps`, all in one
/// transaction: when a step fails nothing of the upgrade remains and the version stays.
/// Used by Create and Open; separate so that the upgrade path can be tested on its own.
void ApplySchemaSteps(JobDatabase& job, const std::vector<SchemaStep>& steps);

}  // namespace nedit
