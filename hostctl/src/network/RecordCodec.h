// The definitions behind StoredRecord.h, for the *Records.cpp files only:
// each describes its records with RecordFields and instantiates the
// functions for them (STORED_RECORD below). Objects are decoded with
// simdjson's on-demand parser, which builds no document tree: a field the
// record does not name is skipped, not parsed.
#pragma once

#include <simdjson.h>

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

// Specialised for each record type: `static constexpr auto kAll =
// std::make_tuple(Field("name", &Record::name), ...);`
template <typename Record>
struct RecordFields;

template <typename T, typename = void>
struct IsRecord : std::false_type {};
template <typename T>
struct IsRecord<T, std::void_t<decltype(RecordFields<T>::kAll)>> : std::true_type {};

template <typename Record, typename Fn>
void ForEachField(Fn&& fn) {
    std::apply([&](const auto&... field) { (fn(field), ...); }, RecordFields<Record>::kAll);
}

namespace Codec {

using Value = simdjson::ondemand::value;

// The thread's parser started on a copy of `text` with the padding the
// parser reads ahead into; the document lives until the next call.
simdjson::ondemand::document& Iterate(std::string_view text);

// The error of a damaged store, thrown when an object does not decode.
[[noreturn]] void ThrowDamaged();

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

// Each Read returns whether the value had the member's type; when it had
// not, the member keeps what it held.
inline bool Read(Value& value, std::string& out) {
    std::string_view text;
    if (value.get_string().get(text)) return false;
    out.assign(text);
    return true;
}

inline bool Read(Value& value, bool& out) {
    return !value.get_bool().get(out);
}

// Integers outside the member's range do not fit it; a number written with a
// fraction or exponent counts when its value is a whole number.
template <typename Int, std::enable_if_t<std::is_integral_v<Int> && !std::is_same_v<Int, bool>, int> = 0>
bool Read(Value& value, Int& out) {
    simdjson::ondemand::number number;
    if (value.get_number().get(number)) return false;
    switch (number.get_number_type()) {
        case simdjson::ondemand::number_type::signed_integer:
            return AssignInteger(number.get_int64(), out);
        case simdjson::ondemand::number_type::unsigned_integer:
            return AssignInteger(number.get_uint64(), out);
        case simdjson::ondemand::number_type::floating_point_number:
            break;
    }
    const double real = number.get_double();
    // 2^63 is exact in a double; anything at or above it is no int64.
    if (real != std::trunc(real) || real < -9223372036854775808.0 || real >= 9223372036854775808.0) {
        return false;
    }
    return AssignInteger(static_cast<std::int64_t>(real), out);
}

inline bool Read(Value& value, std::vector<std::string>& out) {
    simdjson::ondemand::array array;
    if (value.get_array().get(array)) return false;
    std::vector<std::string> items;
    for (auto element : array) {
        std::string_view text;
        // One item of another type makes the whole field so.
        if (element.get_string().get(text)) return false;
        items.emplace_back(text);
    }
    out = std::move(items);
    return true;
}

template <typename T>
bool Read(Value& value, std::optional<T>& out) {
    T read{};
    if (!Read(value, read)) return false;
    out = std::move(read);
    return true;
}

template <typename Record>
void ReadFields(simdjson::ondemand::object& object, Record& record);

template <typename Record, std::enable_if_t<IsRecord<Record>::value, int> = 0>
bool Read(Value& value, Record& out) {
    simdjson::ondemand::object object;
    if (value.get_object().get(object)) return false;
    ReadFields(object, out);
    return true;
}

template <typename Record>
void ReadFields(simdjson::ondemand::object& object, Record& record) {
    for (auto field : object) {
        std::string_view key;
        Value value;
        if (field.unescaped_key().get(key) || field.value().get(value)) ThrowDamaged();
        std::apply(
            [&](const auto&... known) {
                (void)((key == known.name && (Read(value, record.*(known.member)), true)) || ...);
            },
            RecordFields<Record>::kAll);
    }
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
    if (before == after) return;
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
    simdjson::ondemand::object object;
    if (Codec::Iterate(text).get_object().get(object)) Codec::ThrowDamaged();
    Codec::ReadFields(object, record);
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
