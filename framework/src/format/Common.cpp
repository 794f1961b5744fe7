#include "Common.h"

#include <algorithm>
#include <charconv>
#include <cstdint>

namespace AutoCli {
namespace Formatting {

namespace {

bool Contains(const std::vector<std::string>& names, const std::string& name) {
    return std::find(names.begin(), names.end(), name) != names.end();
}

void AddUnique(std::vector<std::string>& names, const std::string& name) {
    if (!Contains(names, name)) names.push_back(name);
}

// Which fields of a record are taken: bits of one word for any usual
// record, so that choosing the fields of each of a thousand records
// allocates nothing.
class FieldSet {
public:
    explicit FieldSet(std::size_t count) {
        if (count > kWordBits) many_.assign(count, false);
    }
    bool Has(std::size_t i) const { return many_.empty() ? ((word_ >> i) & 1u) != 0 : many_[i]; }
    void Add(std::size_t i) {
        if (many_.empty()) {
            word_ |= std::uint64_t{1} << i;
        } else {
            many_[i] = true;
        }
    }

private:
    static constexpr std::size_t kWordBits = 64;
    std::uint64_t word_ = 0;
    std::vector<bool> many_;
};

void AppendRecordInline(std::string& out, const MetaStruct& record, const FormatHints& hints,
                        const InlineStyle& style) {
    out += '{';
    const char* separator = "";
    for (const MetaStruct::Field* field : SelectFields(record, hints, FieldSelection::HintedOnly)) {
        out += separator;
        out += field->first;
        out += ": ";
        AppendInlineText(out, *field->second, record.GetTypeName(), field->first, hints, style);
        separator = ", ";
    }
    out += '}';
}

// The columns of a table: the type's column hint, else its fields hint, else
// every field the records have. A hint naming nothing the records or the
// list's template have is a stale hint and is ignored; with nothing to check
// it against (an empty list and a bare template) it is the best guess there is.
std::vector<std::string> ChooseColumns(const std::vector<const MetaStruct*>& records, const MetaStruct* elementTemplate,
                                       const FormatHints& hints) {
    std::string type;
    if (elementTemplate) {
        type = elementTemplate->GetTypeName();
    } else if (!records.empty()) {
        type = records.front()->GetTypeName();
    }
    std::vector<std::string> recordNames;
    for (const MetaStruct* record : records) {
        // The records of a list mostly have the same fields in the same
        // order: a name found where the last record had it is known already.
        std::size_t known = 0;
        for (const auto& field : record->GetFields()) {
            if (!IsPresent(field.second)) continue;
            if (known < recordNames.size() && recordNames[known] == field.first) {
                ++known;
                continue;
            }
            AddUnique(recordNames, field.first);
        }
    }
    std::vector<std::string> templateNames;
    if (elementTemplate) {
        for (const auto& field : elementTemplate->GetFields()) AddUnique(templateNames, field.first);
    }

    std::optional<std::vector<std::string>> hinted = hints.TableColumns(type);
    if (!hinted) hinted = hints.Fields(type);
    if (hinted && !hinted->empty()) {
        bool nothingKnown = recordNames.empty() && templateNames.empty();
        bool anyKnown = std::any_of(hinted->begin(), hinted->end(), [&](const std::string& name) {
            return Contains(recordNames, name) || Contains(templateNames, name);
        });
        if (nothingKnown || anyKnown) return *hinted;
    }
    return records.empty() ? templateNames : recordNames;
}

}  // namespace

bool IsPresent(const MetaObjectPtr& value) {
    return value && value->HasValue();
}

// Records and lists are made only by their own New(), so the type tag tells
// what a value is.
const MetaStruct* AsRecord(const MetaObject* value) {
    return value && value->GetType() == MetaObj::META_STRUCT ? static_cast<const MetaStruct*>(value) : nullptr;
}

const MetaList* AsList(const MetaObject* value) {
    return value && value->GetType() == MetaObj::META_LIST ? static_cast<const MetaList*>(value) : nullptr;
}

bool IsRecordList(const MetaObjectPtr& value) {
    const MetaList* list = AsList(value);
    return list && list->GetElementType() == MetaObj::META_STRUCT;
}

void AppendScalarText(std::string& out, const MetaObject& value, bool escapeControls) {
    switch (value.GetType()) {
        case MetaObj::META_STRING:
            if (escapeControls) {
                AppendEscapedControls(out, static_cast<const MetaObj::MetaString&>(value).GetValue());
            } else {
                out += static_cast<const MetaObj::MetaString&>(value).GetValue();
            }
            break;
        case MetaObj::META_INT: {
            // Written in place, the same digits as MetaInt::ToString: a
            // listing prints thousands of numbers.
            const auto& number = static_cast<const MetaObj::MetaInt&>(value);
            char digits[24];
            const std::to_chars_result written =
                number.IsUnsigned() ? std::to_chars(digits, digits + sizeof digits, number.GetUnsignedValue())
                                    : std::to_chars(digits, digits + sizeof digits, number.GetValue());
            out.append(digits, static_cast<std::size_t>(written.ptr - digits));
            break;
        }
        case MetaObj::META_BOOL:
            out += static_cast<const MetaObj::MetaBool&>(value).GetValue() ? "true" : "false";
            break;
        default:
            break;
    }
}

std::string ScalarText(const MetaObject& value) {
    std::string text;
    AppendScalarText(text, value);
    return text;
}

std::vector<const MetaObject*> PresentElements(const MetaList& list) {
    std::vector<const MetaObject*> elements;
    elements.reserve(list.Size());
    for (const auto& element : list.GetElements()) {
        if (IsPresent(element)) elements.push_back(element.get());
    }
    return elements;
}

std::vector<const MetaStruct::Field*> SelectFields(const MetaStruct& record, const FormatHints& hints,
                                                   FieldSelection selection) {
    std::vector<const MetaStruct::Field*> chosen;
    SelectFields(record, hints, selection, chosen);
    return chosen;
}

void SelectFields(const MetaStruct& record, const FormatHints& hints, FieldSelection selection,
                  std::vector<const MetaStruct::Field*>& chosen) {
    const std::vector<MetaStruct::Field>& fields = record.GetFields();
    chosen.clear();
    chosen.reserve(fields.size());
    FieldSet taken(fields.size());
    auto choosePresent = [&](bool skipTaken) {
        for (std::size_t i = 0; i < fields.size(); ++i) {
            if ((!skipTaken || !taken.Has(i)) && IsPresent(fields[i].second)) chosen.push_back(&fields[i]);
        }
    };
    const std::optional<std::vector<std::string>>& hinted = hints.Fields(record.GetTypeName());
    if (!hinted) {
        choosePresent(false);
        return;
    }

    // A record's field names are unique, so each hinted name takes at most
    // one field. Commands set fields in the hint's order, so the search
    // starts after the field the previous name took.
    std::size_t next = 0;
    for (const auto& name : *hinted) {
        for (std::size_t step = 0; step < fields.size(); ++step) {
            const std::size_t i = (next + step) % fields.size();
            if (fields[i].first != name) continue;
            if (!taken.Has(i) && IsPresent(fields[i].second)) {
                chosen.push_back(&fields[i]);
                taken.Add(i);
                next = i + 1;
            }
            break;
        }
    }
    if (chosen.empty()) {
        choosePresent(false);
    } else if (selection == FieldSelection::HintedFirst) {
        choosePresent(true);
    }
}

void AppendInlineText(std::string& out, const MetaObject& value, const std::string& type, const std::string& field,
                      const FormatHints& hints, const InlineStyle& style) {
    if (const MetaStruct* record = AsRecord(&value)) {
        AppendRecordInline(out, *record, hints, style);
        return;
    }
    if (const MetaList* list = AsList(&value)) {
        bool records = list->GetElementType() == MetaObj::META_STRUCT;
        const char* separator = "";
        for (const MetaObject* element : PresentElements(*list)) {
            out += separator;
            if (records) {
                AppendRecordInline(out, *AsRecord(element), hints, style);
            } else {
                AppendScalarText(out, *element, style.escapeControls);
            }
            separator = records ? ", " : style.listSeparator;
        }
        return;
    }
    AppendScalarText(out, value, style.escapeControls);
    if (style.units) {
        std::string unit = hints.Unit(type, field);
        if (!unit.empty()) {
            out += ' ';
            out += unit;
        }
    }
}

InlineStyle ForHints(const InlineStyle& style, const FormatHints& hints) {
    static const std::string kUnitsPrefix = "units:";
    auto first = hints.Raw().lower_bound(kUnitsPrefix);
    const bool anyUnit = first != hints.Raw().end() && first->first.compare(0, kUnitsPrefix.size(), kUnitsPrefix) == 0;
    return InlineStyle{style.listSeparator, style.units && anyUnit, style.escapeControls};
}

std::string InlineText(const MetaObjectPtr& value, const std::string& type, const std::string& field,
                       const FormatHints& hints, const InlineStyle& style) {
    std::string text;
    AppendInlineText(text, *value, type, field, hints, style);
    return text;
}

bool BuildTable(const MetaObject& result, const FormatHints& hints, const InlineStyle& style, Table& table) {
    std::vector<const MetaStruct*> records;
    const MetaStruct* elementTemplate = nullptr;
    if (const MetaStruct* record = AsRecord(&result)) {
        records.push_back(record);
    } else if (const MetaList* list = AsList(&result); list && list->GetElementType() == MetaObj::META_STRUCT) {
        elementTemplate = AsRecord(list->GetElementTemplate());
        for (const MetaObject* element : PresentElements(*list)) records.push_back(AsRecord(element));
    } else {
        return false;
    }

    table.columns = ChooseColumns(records, elementTemplate, hints);
    table.hints = &hints;
    table.style = style;
    const std::size_t columnCount = table.columns.size();
    table.cells.clear();
    table.widths.clear();
    table.cells.reserve(records.size() * columnCount);
    table.widths.reserve(records.size() * columnCount);
    std::string scratch;
    for (const MetaStruct* record : records) {
        const std::vector<MetaStruct::Field>& fields = record->GetFields();
        // Records usually hold their fields in the columns' order, so the
        // field after the previous column's is tried first.
        std::size_t next = 0;
        for (std::size_t i = 0; i < columnCount; ++i) {
            const MetaStruct::Field* field = nullptr;
            if (next < fields.size() && fields[next].first == table.columns[i]) {
                field = &fields[next];
            } else {
                for (const auto& candidate : fields) {
                    if (candidate.first == table.columns[i]) {
                        field = &candidate;
                        break;
                    }
                }
            }
            if (field) next = static_cast<std::size_t>(field - fields.data()) + 1;
            table.cells.push_back(field && IsPresent(field->second) ? field : nullptr);
        }
    }
    table.records = std::move(records);
    for (std::size_t row = 0; row < table.RowCount(); ++row) {
        for (std::size_t i = 0; i < columnCount; ++i)
            table.widths.push_back(DisplayWidth(table.CellText(row, i, scratch)));
    }
    return true;
}

std::string_view Table::CellText(std::size_t row, std::size_t column, std::string& scratch) const {
    const MetaStruct::Field* field = cells[row * columns.size() + column];
    if (!field) return std::string_view();
    // A string with no unit to add and nothing to escape is its own text.
    if (!style.units && field->second->GetType() == MetaObj::META_STRING) {
        const std::string& value = static_cast<const MetaObj::MetaString&>(*field->second).GetValue();
        const bool plain = !style.escapeControls || std::all_of(value.begin(), value.end(), [](char c) {
            const auto byte = static_cast<unsigned char>(c);
            return byte >= 0x20 && byte < 0x7F;
        });
        if (plain) return value;
    }
    scratch.clear();
    AppendInlineText(scratch, *field->second, records[row]->GetTypeName(), field->first, *hints, style);
    return scratch;
}

std::size_t DisplayWidth(std::string_view text) {
    // Most text is ASCII, one character a byte.
    if (std::all_of(text.begin(), text.end(), [](char c) { return static_cast<unsigned char>(c) < 0x80; })) {
        return text.size();
    }
    std::size_t width = 0;
    char32_t ignored;
    for (std::size_t pos = 0; pos < text.size(); pos += DecodeUtf8(text, pos, ignored)) ++width;
    return width;
}

}  // namespace Formatting
}  // namespace AutoCli
