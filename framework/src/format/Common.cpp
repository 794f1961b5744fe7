#include "Common.h"

#include <algorithm>

namespace AutoCli {
namespace Formatting {

namespace {

bool Contains(const std::vector<std::string>& names, const std::string& name) {
    return std::find(names.begin(), names.end(), name) != names.end();
}

void AddUnique(std::vector<std::string>& names, const std::string& name) {
    if (!Contains(names, name)) names.push_back(name);
}

std::string RecordInline(const MetaStruct& record, const FormatHints& hints, const InlineStyle& style) {
    std::string text = "{";
    const char* separator = "";
    for (const auto& field : SelectFields(record, hints, FieldSelection::HintedOnly)) {
        text += separator + field.first + ": " +
                InlineText(field.second, record.GetTypeName(), field.first, hints, style);
        separator = ", ";
    }
    return text + "}";
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
        for (const auto& field : record->GetFields()) {
            if (IsPresent(field.second)) AddUnique(recordNames, field.first);
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

bool IsPresent(const MetaObjectPtr& value) { return value && value->HasValue(); }

const MetaStruct* AsRecord(const MetaObjectPtr& value) { return dynamic_cast<const MetaStruct*>(value.get()); }

const MetaList* AsList(const MetaObjectPtr& value) { return dynamic_cast<const MetaList*>(value.get()); }

bool IsRecordList(const MetaObjectPtr& value) {
    const MetaList* list = AsList(value);
    return list && list->GetElementType() == MetaObj::META_STRUCT;
}

std::string ScalarText(const MetaObject& value) {
    switch (value.GetType()) {
    case MetaObj::META_STRING: return static_cast<const MetaObj::MetaString&>(value).GetValue();
    case MetaObj::META_INT: return static_cast<const MetaObj::MetaInt&>(value).ToString();
    case MetaObj::META_BOOL: return static_cast<const MetaObj::MetaBool&>(value).GetValue() ? "true" : "false";
    default: return "";
    }
}

std::vector<MetaObjectPtr> PresentElements(const MetaList& list) {
    std::vector<MetaObjectPtr> elements;
    for (const auto& element : list.GetElements()) {
        if (IsPresent(element)) elements.push_back(element);
    }
    return elements;
}

std::vector<MetaStruct::Field> SelectFields(const MetaStruct& record, const FormatHints& hints,
                                            FieldSelection selection) {
    std::vector<MetaStruct::Field> present;
    for (const auto& field : record.GetFields()) {
        if (IsPresent(field.second)) present.push_back(field);
    }
    const std::optional<std::vector<std::string>>& hinted = hints.Fields(record.GetTypeName());
    if (!hinted) return present;

    std::vector<MetaStruct::Field> chosen;
    std::vector<bool> taken(present.size(), false);
    for (const auto& name : *hinted) {
        for (std::size_t i = 0; i < present.size(); ++i) {
            if (!taken[i] && present[i].first == name) {
                chosen.push_back(present[i]);
                taken[i] = true;
            }
        }
    }
    if (chosen.empty()) return present;
    if (selection == FieldSelection::HintedFirst) {
        for (std::size_t i = 0; i < present.size(); ++i) {
            if (!taken[i]) chosen.push_back(present[i]);
        }
    }
    return chosen;
}

std::string InlineText(const MetaObjectPtr& value, const std::string& type, const std::string& field,
                       const FormatHints& hints, const InlineStyle& style) {
    if (const MetaStruct* record = AsRecord(value)) return RecordInline(*record, hints, style);
    if (const MetaList* list = AsList(value)) {
        bool records = list->GetElementType() == MetaObj::META_STRUCT;
        std::string text;
        const char* separator = "";
        for (const auto& element : PresentElements(*list)) {
            text += separator;
            text += records ? RecordInline(*AsRecord(element), hints, style) : ScalarText(*element);
            separator = records ? ", " : style.listSeparator;
        }
        return text;
    }
    std::string text = ScalarText(*value);
    if (style.units) {
        std::string unit = hints.Unit(type, field);
        if (!unit.empty()) text += " " + unit;
    }
    return text;
}

bool BuildTable(const MetaObject& result, const FormatHints& hints, const InlineStyle& style, Table& table) {
    std::vector<const MetaStruct*> records;
    const MetaStruct* elementTemplate = nullptr;
    if (const auto* record = dynamic_cast<const MetaStruct*>(&result)) {
        records.push_back(record);
    } else if (const auto* list = dynamic_cast<const MetaList*>(&result);
               list && list->GetElementType() == MetaObj::META_STRUCT) {
        elementTemplate = AsRecord(list->GetElementTemplate());
        for (const auto& element : PresentElements(*list)) records.push_back(AsRecord(element));
    } else {
        return false;
    }

    table.columns = ChooseColumns(records, elementTemplate, hints);
    table.rows.clear();
    for (const MetaStruct* record : records) {
        std::vector<std::string> row;
        for (const auto& column : table.columns) {
            MetaObjectPtr value = record->GetField(column);
            row.push_back(IsPresent(value) ? InlineText(value, record->GetTypeName(), column, hints, style) : "");
        }
        table.rows.push_back(std::move(row));
    }
    return true;
}

std::size_t DecodeUtf8(const std::string& text, std::size_t pos, char32_t& codePoint) {
    const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    const unsigned char lead = byte(pos);
    codePoint = 0xFFFD;
    if (lead < 0x80) {
        codePoint = lead;
        return 1;
    }
    std::size_t length;
    char32_t value;
    char32_t smallest;
    if ((lead & 0xE0) == 0xC0) {
        length = 2, value = lead & 0x1F, smallest = 0x80;
    } else if ((lead & 0xF0) == 0xE0) {
        length = 3, value = lead & 0x0F, smallest = 0x800;
    } else if ((lead & 0xF8) == 0xF0) {
        length = 4, value = lead & 0x07, smallest = 0x10000;
    } else {
        return 1;
    }
    if (pos + length > text.size()) return 1;
    for (std::size_t i = 1; i < length; ++i) {
        if ((byte(pos + i) & 0xC0) != 0x80) return 1;
        value = (value << 6) | (byte(pos + i) & 0x3F);
    }
    // Overlong forms, UTF-16 surrogates and values past the last code point
    // are not characters; letting them through would break strict parsers.
    if (value < smallest || value > 0x10FFFF || (value >= 0xD800 && value <= 0xDFFF)) return 1;
    codePoint = value;
    return length;
}

std::size_t DisplayWidth(const std::string& text) {
    std::size_t width = 0;
    char32_t ignored;
    for (std::size_t pos = 0; pos < text.size(); pos += DecodeUtf8(text, pos, ignored)) ++width;
    return width;
}

}  // namespace Formatting
}  // namespace AutoCli
