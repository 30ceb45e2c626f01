#include "platform/job/Statement.h"

#include <sqlite3.h>

#include <climits>

#include "platform/job/JobError.h"
#include "platform/text/WideText.h"

namespace nedit {
namespace {

constexpr double kNoHeightValue = -10000.0;

[[noreturn]] void Throw(sqlite3* db, const std::string& action) {
    const char* file = sqlite3_db_filename(db, "main");
    std::string message = file != nullptr && *file != '\0' ? std::string(file) + ": " : "";
    message += action + ": " + sqlite3_errmsg(db);
    throw JobError(message, sqlite3_extended_errcode(db));
}

}  // namespace

Statement::Statement(sqlite3* db, std::string_view sql) : db_(db) {
    const int rc = sqlite3_prepare_v3(db, sql.data(), static_cast<int>(sql.size()),
                                      SQLITE_PREPARE_PERSISTENT, &stmt_, nullptr);
    if (rc != SQLITE_OK) Throw(db, "cannot prepare \"" + std::string(sql.substr(0, 60)) + "\"");
}

Statement::~Statement() {
    sqlite3_finalize(stmt_);
}

Statement& Statement::Bind(int index, long long value) {
    if (sqlite3_bind_int64(stmt_, index, value) != SQLITE_OK) Throw(db_, "bind");
    return *this;
}

Statement& Statement::Bind(int index, double value) {
    if (sqlite3_bind_double(stmt_, index, value) != SQLITE_OK) Throw(db_, "bind");
    return *this;
}

Statement& Statement::Bind(int index, std::wstring_view text) {
    return BindUtf8(index, ToUtf8(text));
}

Statement& Statement::BindUtf8(int index, std::string_view text) {
    if (sqlite3_bind_text(stmt_, index, text.data(), static_cast<int>(text.size()),
                          SQLITE_TRANSIENT) != SQLITE_OK) {
        Throw(db_, "bind");
    }
    return *this;
}

Statement& Statement::BindBlob(int index, std::string_view bytes) {
    if (bytes.size() > static_cast<std::size_t>(INT_MAX)) {
        throw JobError("a stream of more than 2 GB cannot be stored in a job");
    }
    if (sqlite3_bind_blob(stmt_, index, bytes.data(), static_cast<int>(bytes.size()),
                          SQLITE_STATIC) != SQLITE_OK) {
        Throw(db_, "bind");
    }
    return *this;
}

Statement& Statement::BindNull(int index) {
    if (sqlite3_bind_null(stmt_, index) != SQLITE_OK) Throw(db_, "bind");
    return *this;
}

Statement& Statement::BindHeight(int index, double height) {
    return height <= kNoHeightValue ? BindNull(index) : Bind(index, height);
}

bool Statement::Step() {
    const int rc = sqlite3_step(stmt_);
    if (rc == SQLITE_ROW) return true;
    if (rc == SQLITE_DONE) return false;
    // The message belongs to the failed step; read it before the reset clears it.
    const std::string sql = sqlite3_sql(stmt_) != nullptr ? sqlite3_sql(stmt_) : "";
    const char* file = sqlite3_db_filename(db_, "main");
    std::string message = file != nullptr && *file != '\0' ? std::string(file) + ": " : "";
    const int code = sqlite3_extended_errcode(db_);
    if ((code & 0xff) == SQLITE_BUSY || (code & 0xff) == SQLITE_LOCKED) {
        message += "the job is in use by another program, which held it longer than this one waits";
    } else {
        message += sqlite3_errmsg(db_);
    }
    sqlite3_reset(stmt_);
    throw JobError(message, code);
}

void Statement::Run() {
    while (Step()) {
    }
}

void Statement::Reset() {
    sqlite3_reset(stmt_);
    sqlite3_clear_bindings(stmt_);
}

long long Statement::Int(int column) const {
    return sqlite3_column_int64(stmt_, column);
}

double Statement::Real(int column) const {
    return sqlite3_column_double(stmt_, column);
}

bool Statement::IsNull(int column) const {
    return sqlite3_column_type(stmt_, column) == SQLITE_NULL;
}

std::wstring Statement::Text(int column) const {
    const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(stmt_, column));
    if (text == nullptr) return {};
    return FromUtf8(
        std::string_view(text, static_cast<std::size_t>(sqlite3_column_bytes(stmt_, column))));
}

std::string Statement::Bytes(int column) const {
    return std::string(BytesView(column));
}

std::string_view Statement::BytesView(int column) const {
    const void* data = sqlite3_column_blob(stmt_, column);
    if (data == nullptr) return {};
    return std::string_view(static_cast<const char*>(data),
                            static_cast<std::size_t>(sqlite3_column_bytes(stmt_, column)));
}

double Statement::Height(int column) const {
    return IsNull(column) ? kNoHeightValue : Real(column);
}

}  // namespace nedit
