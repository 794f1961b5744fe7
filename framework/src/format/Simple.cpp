// The default human format: an optional heading per record, then one
// "Name: value" line per field, nested records indented further.
#include "Common.h"

namespace AutoCli {
namespace Formatting {

namespace {

const InlineStyle kSimpleStyle{", ", true};
const std::size_t kIndentStep = 3;

class SimpleWriter {
public:
    SimpleWriter(const FormatHints& hints, std::ostream& out) : hints_(hints), out_(out) {}

    void Result(const MetaObject& result) {
        if (const auto* record = dynamic_cast<const MetaStruct*>(&result)) {
            Record(*record, 0, kIndentStep);
        } else if (const auto* list = dynamic_cast<const MetaList*>(&result)) {
            if (list->GetElementType() == MetaObj::META_STRUCT) {
                RecordList(*list, 0, kIndentStep);
            } else {
                for (const auto& element : PresentElements(*list)) out_ << ScalarText(*element) << '\n';
            }
        } else if (!IsSuccess(result)) {
            out_ << ScalarText(result) << '\n';
        }
    }

private:
    // An operation's result is true; success is silent, as in any shell tool.
    static bool IsSuccess(const MetaObject& result) {
        return result.GetType() == MetaObj::META_BOOL && static_cast<const MetaObj::MetaBool&>(result).GetValue();
    }

    void RecordList(const MetaList& list, std::size_t headerIndent, std::size_t fieldIndent) {
        const char* separator = "";
        for (const auto& element : PresentElements(list)) {
            out_ << separator;
            Record(*AsRecord(element), headerIndent, fieldIndent);
            separator = "\n";
        }
    }

    void Record(const MetaStruct& record, std::size_t headerIndent, std::size_t fieldIndent) {
        const std::string& type = record.GetTypeName();
        const std::optional<std::string>& header = hints_.Header(type);
        if (header && !hints_.HasNoHeader(type)) {
            out_ << std::string(headerIndent, ' ') << Substitute(*header, record) << '\n';
        }
        for (const auto& field : SelectFields(record, hints_, FieldSelection::HintedOnly)) {
            Field(type, field, fieldIndent);
        }
    }

    void Field(const std::string& type, const MetaStruct::Field& field, std::size_t indent) {
        out_ << std::string(indent, ' ') << field.first << ':';
        // A nested record's own heading sits at the same depth as its fields,
        // so a heading never lines up with the field name that holds it.
        if (const MetaStruct* record = AsRecord(field.second)) {
            out_ << '\n';
            Record(*record, indent + kIndentStep, indent + kIndentStep);
        } else if (IsRecordList(field.second)) {
            out_ << '\n';
            RecordList(*AsList(field.second), indent + kIndentStep, indent + kIndentStep);
        } else {
            out_ << ' ' << InlineText(field.second, type, field.first, hints_, kSimpleStyle) << '\n';
        }
    }

    // Replaces each "%Field Name%" by that field's value. A pair of percent
    // signs around something that is not a field stays as written, and its
    // closing sign may still open a real placeholder ("100% of %Name%").
    std::string Substitute(const std::string& header, const MetaStruct& record) const {
        std::string text;
        std::string::size_type pos = 0;
        for (;;) {
            std::string::size_type open = header.find('%', pos);
            std::string::size_type close = open == std::string::npos ? open : header.find('%', open + 1);
            if (close == std::string::npos) break;
            std::string name = header.substr(open + 1, close - open - 1);
            MetaObjectPtr value = record.GetField(name);
            text.append(header, pos, open - pos);
            if (IsPresent(value)) {
                text += InlineText(value, record.GetTypeName(), name, hints_, kSimpleStyle);
                pos = close + 1;
            } else {
                text += '%';
                pos = open + 1;
            }
        }
        return text.append(header, pos, std::string::npos);
    }

    const FormatHints& hints_;
    std::ostream& out_;
};

}  // namespace

void WriteSimple(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    SimpleWriter(hints, out).Result(result);
}

}  // namespace Formatting
}  // namespace AutoCli
