// Reads and writes of single objects. Every query is a cached statement on
// an index of the object table: by key (section, key), by parent (section,
// parent, seq) or in order (section, seq), so a host with thousands of
// objects costs no more per call than a small one, and only the objects
// asked for are parsed.
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
    auto query = Statement(db, section, "SELECT doc FROM object WHERE section = %S AND key = ?1");
    query.Bind(1, key);
    if (!query.Next()) return std::nullopt;
    return ParseDoc(db, query.Text(0));
}

bool Transaction::Exists(const std::string& section, const std::string& key) {
    auto query = Statement(store_.impl_->db, section, "SELECT 1 FROM object WHERE section = %S AND key = ?1");
    return query.Bind(1, key).Next();
}

std::vector<Json> Transaction::List(const std::string& section) {
    auto& db = store_.impl_->db;
    auto query = Statement(db, section, "SELECT doc FROM object WHERE section = %S ORDER BY seq");
    return Documents(db, query);
}

std::vector<Json> Transaction::ListChildren(const std::string& section, const std::string& parent) {
    auto& db = store_.impl_->db;
    auto query = Statement(db, section, "SELECT doc FROM object WHERE section = %S AND parent = ?1 ORDER BY seq");
    query.Bind(1, parent);
    return Documents(db, query);
}

std::int64_t Transaction::Count(const std::string& section) {
    auto query = Statement(store_.impl_->db, section, "SELECT count(*) FROM object WHERE section = %S");
    query.Next();
    return query.Int(0);
}

std::int64_t Transaction::CountChildren(const std::string& section, const std::string& parent) {
    auto query = Statement(store_.impl_->db, section, "SELECT count(*) FROM object WHERE section = %S AND parent = ?1");
    query.Bind(1, parent).Next();
    return query.Int(0);
}

std::string Transaction::Conditions(const CollectionInfo& collection, const std::vector<FieldTest>& tests,
                                    bool afterParent, std::vector<std::string>& bindings) {
    // Parameter ?1 is the parent when there is one.
    const std::size_t first = afterParent ? 2 : 1;
    std::string sql;
    for (const auto& test : tests) {
        std::string value = ColumnOf(collection, test.field);
        if (value.empty()) {
            bindings.push_back("$.\"" + test.field + "\"");
            value = "json_extract(doc, ?" + std::to_string(bindings.size() + first - 1) + ")";
        }
        sql += sql.empty() && !afterParent ? " WHERE " : " AND ";
        if (test.equals) {
            // Compared as text, so an integer field matches its decimal form.
            bindings.push_back(*test.equals);
            sql += "CAST(" + value + " AS TEXT) = ?" + std::to_string(bindings.size() + first - 1);
        } else {
            sql += "coalesce(" + value + ", '') NOT IN ('', 0)";
        }
    }
    return sql;
}

std::int64_t Transaction::CountChildren(const std::string& section, const std::string& parent,
                                        const std::vector<FieldTest>& tests) {
    std::vector<std::string> bindings;
    const std::string sql = "SELECT count(*) FROM object WHERE section = %S AND parent = ?1" +
                            Conditions(Collection(section), tests, true, bindings);
    auto query = Statement(store_.impl_->db, section, sql.c_str());
    query.Bind(1, parent);
    for (std::size_t i = 0; i < bindings.size(); ++i) query.Bind(static_cast<int>(i + 2), bindings[i]);
    query.Next();
    return query.Int(0);
}

std::map<std::string, std::int64_t> Transaction::CountBy(const std::string& section, const std::string& groupBy,
                                                         const std::vector<FieldTest>& tests) {
    std::vector<std::string> bindings;
    const std::string sql = "SELECT " + groupBy + ", count(*) FROM %T" +
                            Conditions(Collection(section), tests, false, bindings) + " GROUP BY 1";
    auto query = Statement(store_.impl_->db, section, sql.c_str());
    for (std::size_t i = 0; i < bindings.size(); ++i) query.Bind(static_cast<int>(i + 1), bindings[i]);
    std::map<std::string, std::int64_t> counts;
    while (query.Next()) {
        if (!query.IsNull(0)) counts[query.Text(0)] = query.Int(1);
    }
    return counts;
}

