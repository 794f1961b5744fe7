// The simulated host's state: one SQLite database per host.
//
// The host is a set of collections of JSON objects (NICs, switches, port
// groups, ...) plus a few singleton objects ("system", "firewall"). Each
// object is a row (section, key, parent, seq, doc) of one table: section
// names its collection, the object's key is made from its key fields, its
// parent from its parent field, seq keeps the library's order within the
// collection, and doc is the object itself as JSON. A host profile is the
// same data as one JSON document (docs/host-profile.md); dump and load turn
// one into the other.
//
// Only the host-control library, the host simulator tool and the store's own
// tests use this header; the library exports none of it.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include <nlohmann/json.hpp>

// Hidden wherever it is compiled, also in the library's own sources: no
// shared object exports the store's code, nor code made from its types.
#pragma GCC visibility push(hidden)

namespace PldCtl {
namespace Store {

using Json = nlohmann::json;

// The store cannot be used at all: it cannot be created or opened, or the
// file is damaged, truncated or not a host store: the host itself is
// unusable, which the library passes on as it is rather than as a failure of
// one operation. The message names the file.
class StoreError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The file was read and found not to be a usable host store: it is not an
// SQLite database, is damaged or truncated, belongs to another application
// or was written by a newer version. Only such a file may be replaced by a
// forced init; a store that merely cannot be read now (permissions, a full
// disk, an I/O error, a lock) is a plain StoreError.
class UnusableFileError : public StoreError {
public:
    using StoreError::StoreError;
};

// An injected fault fired (see HostStore::CheckFault). what() is the
// fault's message, which the library reports as the operation's own failure.
class InjectedFault : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// A profile that cannot be used: bad JSON, unknown section, missing or
// duplicate key, dangling reference. The message says where.
class ProfileError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// A collection of objects: its profile section (also its table's name), the
// fields that make an object's key (joined with "|"; no fields means the key
// is the object's position), and the field naming its owner.
struct CollectionInfo {
    const char* section;
    std::vector<const char*> keyFields;
    const char* parentField;    // nullptr: no owner
    const char* parentSection;  // where the owner must exist; nullptr: not checked
    // Fields the table also keeps in columns of their own, computed when an
    // object is written, so that counting and summing over them parses no
    // JSON (CountChildren, SumField).
    std::vector<const char*> columnFields = {};
};

const std::vector<CollectionInfo>& Collections();
// The quoted SQL column holding a column field, or "" for any other field.
std::string ColumnOf(const CollectionInfo& collection, const std::string& field);
// Throws std::invalid_argument for an unknown section.
const CollectionInfo& Collection(const std::string& section);
// The singleton sections, each one JSON object.
const std::vector<std::string>& Singletons();

constexpr const char* kProfileFormat = "orvix-host-profile";
constexpr int kProfileVersion = 1;
// The schema version of the database file (PRAGMA user_version).
constexpr int kSchemaVersion = 2;

// The embedded default host.
const std::string& DefaultProfileText();
// Parses and checks a profile; throws ProfileError.
Json ParseProfile(const std::string& text, const std::string& origin);
void ValidateProfile(const Json& profile);
// The key an object has in its collection; throws ProfileError when a key
// field is missing or not a string or integer.
std::string KeyOf(const CollectionInfo& collection, const Json& object);
// The text of a profile file (a regular file of bounded size); throws
// ProfileError naming the file when it cannot be read.
std::string ReadProfileFile(const std::string& file);
// A profile as text, indented by two blanks, with its sections in a reader's
// order: format, version, the singletons, then the collections (each in the
// order of Singletons() and Collections()).
std::string FormatProfile(const Json& profile);

// An injected fault: an operation named "Class::Operation" fails with this
// message; with a key, only for that object.
// remaining: how many more times it fires; nullopt means every time.
struct Fault {
    std::int64_t id = 0;
    std::string operation;
    std::string key;
    std::string message;
    std::optional<std::int64_t> remaining;
};

// Throws std::invalid_argument when a fault cannot be armed: its operation
// is not "Class::Operation", or its count is below 1. AddFault checks the
// same; a tool calls this first to refuse bad arguments before it opens, and
// perhaps creates, a store.
void CheckFaultArguments(const Fault& fault);

// Whether anything, even a dangling link, has this name: creating a store
// never replaces what is there. Throws StoreError when that cannot be
// known (no right to search a directory on the way).
bool PathExists(const std::string& path);

class HostStore;

// A test on one top-level field of stored objects, for counting them without
// reading them: the field's value equals `equals` (a string, or an integer
// given in decimal), or, without `equals`, the field is present and not "",
// 0, false or null.
struct FieldTest {
    std::string field;
    std::optional<std::string> equals;
};

// Reads and writes inside one transaction (see HostStore::Change and Read).
class Transaction {
public:
    std::optional<Json> Get(const std::string& section, const std::string& key);
    bool Exists(const std::string& section, const std::string& key);
    std::vector<Json> List(const std::string& section);
    std::vector<Json> ListChildren(const std::string& section, const std::string& parent);
    std::int64_t Count(const std::string& section);
    std::int64_t CountChildren(const std::string& section, const std::string& parent);
    // The children of `parent` that pass every test.
    std::int64_t CountChildren(const std::string& section, const std::string& parent,
                               const std::vector<FieldTest>& tests);
    // The sum of an integer field over the collection, `fallback` standing
    // in where an object lacks it.
    std::int64_t SumField(const std::string& section, const std::string& field, std::int64_t fallback);
    // The largest key of a collection keyed by one integer field (0 when empty).
    std::int64_t MaxIntegerKey(const std::string& section);
    // The objects that pass every test, counted per parent (or per value of
    // `field`), in one pass over the collection; groups with none are absent.
    std::map<std::string, std::int64_t> CountByParent(const std::string& section, const std::vector<FieldTest>& tests);
    std::map<std::string, std::int64_t> CountByField(const std::string& section, const std::string& field,
                                                     const std::vector<FieldTest>& tests);
    // Every object of a collection with a parent section, ordered by its
    // parent's place there, then by its own: all port groups, switch by switch.
    std::vector<Json> ListByParentOrder(const std::string& section);

