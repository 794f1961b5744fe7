// One "key=value" line per scalar, the key spelling out the path to it
// ("VirtualSwitch.Uplinks[1]"), so that grep and cut find any value.
#include "Common.h"

namespace AutoCli {
namespace Formatting {

namespace {

// Line breaks and backslashes are written as in C, so a value stays on its
// line and reads back; other control characters as everywhere else.
std::string Escape(const std::string& text) {
    std::string escaped;
    for (char c : text) {
        switch (c) {
            case '\\':
                escaped += "\\\\";
                break;
            case '\n':
                escaped += "\\n";
                break;
            case '\r':
                escaped += "\\r";
                break;
            default:
                escaped += c;
        }
    }
    return EscapeControls(escaped);
}

class KeyValueWriter {
public:
    KeyValueWriter(const FormatHints& hints, std::ostream& out) : hints_(hints), out_(out) {}

    // Lists of records at the top name each element by its own type; every
    // other list inherits the key of what holds it.
    void Result(const MetaObject& result) {
        if (const MetaStruct* record = AsRecord(&result)) {
            Value(record->GetTypeName(), result);
        } else if (const MetaList* list = AsList(&result)) {
            std::vector<const MetaObject*> elements = PresentElements(*list);
            for (std::size_t i = 0; i < elements.size(); ++i) {
                const MetaStruct* element = AsRecord(elements[i]);
                Value(Indexed(element ? element->GetTypeName() : "", i), *elements[i]);
            }
        } else {
            Value("value", result);
        }
    }

private:
    static std::string Indexed(const std::string& key, std::size_t index) {
        return key + "[" + std::to_string(index) + "]";
    }

    void Value(const std::string& key, const MetaObject& value) {
        if (const MetaStruct* record = AsRecord(&value)) {
            for (const MetaStruct::Field* field : SelectFields(*record, hints_, FieldSelection::HintedFirst)) {
                Value(key + "." + field->first, *field->second);
            }
        } else if (const MetaList* list = AsList(&value)) {
            std::vector<const MetaObject*> elements = PresentElements(*list);
            // A list that was set but holds nothing still shows its key, so
            // a script tells it from a field the command never set.
            if (elements.empty()) out_ << key << "=\n";
            for (std::size_t i = 0; i < elements.size(); ++i) Value(Indexed(key, i), *elements[i]);
        } else {
            out_ << key << '=' << Escape(ScalarText(value)) << '\n';
        }
    }

    const FormatHints& hints_;
    std::ostream& out_;
};

}  // namespace

void WriteKeyValue(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    KeyValueWriter(hints, out).Result(result);
}

}  // namespace Formatting
}  // namespace AutoCli
