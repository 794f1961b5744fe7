#include "Sqlite.h"

#include <sqlite3.h>

#include <cstring>

namespace PldCtl {
namespace Store {
namespace Sql {

namespace {

// Long enough to ride out another process's large change (loading a big
// profile takes well under a second); the transaction retry in HostStore
// covers the rare cases where SQLite reports busy without waiting.
constexpr int kBusyTimeoutMs = 10000;

// SQLite's process-wide settings, made before its first use. SQLite is the
// store's own copy, so nothing else in the process depends on them. The
// store gives each connection to one thread at a time, so SQLite needs no
// mutex per connection, and nobody reads its memory statistics.
void InitialiseSqlite() {
    static const int initialised = [] {
        sqlite3_config(SQLITE_CONFIG_MULTITHREAD);
        sqlite3_config(SQLITE_CONFIG_MEMSTATUS, 0);
        return sqlite3_initialize();
    }();
    if (initialised != SQLITE_OK) {
        throw StoreError("SQLite cannot be initialised: " + std::string(sqlite3_errstr(initialised)));
    }
}

// SQLite's account of a failure, with the system's reason when the failure
// came from the operating system (a permission, a full disk, an I/O error).
std::string Cause(sqlite3* db, int code) {
    std::string cause = db ? sqlite3_errmsg(db) : sqlite3_errstr(code);
    const int systemError = db ? sqlite3_system_errno(db) : 0;
    if (systemError != 0) cause += std::string(": ") + std::strerror(systemError);
    // A store opened read-only because its file, or its directory where the
    // log files would go, is not writable for this user.
    if ((code & 0xff) == SQLITE_READONLY)
        cause += " (the file, its -wal and -shm files or its directory are not writable)";
    return cause;
}

}  // namespace

std::string Describe(const std::string& path, const std::string& problem) {
    return "host store '" + path + "' " + problem;
}

Query::~Query() {
    sqlite3_reset(stmt_);
    sqlite3_clear_bindings(stmt_);
}

Query& Query::Bind(int index, const std::string& value) {
    int rc = sqlite3_bind_text(stmt_, index, value.data(), static_cast<int>(value.size()), SQLITE_TRANSIENT);
    if (rc != SQLITE_OK) db_.Fail(rc);
    return *this;
}

Query& Query::Bind(int index, std::int64_t value) {
    int rc = sqlite3_bind_int64(stmt_, index, value);
    if (rc != SQLITE_OK) db_.Fail(rc);
    return *this;
}

Query& Query::BindNull(int index) {
    int rc = sqlite3_bind_null(stmt_, index);
    if (rc != SQLITE_OK) db_.Fail(rc);
    return *this;
}

Query& Query::Bind(int index, const std::optional<std::string>& value) {
    return value ? Bind(index, *value) : BindNull(index);
}

Query& Query::Bind(int index, const std::optional<std::int64_t>& value) {
    return value ? Bind(index, *value) : BindNull(index);
}

bool Query::Next() {
    int rc = sqlite3_step(stmt_);
    if (rc == SQLITE_ROW) return true;
    if (rc == SQLITE_DONE) return false;
    db_.Fail(rc);
}

void Query::Run() {
    while (Next()) {
    }
}

std::string Query::Text(int column) const {
    const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(stmt_, column));
    return text ? std::string(text, static_cast<std::size_t>(sqlite3_column_bytes(stmt_, column))) : std::string();
}

std::string_view Query::TextView(int column) const {
    const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(stmt_, column));
    return text ? std::string_view(text, static_cast<std::size_t>(sqlite3_column_bytes(stmt_, column)))
                : std::string_view();
}

std::int64_t Query::Int(int column) const {
    return sqlite3_column_int64(stmt_, column);
}

bool Query::IsNull(int column) const {
    return sqlite3_column_type(stmt_, column) == SQLITE_NULL;
}

void Database::Finalizer::operator()(sqlite3_stmt* stmt) const {
    sqlite3_finalize(stmt);
}

Database::Database(const std::string& path) : path_(path) {
    InitialiseSqlite();
    int rc = sqlite3_open_v2(path.c_str(), &db_, SQLITE_OPEN_READWRITE, nullptr);
    if (rc != SQLITE_OK) {
        const std::string message = Cause(db_, rc);
        sqlite3_close(db_);
        db_ = nullptr;
        throw StoreError(Describe(path, "cannot be opened: " + message));
    }
    sqlite3_busy_timeout(db_, kBusyTimeoutMs);
}

Database::~Database() {
    // Statements first: a connection with live statements does not close.
    statements_.clear();
    sqlite3_close(db_);
}

void Database::Exec(const std::string& sql) {
    int rc = sqlite3_exec(db_, sql.c_str(), nullptr, nullptr, nullptr);
    if (rc != SQLITE_OK) Fail(rc);
}

Query Database::Prepare(const std::string& sql) {
    auto found = statements_.find(sql);
    if (found == statements_.end()) {
        sqlite3_stmt* stmt = nullptr;
        int rc = sqlite3_prepare_v3(db_, sql.c_str(), static_cast<int>(sql.size()), SQLITE_PREPARE_PERSISTENT, &stmt,
                                    nullptr);
        if (rc != SQLITE_OK) Fail(rc);
        found = statements_.emplace(sql, std::unique_ptr<sqlite3_stmt, Finalizer>(stmt)).first;
    } else if (sqlite3_stmt_busy(found->second.get())) {
        throw std::logic_error("statement already running: " + sql);
    }
    return Query(*this, found->second.get());
}

std::int64_t Database::Integer(const std::string& sql) {
    Query query = Prepare(sql);
    return query.Next() ? query.Int(0) : 0;
}

void Database::RollbackQuietly() noexcept {
    if (!sqlite3_get_autocommit(db_)) sqlite3_exec(db_, "ROLLBACK", nullptr, nullptr, nullptr);
}

void Database::KeepLogFiles() {
    int keep = 1;
    const int rc = sqlite3_file_control(db_, "main", SQLITE_FCNTL_PERSIST_WAL, &keep);
    if (rc != SQLITE_OK) Fail(rc);
}

std::int64_t Database::Changes() const {
    return sqlite3_changes64(db_);
}

std::int64_t Database::LastInsertId() const {
    return sqlite3_last_insert_rowid(db_);
}

void Database::Fail(int code) const {
    switch (code & 0xff) {
        case SQLITE_BUSY:
        case SQLITE_LOCKED:
            throw BusyError(Describe(path_, "is busy: " + std::string(sqlite3_errmsg(db_))));
        case SQLITE_CORRUPT:
        case SQLITE_NOTADB:
            throw UnusableFileError(Describe(path_, "is not an SQLite database or is damaged"));
        default:
            throw StoreError(Describe(path_, "cannot be used: " + Cause(db_, code)));
    }
}

namespace {

std::string Quoted(const std::string& text, char quote) {
    std::string quoted(1, quote);
    for (char c : text) {
        quoted += c;
        if (c == quote) quoted += c;
    }
    return quoted + quote;
}

}  // namespace

std::string Quote(const std::string& identifier) {
    return Quoted(identifier, '"');
}

std::string Literal(const std::string& text) {
    return Quoted(text, '\'');
}

}  // namespace Sql
}  // namespace Store
}  // namespace PldCtl
