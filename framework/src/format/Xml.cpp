// XML for scripts: <output> holding one value; records are <structure>
// elements of <field>s, lists say what they hold, scalars say their type.
#include "Common.h"

namespace AutoCli {
namespace Formatting {

namespace {

// Escapes text for element content or an attribute value. Characters that
// XML 1.0 does not allow at all are dropped; CR, and in attributes tab and
// newline, become character references so that parsers do not normalise them
// away.
std::string Escape(const std::string& text, bool attribute) {
    return Recode(text, [attribute](char32_t c, bool badByte) -> std::optional<std::string> {
        switch (c) {
            case '&':
                return "&amp;";
            case '<':
                return "&lt;";
            case '>':
                return "&gt;";
            case '"':
                return "&quot;";
            case '\'':
                return "&apos;";
            case '\r':
                return "&#13;";
            case '\t':
                return attribute ? "&#9;" : "\t";
            case '\n':
                return attribute ? "&#10;" : "\n";
            case 0xFFFE:
            case 0xFFFF:
                return "";
        }
        if (badByte) return "\xEF\xBF\xBD";
        if (c < 0x20) return "";
        return std::nullopt;
    });
}

bool IsInline(const MetaObject& value) {
    return value.GetType() != MetaObj::META_STRUCT &&
           !(value.GetType() == MetaObj::META_LIST &&
             static_cast<const MetaList&>(value).GetElementType() == MetaObj::META_STRUCT);
}

std::string Scalar(const MetaObject& value) {
    const char* tag = value.GetType() == MetaObj::META_INT    ? "integer"
                      : value.GetType() == MetaObj::META_BOOL ? "boolean"
                                                              : "string";
    return std::string("<") + tag + ">" + Escape(ScalarText(value), false) + "</" + tag + ">";
}

const char kStringListOpen[] = "<list type=\"string\">";

// A scalar, or a list of strings on one line.
std::string Inline(const MetaObject& value) {
    const MetaList* list = AsList(&value);
    if (!list) return Scalar(value);
    std::string text = kStringListOpen;
    for (const MetaObject* element : PresentElements(*list)) text += Scalar(*element);
    return text + "</list>";
}

class XmlWriter {
public:
    XmlWriter(const FormatHints& hints, std::ostream& out) : hints_(hints), out_(out) {}

    void Value(const MetaObject& value, std::size_t depth) {
        if (const MetaStruct* record = AsRecord(&value)) {
            Element(depth, "<structure typeName=\"" + Escape(record->GetTypeName(), true) + "\">", "</structure>",
                    SelectFields(*record, hints_, FieldSelection::HintedFirst),
                    [&](const MetaStruct::Field* field) { Field(*field, depth + 1); });
        } else if (const MetaList* list = AsList(&value)) {
            bool records = list->GetElementType() == MetaObj::META_STRUCT;
            Element(depth, records ? "<list type=\"structure\">" : kStringListOpen, "</list>", PresentElements(*list),
                    [&](const MetaObject* element) { Value(*element, depth + 1); });
        } else {
            Line(depth, Scalar(value));
        }
    }

private:
    void Field(const MetaStruct::Field& field, std::size_t depth) {
        std::string open = "<field name=\"" + Escape(field.first, true) + "\">";
        if (IsInline(*field.second)) {
            Line(depth, open + Inline(*field.second) + "</field>");
        } else {
            Line(depth, open);
            Value(*field.second, depth + 1);
            Line(depth, "</field>");
        }
    }

    template <typename Items, typename WriteItem>
    void Element(std::size_t depth, const std::string& open, const std::string& close, const Items& items,
                 WriteItem writeItem) {
        if (items.empty()) {
            Line(depth, open + close);
            return;
        }
        Line(depth, open);
        for (const auto& item : items) writeItem(item);
        Line(depth, close);
    }

    void Line(std::size_t depth, const std::string& text) { out_ << std::string(2 * depth, ' ') << text << '\n'; }

    const FormatHints& hints_;
    std::ostream& out_;
};

}  // namespace

void WriteXml(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    out << "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<output>\n";
    XmlWriter(hints, out).Value(result, 1);
    out << "</output>\n";
}

}  // namespace Formatting
}  // namespace AutoCli
