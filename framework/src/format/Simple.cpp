// The default human format: an optional heading per record, then one
// "Name: value" line per field, nested records indented further.
#include <deque>

#include "Common.h"

namespace AutoCli {
namespace Formatting {

namespace {

const InlineStyle kSimpleStyle{", ", true, true};
const std::size_t kIndentStep = 3;
const std::size_t kFlushSize = 32 * 1024;

// Lines are gathered in a buffer and written out a record at a time once it
// holds enough: a listing of a thousand records makes tens of thousands of
// small pieces.
class SimpleWriter {
public:
    SimpleWriter(const FormatHints& hints, std::ostream& out)
        : hints_(hints), style_(ForHints(kSimpleStyle, hints)), out_(out) {}

    void Result(const MetaObject& result) {
        if (const MetaStruct* record = AsRecord(&result)) {
            Record(*record, 0, kIndentStep);
        } else if (const MetaList* list = AsList(&result)) {
            if (list->GetElementType() == MetaObj::META_STRUCT) {
                RecordList(*list, 0, kIndentStep);
            } else {
                for (const MetaObject* element : PresentElements(*list)) {
                    AppendScalarText(text_, *element, true);
                    text_ += '\n';
                }
            }
        } else if (!IsSuccess(result)) {
            AppendScalarText(text_, result, true);
            text_ += '\n';
        }
        Flush();
    }

private:
    // An operation's result is true; success is silent, as in any shell tool.
    static bool IsSuccess(const MetaObject& result) {
        return result.GetType() == MetaObj::META_BOOL && static_cast<const MetaObj::MetaBool&>(result).GetValue();
    }

    void Flush() {
        out_.write(text_.data(), static_cast<std::streamsize>(text_.size()));
        text_.clear();
    }

    void RecordList(const MetaList& list, std::size_t headerIndent, std::size_t fieldIndent) {
        const char* separator = "";
        for (const MetaObjectPtr& element : list.GetElements()) {
            if (!IsPresent(element)) continue;
            text_ += separator;
            Record(*AsRecord(element), headerIndent, fieldIndent);
            separator = "\n";
            if (text_.size() >= kFlushSize) Flush();
        }
    }

    void Record(const MetaStruct& record, std::size_t headerIndent, std::size_t fieldIndent) {
        const std::string& type = record.GetTypeName();
        if (const std::string* header = Header(type)) {
            text_.append(headerIndent, ' ');
            Substitute(*header, record);
            text_ += '\n';
        }
        // Each depth of nesting has its own list of chosen fields, kept from
        // record to record.
        if (depth_ == selections_.size()) selections_.emplace_back();
        std::vector<const MetaStruct::Field*>& chosen = selections_[depth_];
        SelectFields(record, hints_, FieldSelection::HintedOnly, chosen);
        ++depth_;
        for (const MetaStruct::Field* field : chosen) Field(type, *field, fieldIndent);
        --depth_;
    }

    // The heading template of a record type, or null when it has none. The
    // records of a list are of one type, so the last answer is kept.
    const std::string* Header(const std::string& type) {
        if (!headerType_ || *headerType_ != type) {
            const std::optional<std::string>& header = hints_.Header(type);
            header_ = header && !hints_.HasNoHeader(type) ? &*header : nullptr;
            headerType_ = &type;
        }
        return header_;
    }

    void Field(const std::string& type, const MetaStruct::Field& field, std::size_t indent) {
        text_.append(indent, ' ');
        text_ += field.first;
        text_ += ':';
        // A nested record's own heading sits at the same depth as its fields,
        // so a heading never lines up with the field name that holds it.
        if (const MetaStruct* record = AsRecord(field.second)) {
            text_ += '\n';
            Record(*record, indent + kIndentStep, indent + kIndentStep);
        } else if (IsRecordList(field.second)) {
            text_ += '\n';
            RecordList(*AsList(field.second), indent + kIndentStep, indent + kIndentStep);
        } else {
            text_ += ' ';
            AppendInlineText(text_, *field.second, type, field.first, hints_, style_);
            text_ += '\n';
        }
    }

    // Replaces each "%Field Name%" by that field's value. A pair of percent
    // signs around something that is not a field stays as written, and its
    // closing sign may still open a real placeholder ("100% of %Name%").
    void Substitute(const std::string& header, const MetaStruct& record) {
        std::string::size_type pos = 0;
        for (;;) {
            std::string::size_type open = header.find('%', pos);
            std::string::size_type close = open == std::string::npos ? open : header.find('%', open + 1);
            if (close == std::string::npos) break;
            const MetaObjectPtr* value = FindField(record, header, open + 1, close);
            text_.append(header, pos, open - pos);
            if (value && IsPresent(*value)) {
                AppendInlineText(text_, **value, record.GetTypeName(), header.substr(open + 1, close - open - 1),
                                 hints_, style_);
                pos = close + 1;
            } else {
                text_ += '%';
                pos = open + 1;
            }
        }
        text_.append(header, pos, std::string::npos);
    }

    // The value of the field named by header[begin, end), or null.
    static const MetaObjectPtr* FindField(const MetaStruct& record, const std::string& header,
                                          std::string::size_type begin, std::string::size_type end) {
        for (const auto& field : record.GetFields()) {
            if (header.compare(begin, end - begin, field.first) == 0) return &field.second;
        }
        return nullptr;
    }

    const FormatHints& hints_;
    const InlineStyle style_;
    std::ostream& out_;
    std::string text_;
    std::deque<std::vector<const MetaStruct::Field*>> selections_;
    std::size_t depth_ = 0;
    const std::string* headerType_ = nullptr;
    const std::string* header_ = nullptr;
};

}  // namespace

void WriteSimple(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    SimpleWriter(hints, out).Result(result);
}

}  // namespace Formatting
}  // namespace AutoCli
