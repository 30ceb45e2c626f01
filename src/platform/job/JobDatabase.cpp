#include "platform/job/JobDatabase.h"

#include <sqlite3.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <unordered_map>
#include <utility>

#include "platform/job/JobSchema.h"

namespace nedit {

struct JobDatabase::Impl {
    sqlite3* db = nullptr;
    std::string path;
    bool read_only = false;
    int depth = 0;
    std::unordered_map<std::string, std::unique_ptr<Statement>> cache;

    ~Impl() {
        cache.clear();  // statements first: a connection with live statements will not close
        if (db != nullptr) sqlite3_close_v2(db);
    }
};

namespace {

std::string FolderOf(const std::string& path) {
    const auto slash = path.find_last_of('/');
    if (slash == std::string::npos) return ".";
    return slash == 0 ? "/" : path.substr(0, slash);
}

bool IsFolder(const std::string& path) {
    struct stat info {};
    return stat(path.c_str(), &info) == 0 && S_ISDIR(info.st_mode);
}

// A file without any write permission bit counts as read-only even for root, who could
// write it: the user marked it so on purpose.
bool IsReadOnlyFile(const std::string& path, const struct stat& info) {
    return (info.st_mode & (S_IWUSR | S_IWGRP | S_IWOTH)) == 0 || access(path.c_str(), W_OK) != 0;
}

void Configure(JobDatabase& job, int busyTimeoutMs) {
    job.Check(sqlite3_busy_timeout(job.Handle(), busyTimeoutMs), "cannot set the busy timeout");
    job.Check(sqlite3_extended_result_codes(job.Handle(), 1), "cannot configure");
    job.Execute("PRAGMA foreign_keys = ON; PRAGMA trusted_schema = OFF;");
}

int ReadPragma(JobDatabase& job, const char* pragma) {
    auto query = job.Query(pragma);
    return query->Step() ? static_cast<int>(query->Int(0)) : 0;
}

}  // namespace

const std::vector<SchemaStep>& JobSchemaSteps() {
    static const std::vector<SchemaStep> steps = {{1, kJobSchemaV1}, {2, kJobSchemaV2}};
    return steps;
}

JobDatabase::JobDatabase(std::unique_ptr<Impl> impl) : impl_(std::move(impl)) {}
JobDatabase::JobDatabase(JobDatabase&& other) noexcept = default;
JobDatabase& JobDatabase::operator=(JobDatabase&& other) noexcept = default;
JobDatabase::~JobDatabase() = default;

JobDatabase JobDatabase::Create(const std::string& path,
                                const std::function<void(JobDatabase&)>& fill,
                                const JobOpenOptions& options) {
    if (path.empty()) throw JobError("No job file was named.");
    const std::string folder = FolderOf(path);
    if (!IsFolder(folder)) {
        throw JobError("Cannot create the job " + path + ": the folder " + folder +
                       " does not exist.");
    }
    struct stat info {};
    if (stat(path.c_str(), &info) == 0) {
        throw JobError("Cannot create the job " + path + ": a file of that name exists.");
    }

    auto impl = std::make_unique<Impl>();
    impl->path = path;
    const int rc = sqlite3_open_v2(path.c_str(), &impl->db,
                                   SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE, nullptr);
    JobDatabase job(std::move(impl));
    try {
        job.Check(rc, "cannot create the job");
        Configure(job, options.busyTimeoutMs);
        job.BeginLevel();
        try {
            ApplySchemaSteps(job, JobSchemaSteps());
            if (fill) fill(job);
            job.CommitLevel();
        } catch (...) {
            job.RollbackLevel();
            throw;
        }
    } catch (...) {
        job.impl_.reset();
        std::remove(path.c_str());
        std::remove((path + "-journal").c_str());
        throw;
    }
    return job;
}

JobDatabase JobDatabase::Open(const std::string& path, const JobOpenOptions& options) {
    try {
        return OpenConnection(path, options);
    } catch (const JobError& error) {
        if (error.SqliteCode() != SQLITE_READONLY_ROLLBACK) throw;
        struct stat info {};
        if (stat(path.c_str(), &info) != 0 || IsReadOnlyFile(path, info) ||
            access(FolderOf(path).c_str(), W_OK) != 0) {
            throw JobError("The job " + path +
                               " was left in the middle of a change by a program that stopped. "
                               "It needs recovery, which a program that may write the job does "
                               "when it opens it: make the file writable and open it again.",
                           error.SqliteCode());
        }
    }
    // A connection that may write puts the old pages back from the journal as it opens.
    JobOpenOptions writing = options;
    writing.access = JobAccess::ReadWrite;
    OpenConnection(path, writing);
    return OpenConnection(path, options);
}

JobDatabase JobDatabase::OpenConnection(const std::string& path, const JobOpenOptions& options) {
    if (path.empty()) throw JobError("No job file was named.");
    struct stat info {};
    if (stat(path.c_str(), &info) != 0) {
        const std::string folder = FolderOf(path);
        if (!IsFolder(folder)) {
            throw JobError("Cannot open the job " + path + ": the folder " + folder +
                           " does not exist.");
        }
        throw JobError("Cannot open the job " + path + ": there is no such file.");
    }
    if (S_ISDIR(info.st_mode)) throw JobError(path + " is a folder, not a job file.");
    const bool writing = options.access == JobAccess::ReadWrite;
    if (writing && IsReadOnlyFile(path, info)) {
        throw JobError("The job " + path + " is read-only: it can be opened for reading only.");
    }
    if (writing && access(FolderOf(path).c_str(), W_OK) != 0) {
        throw JobError("The job " + path + " lies in a read-only folder (" + FolderOf(path) +
                       "): it can be opened for reading only.");
    }

    auto impl = std::make_unique<Impl>();
    impl->path = path;
    impl->read_only = !writing;
    const int rc = sqlite3_open_v2(path.c_str(), &impl->db,
                                   writing ? SQLITE_OPEN_READWRITE : SQLITE_OPEN_READONLY, nullptr);
    JobDatabase job(std::move(impl));
    job.Check(rc, "cannot open the job");

    int applicationId = 0;
    int version = 0;
    try {
        Configure(job, options.busyTimeoutMs);
        applicationId = ReadPragma(job, "PRAGMA application_id");
        version = ReadPragma(job, "PRAGMA user_version");
    } catch (const JobError& error) {
        if ((error.SqliteCode() & 0xff) == SQLITE_NOTADB) {
            throw JobError(path + " is not a job file.", error.SqliteCode());
        }
        throw;
    }
    if (applicationId != kJobApplicationId || version < 1) {
        throw JobError(path + " is not a job file.");
    }
    if (version > kJobSchemaVersion) {
        throw JobError("The job " + path + " was saved by a newer version of SXNedit (job schema " +
                       std::to_string(version) + "); this version reads schemas up to " +
                       std::to_string(kJobSchemaVersion) + ".");
    }
    if (version < kJobSchemaVersion) {
        if (!writing) {
            throw JobError("The job " + path + " has the older job schema " +
                           std::to_string(version) +
                           " and must be upgraded, which cannot be done read-only.");
        }
        ApplySchemaSteps(job, JobSchemaSteps());
    }
    return job;
}

void ApplySchemaSteps(JobDatabase& job, const std::vector<SchemaStep>& steps) {
    const int from = job.SchemaVersion();
    int to = from;
    for (const SchemaStep& step : steps) to = std::max(to, step.version);
    if (to == from) return;
    job.BeginLevel();
    try {
        for (const SchemaStep& step : steps) {
            if (step.version <= from) continue;
            job.Execute(step.sql);
            job.Execute("PRAGMA user_version = " + std::to_string(step.version));
        }
        job.Execute("PRAGMA application_id = " + std::to_string(kJobApplicationId));
        job.CommitLevel();
    } catch (...) {
        job.RollbackLevel();
        throw;
    }
}

const std::string& JobDatabase::Path() const {
    return impl_->path;
}
bool JobDatabase::IsReadOnly() const {
    return impl_->read_only;
}

int JobDatabase::SchemaVersion() const {
    return ReadPragma(const_cast<JobDatabase&>(*this), "PRAGMA user_version");
}

StatementUse JobDatabase::Query(std::string_view sql) {
    std::string key(sql);
    auto found = impl_->cache.find(key);
    if (found == impl_->cache.end()) {
        auto statement = std::make_unique<Statement>(impl_->db, sql);
        found = impl_->cache.emplace(std::move(key), std::move(statement)).first;
    }
    return StatementUse(*found->second);
}

void JobDatabase::Execute(std::string_view sql) {
    const std::string text(sql);
    char* message = nullptr;
    const int rc = sqlite3_exec(impl_->db, text.c_str(), nullptr, nullptr, &message);
    if (rc != SQLITE_OK) {
        const std::string detail = message != nullptr ? message : sqlite3_errstr(rc);
        sqlite3_free(message);
        throw JobError(impl_->path + ": " + detail, sqlite3_extended_errcode(impl_->db));
    }
}

long long JobDatabase::LastInsertId() const {
    return sqlite3_last_insert_rowid(impl_->db);
}
int JobDatabase::Changes() const {
    return sqlite3_changes(impl_->db);
}
int JobDatabase::TransactionDepth() const {
    return impl_->depth;
}

void JobDatabase::BeginLevel() {
    if (impl_->depth == 0) {
        Query(impl_->read_only ? "BEGIN" : "BEGIN IMMEDIATE")->Run();
    } else {
        Query("SAVEPOINT level_" + std::to_string(impl_->depth))->Run();
    }
    ++impl_->depth;
}

void JobDatabase::CommitLevel() {
    if (impl_->depth == 0) return;
    const int level = impl_->depth - 1;
    try {
        if (level == 0) {
            Query("COMMIT")->Run();
        } else {
            Query("RELEASE level_" + std::to_string(level))->Run();
        }
    } catch (...) {
        RollbackLevel();
        throw;
    }
    --impl_->depth;
}

void JobDatabase::RollbackLevel() noexcept {
    if (impl_->depth == 0) return;
    const int level = --impl_->depth;
    // SQLite may have ended the transaction itself (a full disk, an I/O error); then there is
    // nothing left to roll back.
    if (sqlite3_get_autocommit(impl_->db) != 0) return;
    const std::string sql = level == 0 ? std::string("ROLLBACK")
                                       : "ROLLBACK TO level_" + std::to_string(level) +
                                             "; RELEASE level_" + std::to_string(level);
    sqlite3_exec(impl_->db, sql.c_str(), nullptr, nullptr, nullptr);
}

void JobDatabase::RequireWritable() const {
    if (impl_->read_only) {
        throw JobError("The job " + impl_->path + " is open read-only and cannot be changed.",
                       SQLITE_READONLY);
    }
}

JobError JobDatabase::Failure(const std::string& action) const {
    return JobError(impl_->path + ": " + action + ": " + sqlite3_errmsg(impl_->db),
                    sqlite3_extended_errcode(impl_->db));
}

void JobDatabase::Check(int rc, const std::string& action) const {
    if (rc == SQLITE_OK || rc == SQLITE_ROW || rc == SQLITE_DONE) return;
    if (impl_->db == nullptr)
        throw JobError(impl_->path + ": " + action + ": " + sqlite3_errstr(rc), rc);
    throw Failure(action);
}

sqlite3* JobDatabase::Handle() const {
    return impl_->db;
}

}  // namespace nedit
