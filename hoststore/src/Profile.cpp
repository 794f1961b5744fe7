// Host profiles: reading, checking and writing the JSON document that
// describes a whole host.
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <sstream>
#include <unordered_map>

#include "ProfileChecks.h"
#include "StoreImpl.h"

namespace PldCtl {
namespace Store {

namespace {

// Far above any realistic host (the large benchmark host is a few MiB), low
// enough that a wrong file name cannot exhaust memory.
constexpr off_t kMaxProfileBytes = off_t(256) << 20;

// A host is a few levels deep (section, object, policy, list); the bound
// leaves room for hand-written extras while keeping every later walk over a
// document (copying, writing, comparing, all recursive) to a small stack.
constexpr int kMaxProfileDepth = 64;

// Calls fn(i, place) for each character of a JSON text outside its strings
// (quotes included, newlines excluded), where place is "line L, column C";
// fn may advance i past characters it consumed, and stops the scan by
// returning true. The scan does not recurse and builds no document.
template <typename Fn>
void ScanOutsideStrings(const std::string& text, Fn fn) {
    bool inString = false;
    std::size_t line = 1;
    std::size_t lineStart = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char c = text[i];
        if (inString) {
            if (c == '\\') {
                ++i;
            } else if (c == '"') {
                inString = false;
            }
        } else if (c == '\n') {
            ++line;
            lineStart = i + 1;
        } else {
            if (c == '"') inString = true;
            auto place = [&] {
                return "line " + std::to_string(line) + ", column " + std::to_string(i - lineStart + 1);
            };
            if (fn(i, place)) return;
        }
    }
}

// Refuses a text whose arrays and objects nest deeper than kMaxProfileDepth,
// before a document is built from it, so a hostile file cannot exhaust the
// stack. Every other error is left to the parser.
void CheckDepth(const std::string& text, const std::string& label) {
    int depth = 0;
    ScanOutsideStrings(text, [&](std::size_t& i, const auto& place) {
        if (text[i] == '[' || text[i] == '{') {
            if (++depth > kMaxProfileDepth) {
                throw ProfileError(label + ": nested deeper than " + std::to_string(kMaxProfileDepth) + " levels at " +
                                   place());
            }
        } else if (text[i] == ']' || text[i] == '}') {
            --depth;
        }
        return false;
    });
}

// Where the first number beyond a double's range is, which is what the
// parser refuses without saying where.
std::string TooLargeNumberPlace(const std::string& text) {
    std::string found = "an unknown place";
    ScanOutsideStrings(text, [&](std::size_t& i, const auto& place) {
        if (text[i] != '-' && (text[i] < '0' || text[i] > '9')) return false;
        const std::size_t end = std::min(text.find_first_not_of("+-.0123456789eE", i), text.size());
        if (std::isinf(std::strtod(text.substr(i, end - i).c_str(), nullptr))) {
            found = place();
            return true;
        }
        i = end - 1;
        return false;
    });
    return found;
}

const CollectionInfo* FindCollection(const std::string& section) {
    for (const auto& c : Collections()) {
        if (section == c.section) return &c;
    }
    return nullptr;
}

// The keys of one section's objects, each with the index it first appeared at.
using KeyIndex = std::unordered_map<std::string, std::size_t>;

// Checks one object of a collection and records its key. Messages say what is
// wrong; the caller adds where.
void CheckObject(const CollectionInfo& collection, const Json& object, std::size_t index, KeyIndex& keys) {
    if (!object.is_object()) throw ProfileError("must be a JSON object");
    if (!collection.keyFields.empty()) {
        auto [first, added] = keys.emplace(KeyOf(collection, object), index);
        if (!added) {
            throw ProfileError("duplicate key '" + first->first + "' (as " + collection.section + "[" +
                               std::to_string(first->second) + "])");
        }
    }
    if (collection.parentField && !FieldText(object, collection.parentField)) {
        throw ProfileError("parent field '" + std::string(collection.parentField) + "' is missing");
    }
}

// Every object whose owner must exist in another section names one that does.
void CheckReferences(const CollectionInfo& collection, const Json& objects,
                     const std::unordered_map<std::string, KeyIndex>& keys, const std::string& label) {
    if (!collection.parentSection) return;
    const auto owners = keys.find(collection.parentSection);
    for (std::size_t i = 0; i < objects.size(); ++i) {
        const std::string parent = *FieldText(objects[i], collection.parentField);
        if (owners == keys.end() || owners->second.count(parent) == 0) {
            throw ProfileError(label + ": " + collection.section + "[" + std::to_string(i) +
                               "]: " + collection.parentField + " '" + parent + "' does not exist in " +
                               collection.parentSection);
        }
    }
}

// The types and ranges of the fields the library reads (ProfileChecks.h).
template <typename Fail>
void CheckFieldsOf(const std::string& section, const Json& value, Fail fail) {
    try {
        CheckSectionFields(section, value);
    } catch (const ProfileError& e) {
        fail(e.what());
    }
}

// label starts every message: "profile <origin>".
void Validate(const Json& profile, const std::string& label) {
    auto fail = [&label](const std::string& what) { throw ProfileError(label + ": " + what); };
    if (!profile.is_object()) fail("the top level must be a JSON object");
    const auto format = profile.find("format");
    if (format == profile.end() || *format != kProfileFormat) {
        fail("\"format\" must be \"" + std::string(kProfileFormat) + "\"");
    }
    const auto version = profile.find("version");
    if (version == profile.end() || !version->is_number_integer()) fail("\"version\" must be an integer");
    if (*version != kProfileVersion) {
        fail("version " + version->dump() + " is not supported (this build reads version " +
             std::to_string(kProfileVersion) + ")");
    }

    // Owners may come after the objects that name them, so all keys are
    // gathered before any reference is checked.
    std::unordered_map<std::string, KeyIndex> keys;
    for (const auto& [name, value] : profile.items()) {
        if (name == "format" || name == "version") continue;
        if (IsSingleton(name)) {
            if (!value.is_object()) fail(name + ": must be a JSON object");
            CheckFieldsOf(name, value, fail);
            continue;
        }
        const CollectionInfo* collection = FindCollection(name);
        if (!collection) fail("unknown section '" + name + "'");
        if (!value.is_array()) fail(name + ": must be a JSON array of objects");
        KeyIndex& sectionKeys = keys[name];
        for (std::size_t i = 0; i < value.size(); ++i) {
            try {
                CheckObject(*collection, value[i], i, sectionKeys);
            } catch (const ProfileError& e) {
                fail(name + "[" + std::to_string(i) + "]: " + e.what());
            }
        }
        CheckFieldsOf(name, value, fail);
    }
    for (const auto& collection : Collections()) {
        const auto objects = profile.find(collection.section);
        if (objects != profile.end()) CheckReferences(collection, *objects, keys, label);
    }
}

}  // namespace

bool IsSingleton(const std::string& name) {
    const auto& names = Singletons();
    return std::find(names.begin(), names.end(), name) != names.end();
}

std::optional<std::string> FieldText(const Json& object, const char* field) {
    const auto value = object.find(field);
    if (value == object.end() || value->is_null()) return std::nullopt;
    if (value->is_string()) return value->get<std::string>();
    if (value->is_number_integer()) return value->dump();
    throw ProfileError("field '" + std::string(field) + "' must be a string or an integer, not " + value->type_name());
}

std::string KeyOf(const CollectionInfo& collection, const Json& object) {
    std::string key;
    for (std::size_t i = 0; i < collection.keyFields.size(); ++i) {
        const auto text = FieldText(object, collection.keyFields[i]);
        if (!text) throw ProfileError("key field '" + std::string(collection.keyFields[i]) + "' is missing");
        key += (i == 0 ? "" : "|") + *text;
    }
    return key;
}

void ValidateProfile(const Json& profile) {
    Validate(profile, "profile");
}

Json ParseProfile(const std::string& text, const std::string& origin) {
    const std::string label = "profile " + origin;
    CheckDepth(text, label);
    Json profile;
    try {
        profile = Json::parse(text);
    } catch (const Json::parse_error& e) {
        // Drop the library's "[json.exception.parse_error.101] " prefix; the
        // rest says what and where (line and column).
        std::string message = e.what();
        const auto end = message.find("] ");
        if (message.front() == '[' && end != std::string::npos) message.erase(0, end + 2);
        throw ProfileError(label + ": " + message);
    } catch (const Json::out_of_range&) {
        // The parser reports a number beyond a double's range (out_of_range
        // 406) only with the number's text; it is placed here instead.
        throw ProfileError(label + ": a number is too large at " + TooLargeNumberPlace(text));
    }
    Validate(profile, label);
    return profile;
}

std::string ReadProfileFile(const std::string& file) {
    auto fail = [&file](const std::string& why) { throw ProfileError("cannot read profile '" + file + "': " + why); };
    struct stat st {};
    if (stat(file.c_str(), &st) != 0) fail(std::strerror(errno));
    if (!S_ISREG(st.st_mode)) fail("not a regular file");
    if (st.st_size > kMaxProfileBytes) fail("larger than " + std::to_string(kMaxProfileBytes >> 20) + " MiB");
    std::ifstream in(file, std::ios::binary);
    if (!in.is_open()) fail(std::strerror(errno));
    std::ostringstream text;
    text << in.rdbuf();
    if (in.bad()) fail("read error");
    return text.str();
}

std::string FormatProfile(const Json& profile) {
    // nlohmann::json keeps an object's members sorted by name; the ordered
    // variant lets the sections appear in the order a reader expects.
    nlohmann::ordered_json out;
    auto copy = [&](const std::string& name) {
        const auto value = profile.find(name);
        if (value != profile.end()) out[name] = *value;
    };
    copy("format");
    copy("version");
    for (const auto& name : Singletons()) copy(name);
    for (const auto& collection : Collections()) copy(collection.section);
    return out.dump(2);
}

}  // namespace Store
}  // namespace PldCtl
