// JSON for scripts: records are objects, lists arrays, ints numbers, bools
// booleans. The output is always valid JSON, whatever bytes a value holds.
#include "Common.h"

#include <cstdio>

namespace AutoCli {
namespace Formatting {

namespace {

// A JSON string literal. Control characters and bytes that are not UTF-8
// become escapes; every other character passes through as it is.
std::string Quote(const std::string& text) {
    return '"' +
           Recode(text,
                  [](char32_t c, bool badByte) -> std::optional<std::string> {
                      switch (c) {
                          case '"':
                              return "\\\"";
                          case '\\':
                              return "\\\\";
                          case '\b':
                              return "\\b";
                          case '\f':
                              return "\\f";
                          case '\n':
                              return "\\n";
                          case '\r':
                              return "\\r";
                          case '\t':
                              return "\\t";
                      }
                      if (c >= 0x20 && !badByte) return std::nullopt;
                      char escape[8];
                      std::snprintf(escape, sizeof escape, "\\u%04x", static_cast<unsigned>(c));
                      return std::string(escape);
                  }) +
           '"';
}

class JsonWriter {
public:
    JsonWriter(const FormatHints& hints, std::ostream& out) : hints_(hints), out_(out) {}

    void Value(const MetaObject& value, std::size_t depth) {
        if (const MetaStruct* record = AsRecord(&value)) {
            Block('{', '}', SelectFields(*record, hints_, FieldSelection::HintedFirst), depth,
                  [&](const MetaStruct::Field* field) {
                      out_ << Quote(field->first) << ": ";
                      Value(*field->second, depth + 1);
                  });
        } else if (const MetaList* list = AsList(&value)) {
            Block('[', ']', PresentElements(*list), depth,
                  [&](const MetaObject* element) { Value(*element, depth + 1); });
        } else if (value.GetType() == MetaObj::META_STRING) {
            out_ << Quote(ScalarText(value));
        } else {
            out_ << ScalarText(value);  // ints and bools read the same in JSON
        }
    }

private:
    // An object or array: one item a line, two blanks deeper; empty ones
    // stay on one line.
    template <typename Items, typename WriteItem>
    void Block(char open, char close, const Items& items, std::size_t depth, WriteItem writeItem) {
        out_ << open;
        const char* separator = "\n";
        for (const auto& item : items) {
            out_ << separator << std::string(2 * (depth + 1), ' ');
            writeItem(item);
            separator = ",\n";
        }
        if (!items.empty()) out_ << '\n' << std::string(2 * depth, ' ');
        out_ << close;
    }

    const FormatHints& hints_;
    std::ostream& out_;
};

}  // namespace

void WriteJson(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    JsonWriter(hints, out).Value(result, 0);
    out << '\n';
}

}  // namespace Formatting
}  // namespace AutoCli