std::map<std::string, std::int64_t> Transaction::CountByParent(const std::string& section,
                                                               const std::vector<FieldTest>& tests) {
    return CountBy(section, "parent", tests);
}

std::map<std::string, std::int64_t> Transaction::CountByField(const std::string& section, const std::string& field,
                                                              const std::vector<FieldTest>& tests) {
    std::string value = ColumnOf(Collection(section), field);
    if (value.empty()) {
        // Field names come from the library's code, never from users; the
        // doubled quotes keep any spelling inside the SQL string.
        std::string escaped;
        for (char c : field) escaped += c == '\'' ? std::string("''") : std::string(1, c);
        value = "json_extract(doc, '$.\"" + escaped + "\"')";
    }
    return CountBy(section, "CAST(" + value + " AS TEXT)", tests);
}

std::vector<Json> Transaction::ListByParentOrder(const std::string& section) {
    const CollectionInfo& collection = Collection(section);
    if (!collection.parentSection) {
        throw std::invalid_argument(section + ": its objects have no parent section to be ordered by");
    }
    auto& db = store_.impl_->db;
    const std::string sql =
        "SELECT c.doc FROM object AS c JOIN object AS p ON p.section = " + Sql::Literal(collection.parentSection) +
        " AND p.key = c.parent WHERE c.section = %S ORDER BY p.seq, c.seq";
    auto query = db.Prepare(TableSql(section, sql.c_str()));
    return Documents(db, query);
}

std::int64_t Transaction::SumField(const std::string& section, const std::string& field, std::int64_t fallback) {
    std::string value = ColumnOf(Collection(section), field);
    if (value.empty()) value = "json_extract(doc, ?2)";
    auto query =
        Statement(store_.impl_->db, section,
                  ("SELECT coalesce(sum(coalesce(" + value + ", ?1)), 0) FROM object WHERE section = %S").c_str());
    query.Bind(1, fallback);
    if (value[0] != '"') query.Bind(2, "$.\"" + field + "\"");
    query.Next();
    return query.Int(0);
}

std::int64_t Transaction::MaxIntegerKey(const std::string& section) {
    auto query = Statement(store_.impl_->db, section,
                           "SELECT coalesce(max(CAST(key AS INTEGER)), 0) FROM object WHERE section = %S");
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
            ? "#" + std::to_string(db.Integer(
                        TableSql(section, "SELECT coalesce(max(seq), 0) + 1 FROM object WHERE section = %S")))
            : KeyOf(collection, object);
    auto query = db.Prepare(
        TableSql(section,
                 "INSERT INTO object(section, key, parent, seq, doc) "
                 "VALUES (%S, ?1, ?2, (SELECT coalesce(max(seq), 0) + 1 FROM object WHERE section = %S), ?3) "
                 "ON CONFLICT(section, key) DO UPDATE SET parent = excluded.parent, doc = excluded.doc"));
    query.Bind(1, key).Bind(2, parent).Bind(3, object.dump()).Run();
}

bool Transaction::Remove(const std::string& section, const std::string& key) {
    auto& db = store_.impl_->Writable();
    Statement(db, section, "DELETE FROM object WHERE section = %S AND key = ?1").Bind(1, key).Run();
    return db.Changes() > 0;
}

