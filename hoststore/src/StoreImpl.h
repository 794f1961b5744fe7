// What the store's source files share and nobody else sees.
#pragma once

#include <functional>
#include <optional>
#include <string>

#include "Sqlite.h"
#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Store {

struct HostStore::Impl {
    // What the connection is doing; Change() and Read() refuse to start while
    // another one runs, and Transaction refuses writes outside Change().
    enum class Mode { Idle, Reading, Writing };

    explicit Impl(const std::string& path) : db(path) {}

    // Runs body inside one transaction (BEGIN IMMEDIATE when writing, so the
    // write lock is taken up front and a change never fails half-way on a
    // lock). A busy store rolls back and the whole body runs again, with a
    // growing, jittered pause, until a deadline. Any other exception rolls
    // back and propagates.
    void Run(Mode transactionMode, const std::function<void()>& body);
    // Throws std::logic_error while a Change() or Read() runs.
    void RequireIdle() const;
    // The connection, for a write; only Change() may write.
    Sql::Database& Writable();
    // Flushes the write-ahead log, and the directory holding it, to disk:
    // every change committed so far then survives a power loss. Throws
    // StoreError naming the store when the system refuses.
    void SyncLog();

    Sql::Database db;
    Mode mode = Mode::Idle;
    // Commits skip their own flush (ORVIX_HOST_SYNC=deferred); SyncLog runs
    // every kDeferredSyncInterval changes and when the store is closed.
    bool deferredSync = false;
    // Changes committed since the log was last flushed, in that mode.
    int unsynced = 0;
    // Set once the fault table was found empty; see CheckFault.
    bool noFaults = false;
};

// How many changes may wait for their flush to disk when syncing is
// deferred: at most this many changes a power loss can take back.
constexpr int kDeferredSyncInterval = 100;

// The text of a key or parent field: a string as it is, an integer in
// decimal. nullopt when the field is absent or null; ProfileError for any
// other type.
std::optional<std::string> FieldText(const Json& object, const char* field);

bool IsSingleton(const std::string& name);

// A stored object; a document that is not JSON means a damaged store.
Json ParseDoc(const Sql::Database& db, const std::string& text);

// SQL text about one collection: every "%S" becomes its section as an SQL
// literal (for "... FROM object WHERE section = %S ..."), and every "%T" the
// collection's rows, usable wherever a table is read (FROM, JOIN).
std::string TableSql(const std::string& section, const char* format);

}  // namespace Store
}  // namespace PldCtl
