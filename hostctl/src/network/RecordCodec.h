// The definitions behind StoredRecord.h, for the *Records.cpp files only:
// each describes its records with RecordFields and instantiates the
// functions for them (STORED_RECORD below). Objects are decoded with
// JsonReader, which builds no document tree: a field the record does not
// name is skipped, not kept.
#pragma once

#include <cmath>
#include <cstdint>
#include <limits>
#include <optional>
#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

#include "network/StoredJson.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

// One field of a record: its name in the stored object and the member that
// holds it.
template <typename Record, typename T>
struct FieldOf {
    std::string_view name;
    T Record::*member;
};

template <typename Record, typename T>
constexpr FieldOf<Record, T> Field(std::string_view name, T Record::*member) {
    return {name, member};
}

// Specialised for each record type: `static constexpr auto All() { return
// std::make_tuple(Field("name", &Record::name), ...); }`
template <typename Record>
struct RecordFields;

template <typename T, typename = void>
struct IsRecord : std::false_type {};
template <typename T>
struct IsRecord<T, std::void_t<decltype(RecordFields<T>::All())>> : std::true_type {};

template <typename Record, typename Fn>
void ForEachField(Fn&& fn) {
    std::apply([&](const auto&... field) { (fn(field), ...); }, RecordFields<Record>::All());
}

namespace Codec {

template <typename Int>
bool AssignInteger(std::int64_t value, Int& out) {
    if constexpr (std::is_signed_v<Int>) {
        if (value < std::numeric_limits<Int>::min() || value > std::numeric_limits<Int>::max()) return false;
    } else {
        if (value < 0 || static_cast<std::uint64_t>(value) > std::numeric_limits<Int>::max()) return false;
    }
    out = static_cast<Int>(value);
    return true;
}

template <typename Int>
bool AssignInteger(std::uint64_t value, Int& out) {
    if (value > static_cast<std::uint64_t>(std::numeric_limits<Int>::max())) return false;
    out = static_cast<Int>(value);
    return true;
}

// Each Read takes the value at the reader into the member and returns true,
// or, for a value of another type, skips it, leaves the member as it was and
// returns false.
inline bool Read(JsonReader& reader, std::string& out) {
    if (reader.Next() != JsonReader::Kind::String) {
        reader.Skip();
        return false;
    }
    out.assign(reader.String());
    return true;
}

inline bool Read(JsonReader& reader, bool& out) {
    if (reader.Next() != JsonReader::Kind::Bool) {
        reader.Skip();
        return false;
    }
    out = reader.Bool();
    return true;
}

// Integers outside the member's range do not fit it; a number written with a
// fraction or exponent counts when its value is a whole number.
template <typename Int, std::enable_if_t<std::is_integral_v<Int> && !std::is_same_v<Int, bool>, int> = 0>
bool Read(JsonReader& reader, Int& out) {
    if (reader.Next() != JsonReader::Kind::Number) {
        reader.Skip();
        return false;
    }
    const JsonReader::Number number = reader.ReadNumber();
    switch (number.kind) {
        case JsonReader::Number::Signed:
            return AssignInteger(number.signedValue, out);
        case JsonReader::Number::Unsigned:
            return AssignInteger(number.unsignedValue, out);
        case JsonReader::Number::Real:
            break;
    }
    const double real = number.realValue;
    // 2^63 is exact in a double; anything at or above it is no int64.
    if (real != std::trunc(real) || real < -9223372036854775808.0 || real >= 9223372036854775808.0) {
        return false;
    }
    return AssignInteger(static_cast<std::int64_t>(real), out);
}

template <typename Record>
void ReadFields(JsonReader& reader, Record& record);
template <typename Record, std::enable_if_t<IsRecord<Record>::value, int> = 0>
bool Read(JsonReader& reader, Record& out);
template <typename T>
bool Read(JsonReader& reader, std::vector<T>& out);

template <typename T>
bool Read(JsonReader& reader, std::optional<T>& out) {
    T read{};
    if (!Read(reader, read)) return false;
    out = std::move(read);
    return true;
}

template <typename Record, std::enable_if_t<IsRecord<Record>::value, int>>
bool Read(JsonReader& reader, Record& out) {
    if (reader.Next() != JsonReader::Kind::Object) {
        reader.Skip();
        return false;
    }
    ReadFields(reader, out);
    return true;
}

// An array of strings, numbers or records.
template <typename T>
bool Read(JsonReader& reader, std::vector<T>& out) {
    if (reader.Next() != JsonReader::Kind::Array) {
        reader.Skip();
        return false;
    }
    std::vector<T> items;
    // One item of another type makes the whole field so.
    bool fits = true;
    reader.BeginArray();
    while (reader.NextItem()) {
        T item{};
        fits = Read(reader, item) && fits;
        if (fits) items.push_back(std::move(item));
    }
    if (fits) out = std::move(items);
    return fits;
}

// A member the record does not name is skipped; of members named twice the
// last one counts, as when the store's writer reads the object.
template <typename Record>
void ReadFields(JsonReader& reader, Record& record) {
    reader.BeginObject();
    std::string_view key;
    while (reader.NextKey(key)) {
        const bool known = std::apply(
            [&](const auto&... field) {
                return ((key == field.name && (Read(reader, record.*(field.member)), true)) || ...);
            },
            RecordFields<Record>::All());
        if (!known) reader.Skip();
    }
}

template <typename T>
bool Equal(const T& a, const T& b);

template <typename T>
bool Equal(const std::vector<T>& a, const std::vector<T>& b) {
    if (a.size() != b.size()) return false;
    for (std::size_t i = 0; i < a.size(); ++i) {
        if (!Equal(a[i], b[i])) return false;
    }
    return true;
}

template <typename T>
bool Equal(const std::optional<T>& a, const std::optional<T>& b) {
    return a.has_value() == b.has_value() && (!a || Equal(*a, *b));
}

template <typename T>
bool Equal(const T& a, const T& b) {
    if constexpr (IsRecord<T>::value) {
        bool equal = true;
        ForEachField<T>([&](const auto& field) { equal = equal && Equal(a.*(field.member), b.*(field.member)); });
        return equal;
    } else {
        return a == b;
    }
}

// The stored form of a member (nested records: Encode).
template <typename T>
Store::Json ToJson(const T& value);

template <typename T>
Store::Json ToJson(const std::vector<T>& values) {
    Store::Json array = Store::Json::array();
    for (const T& value : values) array.push_back(ToJson(value));
    return array;
}

template <typename T>
Store::Json ToJson(const T& value) {
    if constexpr (IsRecord<T>::value) {
        return Encode(value);
    } else {
        return Store::Json(value);
    }
}

template <typename T>
void EncodeField(Store::Json& out, std::string_view name, const T& value) {
    Store::Json json = ToJson(value);
    if constexpr (IsRecord<T>::value) {
        if (json.empty()) return;
    }
    out[std::string(name)] = std::move(json);
}

template <typename T>
void EncodeField(Store::Json& out, std::string_view name, const std::optional<T>& value) {
    if (value) EncodeField(out, name, *value);
}

template <typename T>
void MergeField(Store::Json& stored, std::string_view name, const T& before, const T& after) {
    if (Equal(before, after)) return;
    if constexpr (IsRecord<T>::value) {
        Merge(stored[std::string(name)], before, after);
    } else {
        stored[std::string(name)] = ToJson(after);
    }
}

template <typename T>
void MergeField(Store::Json& stored, std::string_view name, const std::optional<T>& before,
                const std::optional<T>& after) {
    if (Equal(before, after)) return;
    if constexpr (IsRecord<T>::value) {
        // A nested object that stays keeps the fields the record does not know.
        if (before && after) {
            Merge(stored[std::string(name)], *before, *after);
            return;
        }
    }
    if (after) {
        stored[std::string(name)] = ToJson(*after);
    } else {
        stored.erase(std::string(name));
    }
}

}  // namespace Codec

