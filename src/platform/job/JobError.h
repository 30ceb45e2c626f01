#pragma once
// The failure of a job file: it cannot be opened, is not a job, is newer than this program,
// is read-only, or the database refused an operation. SQLite's result code is kept so that
// callers and logs can tell a busy job from a full disk.

#include <stdexcept>
#include <string>

namespace nedit {

class JobError : public std::runtime_error {
  public:
    /// `message` is complete and meant for the user; `sqliteCode` is SQLite's extended result
    /// code, or 0 when the failure did not come from SQLite.
    JobError(const std::string& message, int sqliteCode = 0)
        : std::runtime_error(message), sqlite_code_(sqliteCode) {}

    int SqliteCode() const { return sqlite_code_; }
    /// True for a constraint that the schema enforces (unique name, foreign key, check).
    bool IsConstraint() const { return (sqlite_code_ & 0xff) == 19; }
    /// True when another process held the job for longer than the busy timeout.
    bool IsBusy() const { return (sqlite_code_ & 0xff) == 5 || (sqlite_code_ & 0xff) == 6; }

  private:
    int sqlite_code_;
};

}  // namespace nedit
