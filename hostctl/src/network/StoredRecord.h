// Typed records of stored objects, and how the library reads and writes them.
//
// Each stored collection has one record type: a struct whose members carry
// the fields the library uses, with their defaults as member initialisers.
// Its JSON mapping (a list of field names and members, RecordFields<Record>)
// sits beside it in its room's *Records.cpp, which also instantiates the
// functions below for it.
//
// A record is read straight from a stored object's text: a field that is
// absent, null or of another type keeps its default, and fields the record
// does not know are skipped without being parsed. A record is written back by
// merging: only the fields that differ from what was read are written, so
// fields the library does not know (written by a newer version, or by hand
// in a profile) survive every change.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Detail {

// Reads a record from a stored object's text. Throws Store::StoreError when
// the text is not a JSON object (a damaged store).
template <typename Record>
Record Decode(std::string_view text);

// The record as a new stored object: every field, except optional fields
// that are not set and nested objects left with no field.
template <typename Record>
Store::Json Encode(const Record& record);

// Writes into `stored` each field in which `after` differs from `before` (an
// optional field that is no longer set is removed); nested objects are merged
// the same way. Every other field of `stored` stays as it is.
template <typename Record>
void Merge(Store::Json& stored, const Record& before, const Record& after);

// Sets in `target` each field in which `edited` differs from `base`: the
// edits a caller made to an older copy, applied to the record as it is now.
template <typename Record>
void ApplyEdits(Record& target, const Record& base, const Record& edited);

// A stored object read inside a change: its document as stored, for the
// write that merges into it, and its record.
template <typename Record>
struct StoredObject {
    Store::Json document;
    Record record;
};

// The stored text as a document, for merging into.
Store::Json ParseStored(const std::string& text);

// Reads through a Store::HostStore (one read) or a Store::Transaction alike.
template <typename Record, typename Source>
std::optional<Record> Get(Source& source, const std::string& key) {
    std::optional<std::string> text = source.GetText(Record::kSection, key);
    if (!text) return std::nullopt;
    return Decode<Record>(*text);
}

template <typename Record, typename Source>
std::vector<Record> List(Source& source) {
    std::vector<Record> records;
    for (const std::string& text : source.ListText(Record::kSection)) records.push_back(Decode<Record>(text));
    return records;
}

template <typename Record, typename Source>
std::vector<Record> ListChildren(Source& source, const std::string& parent) {
    std::vector<Record> records;
    for (const std::string& text : source.ListChildrenText(Record::kSection, parent)) {
        records.push_back(Decode<Record>(text));
    }
    return records;
}

// Records to share among the objects of a listing. Each text is released as
// soon as it is decoded, so its memory serves the records that follow.
template <typename Record>
std::vector<std::shared_ptr<const Record>> DecodeShared(std::vector<std::string>&& texts) {
    std::vector<std::shared_ptr<const Record>> records;
    records.reserve(texts.size());
    for (std::string& text : texts) {
        records.push_back(std::make_shared<const Record>(Decode<Record>(text)));
        std::string().swap(text);
    }
    return records;
}

// The object of that key, read to be changed, or nullopt.
template <typename Record>
std::optional<StoredObject<Record>> Find(Store::Transaction& t, const std::string& key) {
    std::optional<std::string> text = t.GetText(Record::kSection, key);
    if (!text) return std::nullopt;
    Record record = Decode<Record>(*text);
    return StoredObject<Record>{ParseStored(*text), std::move(record)};
}

// Writes `edited` over what `stored` was read as, and keeps it as the
// object's record.
template <typename Record>
void Write(Store::Transaction& t, StoredObject<Record>& stored, const Record& edited) {
    Merge(stored.document, stored.record, edited);
    t.Put(Record::kSection, stored.document);
    stored.record = edited;
}

// A singleton read to be changed; it reads as all defaults when it was
// never written.
template <typename Record>
StoredObject<Record> FindSingleton(Store::Transaction& t) {
    std::string text = t.GetSingletonText(Record::kSingleton);
    Record record = Decode<Record>(text);
    return StoredObject<Record>{ParseStored(text), std::move(record)};
}

template <typename Record>
void WriteSingleton(Store::Transaction& t, StoredObject<Record>& stored, const Record& edited) {
    Merge(stored.document, stored.record, edited);
    t.PutSingleton(Record::kSingleton, stored.document);
    stored.record = edited;
}

template <typename Record, typename Source>
Record GetSingleton(Source& source) {
    return Decode<Record>(source.GetSingletonText(Record::kSingleton));
}

// A new object (or one replaced whole).
template <typename Record>
void Create(Store::Transaction& t, const Record& record) {
    t.Put(Record::kSection, Encode(record));
}

}  // namespace Detail
}  // namespace PldCtl
