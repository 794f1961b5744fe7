// Reads and writes of single objects. Every query is a cached statement on
// an index: by key (the primary key), by parent (parent, seq) or in order
// (seq), so a host with thousands of objects costs no more per call than a
// small one, and only the objects asked for are parsed.
#include "StoreImpl.h"

namespace PldCtl {
namespace Store {

namespace {

// The statement for a collection's table; an unknown section is a caller's
// mistake and throws std::invalid_argument.
Sql::Query Statement(Sql::Database& db, const std::string& section, const char* format) {
    Collection(section);
    return db.Prepare(TableSql(section, format));
}

std::vector<Json> Documents(Sql::Database& db, Sql::Query& query) {
    std::vector<Json> documents;
    while (query.Next()) documents.push_back(ParseDoc(db, query.Text(0)));
    return documents;
}

void RequireSingleton(const std::string& name) {
    if (!IsSingleton(name)) throw std::invalid_argument("unknown host singleton '" + name + "'");
}

}  // namespace

std::optional<Json> Transaction::Get(const std::string& section, const std::string& key) {
    auto& db = store_.impl_->db;
    auto query = Statement(db, section, "SELECT doc FROM %T WHERE key = ?1");
    query.Bind(1, key);
    if (!query.Next()) return std::nullopt;
    return ParseDoc(db, query.Text(0));
}

bool Transaction::Exists(const std::string& section, const std::string& key) {
    auto query = Statement(store_.impl_->db, section, "SELECT 1 FROM %T WHERE key = ?1");
    return query.Bind(1, key).Next();
}

std::vector<Json> Transaction::List(const std::string& section) {
    auto& db = store_.impl_->db;
    auto query = Statement(db, section, "SELECT doc FROM %T ORDER BY seq");
    return Documents(db, query);
}

std::vector<Json> Transaction::ListChildren(const std::string& section, const std::string& parent) {
    auto& db = store_.impl_->db;
    auto query = Statement(db, section, "SELECT doc FROM %T WHERE parent = ?1 ORDER BY seq");
    query.Bind(1, parent);
    return Documents(db, query);
}

std::int64_t Transaction::Count(const std::string& section) {
    auto query = Statement(store_.impl_->db, section, "SELECT count(*) FROM %T");
    query.Next();
    return query.Int(0);
}

std::int64_t Transaction::CountChildren(const std::string& section, const std::string& parent) {
    auto query = Statement(store_.impl_->db, section, "SELECT count(*) FROM %T WHERE parent = ?1");
    query.Bind(1, parent).Next();
    return query.Int(0);
}

std::int64_t Transaction::CountChildren(const std::string& section, const std::string& parent,
                                       const std::vector<FieldTest>& tests) {
    std::string sql = "SELECT count(*) FROM %T WHERE parent = ?1";
    int next = 2;
    for (const auto& test : tests) {
        const std::string path = "?" + std::to_string(next++);
        if (test.equals) {
            // Compared as text, so an integer field matches its decimal form.
            sql += " AND CAST(json_extract(doc, " + path + ") AS TEXT) = ?" + std::to_string(next++);
        } else {
            sql += " AND coalesce(json_extract(doc, " + path + "), '') NOT IN ('', 0)";
        }
    }
    auto query = Statement(store_.impl_->db, section, sql.c_str());
    query.Bind(1, parent);
    next = 2;
    for (const auto& test : tests) {
        query.Bind(next++, "$.\"" + test.field + "\"");
        if (test.equals) query.Bind(next++, *test.equals);
    }
    query.Next();
    return query.Int(0);
}

std::int64_t Transaction::SumField(const std::string& section, const std::string& field, std::int64_t fallback) {
    auto query = Statement(store_.impl_->db, section, "SELECT coalesce(sum(coalesce(json_extract(doc, ?1), ?2)), 0) FROM %T");
    query.Bind(1, "$.\"" + field + "\"").Bind(2, fallback).Next();
    return query.Int(0);
}

std::int64_t Transaction::MaxIntegerKey(const std::string& section) {
    auto query = Statement(store_.impl_->db, section, "SELECT coalesce(max(CAST(key AS INTEGER)), 0) FROM %T");
    query.Next();
    return query.Int(0);
}

void Transaction::Put(const std::string& section, const Json& object) {
    const CollectionInfo& collection = Collection(section);
    if (!object.is_object()) throw std::invalid_argument(section + ": an object must be a JSON object");
    auto& db = store_.impl_->Writable();
    const auto parent = collection.parentField ? FieldText(object, collection.parentField) : std::nullopt;
    // A positional object is always a new one at the end; its key is the
    // place it gets, which the insert below computes the same way.
    const std::string key =
        collection.keyFields.empty()
            ? "#" + std::to_string(db.Integer(TableSql(section, "SELECT coalesce(max(seq), 0) + 1 FROM %T")))
            : KeyOf(collection, object);
    auto query = db.Prepare(TableSql(section,
                                     "INSERT INTO %T(key, parent, seq, doc) "
                                     "VALUES (?1, ?2, (SELECT coalesce(max(seq), 0) + 1 FROM %T), ?3) "
                                     "ON CONFLICT(key) DO UPDATE SET parent = excluded.parent, doc = excluded.doc"));
    query.Bind(1, key).Bind(2, parent).Bind(3, object.dump()).Run();
}

bool Transaction::Remove(const std::string& section, const std::string& key) {
    auto& db = store_.impl_->Writable();
    Statement(db, section, "DELETE FROM %T WHERE key = ?1").Bind(1, key).Run();
    return db.Changes() > 0;
}

std::int64_t Transaction::RemoveChildren(const std::string& section, const std::string& parent) {
    auto& db = store_.impl_->Writable();
    Statement(db, section, "DELETE FROM %T WHERE parent = ?1").Bind(1, parent).Run();
    return db.Changes();
}

Json Transaction::GetSingleton(const std::string& name) {
    RequireSingleton(name);
    auto& db = store_.impl_->db;
    auto query = db.Prepare("SELECT doc FROM singleton WHERE name = ?1");
    return query.Bind(1, name).Next() ? ParseDoc(db, query.Text(0)) : Json::object();
}

void Transaction::PutSingleton(const std::string& name, const Json& object) {
    RequireSingleton(name);
    if (!object.is_object()) throw std::invalid_argument(name + ": a singleton must be a JSON object");
    store_.impl_->Writable()
        .Prepare("INSERT INTO singleton(name, doc) VALUES (?1, ?2) ON CONFLICT(name) DO UPDATE SET doc = excluded.doc")
        .Bind(1, name)
        .Bind(2, object.dump())
        .Run();
}

}  // namespace Store
}  // namespace PldCtl
