// A thin RAII layer over the SQLite C interface, as the host store uses it:
// one connection, prepared statements cached for the connection's lifetime,
// and every failure turned into a StoreError that names the file.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>

#include "hoststore/HostStore.h"

struct sqlite3;
struct sqlite3_stmt;

namespace PldCtl {
namespace Store {
namespace Sql {

// The database stayed locked by another connection longer than the busy
// timeout. The whole transaction may be retried; left unhandled it is an
// ordinary StoreError.
class BusyError : public StoreError {
public:
    using StoreError::StoreError;
};

// "host store '<path>'" followed by what is wrong, the shape of every
// StoreError message.
std::string Describe(const std::string& path, const std::string& problem);

class Database;

// One execution of a cached statement. The statement is reset and its
// parameters cleared when the query ends, so the next user of the cached
// statement starts clean even after an exception.
class Query {
public:
    Query(Database& db, sqlite3_stmt* stmt) : db_(db), stmt_(stmt) {}
    ~Query();
    Query(const Query&) = delete;
    Query& operator=(const Query&) = delete;

    // Parameters are numbered from 1, as in the SQL text (?1, ?2, ...).
    Query& Bind(int index, const std::string& value);
    Query& Bind(int index, std::int64_t value);
    Query& BindNull(int index);
    // An absent value binds NULL.
    Query& Bind(int index, const std::optional<std::string>& value);
    Query& Bind(int index, const std::optional<std::int64_t>& value);

    // Steps once: true when a row is there to read, false when done.
    bool Next();
    // Runs a statement that returns no rows.
    void Run();

    std::string Text(int column) const;
    // The same text without a copy; valid until the next step.
    std::string_view TextView(int column) const;
    std::int64_t Int(int column) const;
    bool IsNull(int column) const;

private:
    Database& db_;
    sqlite3_stmt* stmt_;
};

class Database {
public:
    // Opens an existing file for reading and writing; never creates one.
    explicit Database(const std::string& path);
    ~Database();
    Database(const Database&) = delete;
    Database& operator=(const Database&) = delete;

    const std::string& Path() const { return path_; }
    sqlite3* Handle() const { return db_; }

    // Runs one or more statements that return no rows.
    void Exec(const std::string& sql);
    // The statement for this SQL text, prepared on first use and kept.
    Query Prepare(const std::string& sql);
    // The single integer a query such as "PRAGMA page_count" returns.
    std::int64_t Integer(const std::string& sql);

    // Ends an open transaction, if any, without throwing: used on paths that
    // are already failing.
    void RollbackQuietly() noexcept;
    // Keeps the write-ahead log and shared-memory files when the last
    // connection closes, instead of deleting them.
    void KeepLogFiles();
    std::int64_t Changes() const;
    std::int64_t LastInsertId() const;

    // Throws the exception that matches an SQLite result code.
    [[noreturn]] void Fail(int code) const;

private:
    struct Finalizer {
        void operator()(sqlite3_stmt* stmt) const;
    };
    std::string path_;
    sqlite3* db_ = nullptr;
    std::unordered_map<std::string, std::unique_ptr<sqlite3_stmt, Finalizer>> statements_;
};

// An SQL identifier in double quotes, for table and index names.
std::string Quote(const std::string& identifier);
// A string as an SQL literal, in single quotes.
std::string Literal(const std::string& text);

}  // namespace Sql
}  // namespace Store
}  // namespace PldCtl