    // Writes an object; its key and parent come from its own fields. A new
    // object goes to the end of its collection, an existing one keeps its place.
    void Put(const std::string& section, const Json& object);
    // Returns false when there was no such object.
    bool Remove(const std::string& section, const std::string& key);
    std::int64_t RemoveChildren(const std::string& section, const std::string& parent);

    // {} when the singleton was never written.
    Json GetSingleton(const std::string& name);
    void PutSingleton(const std::string& name, const Json& object);

    // ---- Stored text -------------------------------------------------------
    // The same reads, handing out each object's JSON text as stored instead of
    // a parsed object, for callers that decode only the fields they need.
    std::optional<std::string> GetText(const std::string& section, const std::string& key);
    std::vector<std::string> ListText(const std::string& section);
    std::vector<std::string> ListChildrenText(const std::string& section, const std::string& parent);
    // The same objects handed to `visit` one at a time, in their order, each
    // text valid only during its call: a listing of thousands decodes them
    // without holding or copying them all.
    void EachChildText(const std::string& section, const std::string& parent,
                       const std::function<void(std::string_view)>& visit);
    std::vector<std::string> ListByParentOrderText(const std::string& section);
    // "{}" when the singleton was never written.
    std::string GetSingletonText(const std::string& name);
    // The keys of a collection's objects, in its order.
    std::vector<std::string> ListKeys(const std::string& section);
    // The objects of a collection counted per parent (`byField` empty) or per
    // value of a field, in one pass over the rows as they are stored, with no
    // sorting: for each group, all its objects and those of them that pass
    // every test. Objects with no parent or no value are not counted.
    struct GroupCount {
        std::int64_t all = 0;
        std::int64_t passing = 0;
    };
    std::unordered_map<std::string, GroupCount> CountGroups(const std::string& section, const std::string& byField,
                                                            const std::vector<FieldTest>& tests);
    // ---- end of stored text ------------------------------------------------

private:
    friend class HostStore;
    explicit Transaction(HostStore& store) : store_(store) {}
    // The WHERE conditions of `tests` (after "WHERE parent = ?1" when
    // `afterParent`), with the values they bind in order.
    std::string Conditions(const CollectionInfo& collection, const std::vector<FieldTest>& tests, bool afterParent,
                           std::vector<std::string>& bindings);
    std::map<std::string, std::int64_t> CountBy(const std::string& section, const std::string& groupBy,
                                                const std::vector<FieldTest>& tests);
    HostStore& store_;
};

class HostStore {
public:
    // $ORVIX_HOST_DB, else ${XDG_STATE_HOME:-$HOME/.local/state}/orvix/host.db.
    static std::string ResolvePath();
    // The profile a missing store is created from: the file named by
    // $ORVIX_HOST_PROFILE, else the embedded default. Throws StoreError
    // when that file cannot be read.
    static std::string ResolveProfileText();
    // Where ResolveProfileText() takes the profile from, for messages and the
    // store's record of its origin: the file name, or "(embedded default)".
    static std::string ResolveProfileOrigin();