template <typename Record>
Record Decode(std::string_view text) {
    Record record;
    JsonReader reader(text);
    Codec::ReadFields(reader, record);
    reader.End();
    return record;
}

template <typename Record>
Store::Json Encode(const Record& record) {
    Store::Json json = Store::Json::object();
    ForEachField<Record>([&](const auto& field) { Codec::EncodeField(json, field.name, record.*(field.member)); });
    return json;
}

template <typename Record>
void Merge(Store::Json& stored, const Record& before, const Record& after) {
    if (!stored.is_object()) stored = Store::Json::object();
    ForEachField<Record>([&](const auto& field) {
        Codec::MergeField(stored, field.name, before.*(field.member), after.*(field.member));
    });
}

template <typename Record>
void ApplyEdits(Record& target, const Record& base, const Record& edited) {
    ForEachField<Record>([&](const auto& field) {
        if (!Codec::Equal(base.*(field.member), edited.*(field.member))) {
            target.*(field.member) = edited.*(field.member);
        }
    });
}

}  // namespace Detail
}  // namespace PldCtl

// Instantiates the functions of StoredRecord.h for a record type.
#define STORED_RECORD(Record)                                                                        \
    template Record PldCtl::Detail::Decode<Record>(std::string_view);                                \
    template PldCtl::Store::Json PldCtl::Detail::Encode<Record>(const Record&);                      \
    template void PldCtl::Detail::Merge<Record>(PldCtl::Store::Json&, const Record&, const Record&); \
    template void PldCtl::Detail::ApplyEdits<Record>(Record&, const Record&, const Record&)
