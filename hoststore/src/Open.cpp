// Opening and creating store files. Opening checks the file before anything
// is written to it, so a damaged or foreign file is left exactly as it was.
// Creating builds the whole database under a temporary name and links it
// into place, so the final name never shows a half-built store.
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <vector>

#include "StoreImpl.h"

namespace PldCtl {
namespace Store {

namespace {

constexpr std::int64_t kApplicationId = 0x4F525658;  // "ORVX"

UnusableFileError Damaged(const std::string& path) {
    return UnusableFileError(Sql::Describe(path, "is not an SQLite database or is damaged"));
}

std::string SystemError(const std::string& path, const std::string& what) {
    return Sql::Describe(path, what + ": " + std::strerror(errno));
}

// The size of a file, or -1 when it cannot be seen.
off_t FileSize(const std::string& path) {
    struct stat st {};
    return stat(path.c_str(), &st) == 0 ? st.st_size : -1;
}

std::string ParentDirectory(const std::string& path) {
    const auto slash = path.rfind('/');
    if (slash == std::string::npos) return ".";
    return slash == 0 ? "/" : path.substr(0, slash);
}

// A path whose last component is empty, "." or ".." names a directory:
// creating a store there would only make directories and then fail.
void RequireFileName(const std::string& path) {
    const std::string name = path.substr(path.rfind('/') + 1);
    if (name.empty() || name == "." || name == "..") {
        throw StoreError(Sql::Describe(path, "cannot be created: the path names a directory, not a file"));
    }
}

// Like mkdir -p, but private: the store is one user's host.
void MakeParentDirectories(const std::string& path) {
    const std::string parent = ParentDirectory(path);
    for (auto end = parent.find('/', 1);; end = parent.find('/', end + 1)) {
        const std::string prefix = parent.substr(0, end);
        if (mkdir(prefix.c_str(), 0700) != 0 && errno != EEXIST) {
            throw StoreError(SystemError(path, "cannot be created: directory '" + prefix + "'"));
        }
        if (end == std::string::npos) break;
    }
}

// Makes a link just made survive a power loss.
void SyncDirectory(const std::string& directory) {
    int fd = open(directory.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (fd < 0) return;
    fsync(fd);
    close(fd);
}

// The files SQLite keeps beside a database: its write-ahead log, the log's
// shared-memory index and its rollback journal.
constexpr const char* kSideFileSuffixes[] = {"-wal", "-shm", "-journal"};

// Holds an exclusive lock on a directory for one scope, so that processes
// creating stores in it take turns between looking for the store and linking
// a new one into place. A directory that cannot be opened for reading is not
// locked; creating still works, only without that protection.
class DirectoryLock {
public:
    explicit DirectoryLock(const std::string& directory)
        : fd_(open(directory.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC)) {
        if (fd_ >= 0) {
            while (flock(fd_, LOCK_EX) != 0 && errno == EINTR) {
            }
        }
    }
    ~DirectoryLock() {
        if (fd_ >= 0) close(fd_);
    }
    DirectoryLock(const DirectoryLock&) = delete;
    DirectoryLock& operator=(const DirectoryLock&) = delete;

private:
    int fd_;
};

// Removes the side files a store that no longer exists left at path (a
// process died with it open, then the file was removed). SQLite would take
// them for the new file's own and replay the dead store's log into it. A
// process still holding them keeps only unlinked files that nobody shares.
void RemoveStaleSideFiles(const std::string& path) {
    for (const char* suffix : kSideFileSuffixes) {
        const std::string file = path + suffix;
        if (unlink(file.c_str()) != 0 && errno != ENOENT) {
            throw StoreError(SystemError(path, "cannot be created: the stale file '" + file + "' cannot be removed"));
        }
    }
}

// A uniquely named empty file beside the store; it and any SQLite side file
// are removed when it goes out of scope, after linking as after a failure.
class TemporaryFile {
public:
    explicit TemporaryFile(const std::string& path) {
        std::vector<char> name(path.begin(), path.end());
        const std::string pattern = ".tmp-XXXXXX";
        name.insert(name.end(), pattern.begin(), pattern.end());
        name.push_back('\0');
        int fd = mkstemp(name.data());
        if (fd < 0) throw StoreError(SystemError(path, "cannot be created"));
        close(fd);
        name_ = name.data();
    }
    ~TemporaryFile() {
        unlink(name_.c_str());
        for (const char* suffix : kSideFileSuffixes) unlink((name_ + suffix).c_str());
    }
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;

    const std::string& Name() const { return name_; }

private:
    std::string name_;
};

// The table of every collection's objects. One table, not one per
// collection: SQLite parses the whole schema whenever a connection first
// uses it, and a table with two indexes per collection made that the
// largest part of every process's work with the store.
std::string ObjectTableSql() {
    // A field kept in a column by several collections has one column.
    std::vector<std::string> names;
    std::string columns;
    for (const auto& collection : Collections()) {
        for (const char* field : collection.columnFields) {
            const std::string name = ColumnOf(collection, field);
            if (std::find(names.begin(), names.end(), name) != names.end()) continue;
            names.push_back(name);
            columns += ", " + name + " GENERATED ALWAYS AS (json_extract(doc, '$.\"" + field + "\"')) STORED";
        }
    }
    return "CREATE TABLE object(section TEXT NOT NULL, key TEXT NOT NULL, parent TEXT, seq INTEGER NOT NULL, "
           "doc TEXT NOT NULL" +
           columns +
           ", PRIMARY KEY (section, key));"
           "CREATE INDEX object_parent ON object(section, parent, seq);"
           "CREATE INDEX object_seq ON object(section, seq);";
}

std::string SchemaSql() {
    std::string sql = "PRAGMA application_id = " + std::to_string(kApplicationId) + ";";
    sql += "PRAGMA user_version = " + std::to_string(kSchemaVersion) + ";";
    sql += "CREATE TABLE meta(name TEXT PRIMARY KEY, value TEXT NOT NULL);";
    sql += "CREATE TABLE singleton(name TEXT PRIMARY KEY, doc TEXT NOT NULL);";
    sql +=
        "CREATE TABLE fault(id INTEGER PRIMARY KEY AUTOINCREMENT, operation TEXT NOT NULL, key TEXT NOT NULL DEFAULT "
        "'', message TEXT NOT NULL, remaining INTEGER NULL);";
    sql += "CREATE INDEX fault_operation ON fault(operation);";
    return sql + ObjectTableSql();
}

std::string UtcNow() {
    const std::time_t now = std::time(nullptr);
    std::tm utc{};
    gmtime_r(&now, &utc);
    char text[32];
    std::strftime(text, sizeof text, "%Y-%m-%dT%H:%M:%SZ", &utc);
    return text;
}

// Per connection, not stored in the file, and only for a file that passed
// Verify (a refused file's side files go as they came):
// - every commit reaches the disk before Change() returns;
// - the log and shared-memory files stay when the last connection closes,
//   so each process does not create and delete them again;
// - the last connection to close still copies the log into the database
//   (a checkpoint, as SQLite does on close) and then empties the log file.
//   Between processes the log is empty and the database file alone holds
//   the whole store, as Verify's truncation check and a copy of the file
//   expect; the next process also has no log to replay into its shared
//   memory, which the first opener always rebuilds.
void Configure(Sql::Database& db) {
    db.Exec("PRAGMA synchronous = FULL");
    db.KeepLogFiles();
    db.Exec("PRAGMA journal_size_limit = 0");
}

// ORVIX_HOST_SYNC=deferred: a process making many changes in a row (a batch
// read from a file) lets its commits skip the flush to disk and flushes the
// log every kDeferredSyncInterval changes and when it closes the store. A
// process that dies keeps its changes (they are in the system's hands); a
// power loss may take back the changes since the last flush, each one whole,
// and never damages the store: SQLite's write-ahead log stays consistent
// with synchronous=NORMAL. Any other value keeps every commit flushed.
bool DeferredSyncAsked() {
    const char* value = std::getenv("ORVIX_HOST_SYNC");
    return value && std::strcmp(value, "deferred") == 0;
}

// Brings a store of an older schema up to date, in one change; the file
// passed Verify. Schema 1 kept each collection in a table of its own with
// the columns the object table has, less the section. A file without a
// schema version was never a whole store.
void Migrate(Sql::Database& db, std::int64_t version) {
    if (version < 1) throw UnusableFileError(Sql::Describe(db.Path(), "has no schema version; it is damaged"));
    db.Exec("BEGIN IMMEDIATE");
    try {
        // Another process may have upgraded the file meanwhile.
        if (db.Integer("PRAGMA user_version") == 1) {
            std::string sql = ObjectTableSql();
            for (const auto& collection : Collections()) {
                const std::string table = Sql::Quote(collection.section);
                sql += "INSERT INTO object(section, key, parent, seq, doc) SELECT " + Sql::Literal(collection.section) +
                       ", key, parent, seq, doc FROM " + table + "; DROP TABLE " + table + ";";
            }
            db.Exec(sql + "PRAGMA user_version = " + std::to_string(kSchemaVersion));
        }
        db.Exec("COMMIT");
    } catch (...) {
        db.RollbackQuietly();
        throw;
    }
}

// Everything that can be learnt about the file without writing to it;
// returns its schema version. The first read reports a file that is not a
// database as damaged (UnusableFileError); any other failure, such as a log
// that cannot be created or a full disk, as what it is.
std::int64_t Verify(Sql::Database& db, off_t size) {
    const std::string& path = db.Path();
    const std::int64_t applicationId = db.Integer("PRAGMA application_id");
    if (applicationId != kApplicationId) {
        throw UnusableFileError(Sql::Describe(path, "is an SQLite database of another application, not a host store"));
    }
    const std::int64_t version = db.Integer("PRAGMA user_version");
    if (version > kSchemaVersion) {
        throw UnusableFileError(Sql::Describe(path, "was written by a newer version (schema " +
                                                        std::to_string(version) + ", this build reads up to " +
                                                        std::to_string(kSchemaVersion) + ")"));
    }
    // Pages that live only in the write-ahead log make the file legitimately
    // shorter than the database; without one, a short file lost its end.
    if (FileSize(path + "-wal") <= 0) {
        const std::int64_t expected = db.Integer("PRAGMA page_count") * db.Integer("PRAGMA page_size");
        if (size < expected) {
            throw UnusableFileError(Sql::Describe(
                path, "is truncated (" + std::to_string(size) + " bytes of " + std::to_string(expected) + ")"));
        }
    }
    return version;
}

}  // namespace

void HostStore::Impl::SyncLog() {
    const std::string log = db.Path() + "-wal";
    const int fd = open(log.c_str(), O_RDONLY | O_CLOEXEC);
    if (fd < 0) {
        // No log: every change is in the database file, which the last
        // checkpoint flushed.
        if (errno == ENOENT) {
            unsynced = 0;
            return;
        }
        throw StoreError(SystemError(db.Path(), "cannot be used: its log cannot be flushed to disk"));
    }
    const int rc = fdatasync(fd);
    const int error = errno;
    close(fd);
    if (rc != 0) {
        errno = error;
        throw StoreError(SystemError(db.Path(), "cannot be used: its log cannot be flushed to disk"));
    }
    SyncDirectory(ParentDirectory(db.Path()));
    unsynced = 0;
}

bool PathExists(const std::string& path) {
    struct stat st {};
    if (lstat(path.c_str(), &st) == 0) return true;
    // A file that cannot be looked at may well exist: it must not be taken
    // for a missing store and created anew.
    if (errno == ENOENT || errno == ENOTDIR) return false;
    throw StoreError(SystemError(path, "cannot be opened"));
}

std::unique_ptr<HostStore> HostStore::Open(const std::string& path) {
    struct stat st {};
    if (stat(path.c_str(), &st) != 0) {
        throw StoreError(errno == ENOENT ? Sql::Describe(path, "does not exist")
                                         : SystemError(path, "cannot be opened"));
    }
    if (!S_ISREG(st.st_mode)) throw StoreError(Sql::Describe(path, "is not a regular file"));
    // SQLite takes an empty file for a new database and would write one in it.
    if (st.st_size == 0) throw Damaged(path);
    std::unique_ptr<HostStore> store(new HostStore(path));
    const std::int64_t version = Verify(store->impl_->db, st.st_size);
    Configure(store->impl_->db);
    if (DeferredSyncAsked()) {
        store->impl_->db.Exec("PRAGMA synchronous = NORMAL");
        store->impl_->deferredSync = true;
    }
    if (version < kSchemaVersion) Migrate(store->impl_->db, version);
    return store;
}

std::unique_ptr<HostStore> HostStore::Build(const std::string& path, const Json& profile, const std::string& origin,
                                            Existing existing) {
    RequireFileName(path);
    ValidateProfile(profile);
    MakeParentDirectories(path);
    TemporaryFile temporary(path);
    try {
        HostStore building(temporary.Name());
        Sql::Database& db = building.impl_->db;
        Configure(db);
        db.Exec("BEGIN");
        db.Exec(SchemaSql());
        db.Prepare("INSERT INTO meta(name, value) VALUES ('created', ?1), ('profile', ?2)")
            .Bind(1, UtcNow())
            .Bind(2, origin)
            .Run();
        db.Exec("COMMIT");
        building.Load(profile);
        // The journal mode is kept in the file. Closing the connection right
        // after switching leaves an empty log, which SQLite removes, so the
        // file alone holds the whole store when it is linked.
        db.Exec("PRAGMA journal_mode = WAL");
    } catch (const StoreError& e) {
        // The temporary file is the program's business; the user learns
        // which store could not be made, and why.
        std::string cause = e.what();
        for (const std::string& prefix : {Sql::Describe(temporary.Name(), ""), std::string("cannot be used: ")}) {
            if (cause.rfind(prefix, 0) == 0) cause.erase(0, prefix.size());
        }
        throw StoreError(Sql::Describe(path, "cannot be created: " + cause));
    }
    bool placed = false;
    {
        // Side files are stale only while no good store exists at path; the
        // lock keeps another creator from linking its store, and starting
        // its log, between the look and the removal.
        DirectoryLock lock(ParentDirectory(path));
        if (existing == Existing::Replace) {
            // The refused file's side files go first, so that the new file
            // never meets them; the file itself stays as it was until the
            // new one takes its name in one rename.
            RemoveStaleSideFiles(path);
            if (rename(temporary.Name().c_str(), path.c_str()) != 0) {
                throw StoreError(SystemError(path, "cannot be replaced"));
            }
            placed = true;
        } else if (!PathExists(path)) {
            RemoveStaleSideFiles(path);
            placed = link(temporary.Name().c_str(), path.c_str()) == 0;
            if (!placed && errno != EEXIST) throw StoreError(SystemError(path, "cannot be created"));
        }
    }
    if (!placed) {
        // Another process created the store first; its file is complete,
        // since it too was linked only once built.
        if (existing == Existing::Open) return Open(path);
        throw StoreError(Sql::Describe(path, "exists already"));
    }
    SyncDirectory(ParentDirectory(path));
    return Open(path);
}

std::unique_ptr<HostStore> HostStore::Create(const std::string& path, const Json& profile, const std::string& origin) {
    if (PathExists(path)) throw StoreError(Sql::Describe(path, "exists already"));
    return Build(path, profile, origin, Existing::Refuse);
}

std::unique_ptr<HostStore> HostStore::Replace(const std::string& path, const Json& profile, const std::string& origin) {
    return Build(path, profile, origin, Existing::Replace);
}

std::unique_ptr<HostStore> HostStore::OpenOrCreate(const std::string& path, const Json& profile,
                                                   const std::string& origin) {
    return PathExists(path) ? Open(path) : Build(path, profile, origin, Existing::Open);
}

namespace {

// What a profile given as text is called in messages and in the store.
std::string TextOrigin(const std::string& path) {
    return "given for '" + path + "'";
}

}  // namespace

std::unique_ptr<HostStore> HostStore::Create(const std::string& path, const std::string& profileText) {
    const std::string origin = TextOrigin(path);
    return Create(path, ParseProfile(profileText, origin), origin);
}

std::unique_ptr<HostStore> HostStore::OpenOrCreate(const std::string& path, const std::string& profileText) {
    if (PathExists(path)) return Open(path);
    const std::string origin = TextOrigin(path);
    return Build(path, ParseProfile(profileText, origin), origin, Existing::Open);
}

}  // namespace Store
}  // namespace PldCtl