    // The process-wide store at ResolvePath(), opened on first use and created
    // from ResolveProfileText() when the file does not exist. Throws StoreError.
    static HostStore& Default();
    // Forgets the process-wide store, so that the next Default() opens the
    // path the environment names then (for tests).
    static void ResetDefault();

    // Opens an existing store. Throws StoreError when the file is missing,
    // damaged, truncated, foreign or of a newer schema; the file is left
    // exactly as it was.
    static std::unique_ptr<HostStore> Open(const std::string& path);
    // Opens the store, first creating it from the profile when the file does
    // not exist. Several processes may race to create it: one wins, all open
    // the same file. Throws ProfileError for a bad profile, StoreError else.
    static std::unique_ptr<HostStore> OpenOrCreate(const std::string& path, const std::string& profileText);
    // Creates a new store from a profile; throws StoreError when the file
    // exists already.
    static std::unique_ptr<HostStore> Create(const std::string& path, const std::string& profileText);
    // The same two from a profile that ParseProfile already read; origin says
    // where it came from and is kept in the store (meta table).
    static std::unique_ptr<HostStore> OpenOrCreate(const std::string& path, const Json& profile,
                                                   const std::string& origin);
    static std::unique_ptr<HostStore> Create(const std::string& path, const Json& profile, const std::string& origin);
    // Puts a new store from the profile in place of the file at path (one
    // that Open refused with UnusableFileError), removing that file's side
    // files: the new store is built completely beside it and renamed over it
    // in one step. When building fails, the file at path is left untouched.
    static std::unique_ptr<HostStore> Replace(const std::string& path, const Json& profile, const std::string& origin);

    ~HostStore();
    HostStore(const HostStore&) = delete;
    HostStore& operator=(const HostStore&) = delete;

    const std::string& Path() const { return path_; }

    // Single reads, each consistent on its own.
    std::optional<Json> Get(const std::string& section, const std::string& key);
    std::vector<Json> List(const std::string& section);
    std::vector<Json> ListChildren(const std::string& section, const std::string& parent);
    Json GetSingleton(const std::string& name);
    std::int64_t CountChildren(const std::string& section, const std::string& parent,
                               const std::vector<FieldTest>& tests = {});

    // ---- Stored text -------------------------------------------------------
    // Single reads of objects' JSON text as stored (see Transaction).
    std::optional<std::string> GetText(const std::string& section, const std::string& key);
    std::vector<std::string> ListText(const std::string& section);
    std::vector<std::string> ListChildrenText(const std::string& section, const std::string& parent);
    std::string GetSingletonText(const std::string& name);
    // The error a caller throws when text it read from this store does not
    // decode as a JSON object: the store is damaged.
    StoreError DamagedObjectError() const;
    // ---- end of stored text ------------------------------------------------

    // Several reads that see one state of the host.
    void Read(const std::function<void(Transaction&)>& fn);
    // One change: fn runs inside one write transaction. A busy store is
    // waited for and the transaction retried, so concurrent changes are
    // serialised and none is lost. An exception from fn rolls everything back
    // and propagates.
    void Change(const std::function<void(Transaction&)>& fn);

    // The whole host as a profile, and its replacement by one (one change).
    Json Dump();
    void Load(const Json& profile);

    // Throws InjectedFault with the message of the first fault that matches
    // the operation and key (a fault without key matches every key), using
    // up one firing of a counted fault. A store without faults when first
    // asked is taken to stay without (unless this process adds one), so the
    // check costs nothing on a host nobody tests; a fault armed by another
    // process meanwhile is seen by processes started later.
    void CheckFault(std::string_view operation, std::string_view key = std::string_view());
    std::vector<Fault> ListFaults();
    std::int64_t AddFault(const Fault& fault);
    void ClearFaults();

private:
    friend class Transaction;
    struct Impl;
    explicit HostStore(const std::string& path);
    // What Build does when a file is at path once the new store is built.
    enum class Existing { Open, Refuse, Replace };
    // Builds a complete store in a temporary file beside path and links it
    // to path, or renames it over the file there (Existing::Replace). When a
    // store appeared at path meanwhile, opens that one (Existing::Open) or
    // throws StoreError (Existing::Refuse).
    static std::unique_ptr<HostStore> Build(const std::string& path, const Json& profile, const std::string& origin,
                                            Existing existing);
    std::string path_;
    std::unique_ptr<Impl> impl_;
};

}  // namespace Store
}  // namespace PldCtl

#pragma GCC visibility pop