std::int64_t Transaction::RemoveChildren(const std::string& section, const std::string& parent) {
    auto& db = store_.impl_->Writable();
    Statement(db, section, "DELETE FROM object WHERE section = %S AND parent = ?1").Bind(1, parent).Run();
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

// ---- Stored text -----------------------------------------------------------
// The reads above without the parsing: the same statements, each row's
// document handed out as text.

namespace {

std::vector<std::string> Texts(Sql::Query& query) {
    std::vector<std::string> texts;
    while (query.Next()) texts.push_back(query.Text(0));
    return texts;
}

}  // namespace

std::optional<std::string> Transaction::GetText(const std::string& section, const std::string& key) {
    auto query = Statement(store_.impl_->db, section, "SELECT doc FROM %T WHERE key = ?1");
    query.Bind(1, key);
    if (!query.Next()) return std::nullopt;
    return query.Text(0);
}

std::vector<std::string> Transaction::ListText(const std::string& section) {
    auto query = Statement(store_.impl_->db, section, "SELECT doc FROM %T ORDER BY seq");
    return Texts(query);
}

std::vector<std::string> Transaction::ListChildrenText(const std::string& section, const std::string& parent) {
    auto query = Statement(store_.impl_->db, section, "SELECT doc FROM %T WHERE parent = ?1 ORDER BY seq");
    query.Bind(1, parent);
    return Texts(query);
}

void Transaction::EachChildText(const std::string& section, const std::string& parent,
                                const std::function<void(std::string_view)>& visit) {
    auto query = Statement(store_.impl_->db, section, "SELECT doc FROM %T WHERE parent = ?1 ORDER BY seq");
    query.Bind(1, parent);
    while (query.Next()) visit(query.TextView(0));
}

std::vector<std::string> Transaction::ListByParentOrderText(const std::string& section) {
    const CollectionInfo& collection = Collection(section);
    if (!collection.parentSection) {
        throw std::invalid_argument(section + ": its objects have no parent section to be ordered by");
    }
    const std::string sql = "SELECT c.doc FROM %T AS c JOIN " + Sql::Quote(collection.parentSection) +
                            " AS p ON p.key = c.parent ORDER BY p.seq, c.seq";
    auto query = store_.impl_->db.Prepare(TableSql(section, sql.c_str()));
    return Texts(query);
}

std::string Transaction::GetSingletonText(const std::string& name) {
    RequireSingleton(name);
    auto query = store_.impl_->db.Prepare("SELECT doc FROM singleton WHERE name = ?1");
    return query.Bind(1, name).Next() ? query.Text(0) : std::string("{}");
}

std::vector<std::string> Transaction::ListKeys(const std::string& section) {
    auto query = Statement(store_.impl_->db, section, "SELECT key FROM %T ORDER BY seq");
    return Texts(query);
}

std::unordered_map<std::string, Transaction::GroupCount> Transaction::CountGroups(const std::string& section,
                                                                                  const std::string& byField,
                                                                                  const std::vector<FieldTest>& tests) {
    const CollectionInfo& collection = Collection(section);
    // The tests as one condition: Conditions() gives " WHERE a AND b" and
    // binds its values from ?1 on.
    std::vector<std::string> bindings;
    const std::string where = Conditions(collection, tests, false, bindings);
    const std::string kWhere = " WHERE ";
    const std::string passes = where.empty() ? "1" : "(" + where.substr(kWhere.size()) + ")";
    std::string group = "parent";
    if (!byField.empty()) {
        group = ColumnOf(collection, byField);
        if (group.empty()) {
            bindings.push_back("$.\"" + byField + "\"");
            group = "json_extract(doc, ?" + std::to_string(bindings.size()) + ")";
        }
        group = "CAST(" + group + " AS TEXT)";
    }
    auto query = Statement(store_.impl_->db, section, ("SELECT " + group + ", " + passes + " FROM %T").c_str());
    for (std::size_t i = 0; i < bindings.size(); ++i) query.Bind(static_cast<int>(i + 1), bindings[i]);
    std::unordered_map<std::string, GroupCount> counts;
    while (query.Next()) {
        if (query.IsNull(0)) continue;
        GroupCount& count = counts[query.Text(0)];
        ++count.all;
        if (query.Int(1) != 0) ++count.passing;
    }
    return counts;
}

// ---- end of stored text -----------------------------------------------------

}  // namespace Store
}  // namespace PldCtl
