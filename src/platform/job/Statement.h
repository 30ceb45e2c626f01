#pragma once
// One prepared SQL statement of a job database, with binding and reading in the system's
// own types: wide text is bound and read as UTF-8, whole numbers as 64-bit integers.

#include <string>
#include <string_view>

struct sqlite3;
struct sqlite3_stmt;

namespace nedit {

class Statement {
  public:
    /// Prepares `sql` on `db`; throws JobError when it does not compile.
    Statement(sqlite3* db, std::string_view sql);
    ~Statement();
    Statement(const Statement&) = delete;
    Statement& operator=(const Statement&) = delete;

    /// Parameters count from 1, as in SQL.
    Statement& Bind(int index, long long value);
    Statement& Bind(int index, int value) { return Bind(index, static_cast<long long>(value)); }
    Statement& Bind(int index, long value) { return Bind(index, static_cast<long long>(value)); }
    Statement& Bind(int index, unsigned value) {
        return Bind(index, static_cast<long long>(value));
    }
    Statement& Bind(int index, double value);
    Statement& Bind(int index, std::wstring_view text);
    Statement& Bind(int index, const wchar_t* text) { return Bind(index, std::wstring_view(text)); }
    Statement& Bind(int index, const std::wstring& text) {
        return Bind(index, std::wstring_view(text));
    }
    Statement& BindUtf8(int index, std::string_view text);
    /// The bytes are not copied (a stream may be large): they must stay as they are until
    /// the statement has run.
    Statement& BindBlob(int index, std::string_view bytes);
    Statement& BindNull(int index);
    /// An identifier of 0 ("none") goes in as NULL, so foreign keys see no reference.
    Statement& BindOptionalId(int index, long long id) {
        return id == 0 ? BindNull(index) : Bind(index, id);
    }
    /// A height of kNoHeight (-10000) goes in as NULL: the database says "no height" plainly.
    Statement& BindHeight(int index, double height);

    /// Runs one step: true when a row is ready to read, false when the statement is done.
    /// Throws JobError on failure, after resetting the statement.
    bool Step();
    /// Runs the statement to its end, ignoring rows.
    void Run();
    /// Makes the statement ready to run again and clears its bindings.
    void Reset();

    long long Int(int column) const;
    double Real(int column) const;
    bool IsNull(int column) const;
    std::wstring Text(int column) const;
    std::string Bytes(int column) const;
    /// The same where SQLite holds them, good until the statement steps on or is reset.
    std::string_view BytesView(int column) const;
    /// NULL reads back as kNoHeight.
    double Height(int column) const;

    sqlite3_stmt* Handle() const { return stmt_; }

  private:
    sqlite3* db_;
    sqlite3_stmt* stmt_ = nullptr;
};

}  // namespace nedit
