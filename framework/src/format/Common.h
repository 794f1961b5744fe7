// What the six formatters share: which values count as present, which fields
// of a record are shown and in what order, how a value reads inside one line
// or one cell, the columns of a table, UTF-8 handling for the machine
// formats and the escaping of control characters for the human ones.
// Private to the framework library.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "framework/Format.h"
#include "orvixtext/Utf8.h"

namespace AutoCli {
namespace Formatting {

using MetaObj::MetaList;
using MetaObj::MetaObject;
using MetaObj::MetaObjectPtr;
using MetaObj::MetaStruct;

// A value is present when it exists and holds a value. A scalar template
// (made without a value) is treated everywhere like a field never set.
bool IsPresent(const MetaObjectPtr& value);

// Typed views of a value; null when it is of another kind.
const MetaStruct* AsRecord(const MetaObject* value);
const MetaList* AsList(const MetaObject* value);
inline const MetaStruct* AsRecord(const MetaObjectPtr& value) {
    return AsRecord(value.get());
}
inline const MetaList* AsList(const MetaObjectPtr& value) {
    return AsList(value.get());
}
bool IsRecordList(const MetaObjectPtr& value);

// "abc", "42", "true": the text of a string, int or bool.
std::string ScalarText(const MetaObject& value);
// The same, appended to `out`; a string with its control characters
// escaped when `escapeControls` is set (see AppendEscapedControls).
void AppendScalarText(std::string& out, const MetaObject& value, bool escapeControls = false);

// The elements of a list that are present, in order. The pointers are valid
// as long as the list is.
std::vector<const MetaObject*> PresentElements(const MetaList& list);

// The present fields of a record in display order. With the record type's
// "fields:" hint, the hinted fields the record has come first, in hint order;
// HintedOnly stops there (the human formats), HintedFirst then adds the
// record's other fields in record order (the machine formats). A hint that
// matches none of the record's fields is ignored. The pointers are valid as
// long as the record is.
enum class FieldSelection { HintedOnly, HintedFirst };
std::vector<const MetaStruct::Field*> SelectFields(const MetaStruct& record, const FormatHints& hints,
                                                   FieldSelection selection);
// The same, into `chosen` (cleared first), whose room is reused from record
// to record.
void SelectFields(const MetaStruct& record, const FormatHints& hints, FieldSelection selection,
                  std::vector<const MetaStruct::Field*>& chosen);

// How a value reads inside one line or one table cell.
struct InlineStyle {
    const char* listSeparator;  // between the items of a string list
    bool units;                 // a scalar is followed by its unit word, if any
    bool escapeControls;        // strings are shown with control characters escaped
};

// The style with units turned off when no hint gives any, so that values
// need no lookup of their unit: most commands set none.
InlineStyle ForHints(const InlineStyle& style, const FormatHints& hints);

// The one-line text of a field's value: a scalar (with its unit when the
// style asks), a string list joined, a record as "{Name: value, ...}", a list
// of records as such items joined by ", ".
std::string InlineText(const MetaObjectPtr& value, const std::string& type, const std::string& field,
                       const FormatHints& hints, const InlineStyle& style);
// The same, appended to `out`.
void AppendInlineText(std::string& out, const MetaObject& value, const std::string& type, const std::string& field,
                      const FormatHints& hints, const InlineStyle& style);

// A result laid out as columns and rows, for table and csv. Each cell is the
// field its row has for its column (null when it has none) with the display
// width of its text; the text itself is made when the cell is written, so a
// listing of ten thousand rows copies no string into a table first.
struct Table {
    std::vector<std::string> columns;
    // One per row.
    std::vector<const MetaStruct*> records;
    // `columns.size()` per row, row by row.
    std::vector<const MetaStruct::Field*> cells;
    std::vector<std::size_t> widths;
    const FormatHints* hints = nullptr;
    InlineStyle style{", ", false, false};

    std::size_t RowCount() const { return records.size(); }
    std::size_t CellWidth(std::size_t row, std::size_t column) const { return widths[row * columns.size() + column]; }
    // A cell's text: a plain string as it is, anything else made in
    // `scratch` (valid until the next call with the same scratch).
    std::string_view CellText(std::size_t row, std::size_t column, std::string& scratch) const;
};

// Lays out a record (one row) or a list of records. Returns false for any
// other result, which the caller renders in its own way. The table refers to
// the result and the hints, which must outlive it.
bool BuildTable(const MetaObject& result, const FormatHints& hints, const InlineStyle& style, Table& table);

// The UTF-8 rules every formatter follows; AppendEscapedControls and
// EscapeControls shape every human-facing text, the machine formats keep
// text exact.
using Orvix::Text::AppendEscapedControls;
using Orvix::Text::DecodeUtf8;
using Orvix::Text::EscapeControls;
using Orvix::Text::IsBadByte;

// Rewrites a text character by character. `replace` is called with each
// character (a bad byte as U+FFFD, with badByte set) and returns the text to
// put in its place, or nullopt to keep the character as it was.
template <typename Replace>
std::string Recode(const std::string& text, Replace replace) {
    std::string out;
    for (std::size_t pos = 0; pos < text.size();) {
        char32_t c;
        std::size_t length = DecodeUtf8(text, pos, c);
        if (std::optional<std::string> replacement = replace(c, IsBadByte(c, length))) {
            out += *replacement;
        } else {
            out.append(text, pos, length);
        }
        pos += length;
    }
    return out;
}

// The number of characters of a text, for lining up columns.
std::size_t DisplayWidth(std::string_view text);

// The work of each formatter, given a present result (never null, never a
// scalar template). Formatters.cpp binds them to their names.
void WriteSimple(const MetaObject& result, const FormatHints& hints, std::ostream& out);
void WriteTable(const MetaObject& result, const FormatHints& hints, std::ostream& out);
void WriteJson(const MetaObject& result, const FormatHints& hints, std::ostream& out);
void WriteXml(const MetaObject& result, const FormatHints& hints, std::ostream& out);
void WriteCsv(const MetaObject& result, const FormatHints& hints, std::ostream& out);
void WriteKeyValue(const MetaObject& result, const FormatHints& hints, std::ostream& out);

}  // namespace Formatting
}  // namespace AutoCli
