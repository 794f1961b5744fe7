// Comma-separated values after RFC 4180, with "\n" line ends: the columns of
// the table format without units, for spreadsheets and scripts.
#include "Common.h"

namespace AutoCli {
namespace Formatting {

namespace {

const InlineStyle kCsvStyle{",", false, false};

std::string Cell(const std::string& text) {
    if (text.find_first_of(",\"\r\n") == std::string::npos) return text;
    std::string quoted = "\"";
    for (char c : text) {
        if (c == '"') quoted += '"';
        quoted += c;
    }
    return quoted + '"';
}

void WriteRow(const std::string* cells, std::size_t count, std::ostream& out) {
    const char* separator = "";
    for (const std::string* cell = cells; cell != cells + count; ++cell) {
        out << separator << Cell(*cell);
        separator = ",";
    }
    out << '\n';
}

}  // namespace

void WriteCsv(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    Table table;
    if (BuildTable(result, hints, kCsvStyle, table)) {
        if (table.columns.empty()) return;
        WriteRow(table.columns.data(), table.columns.size(), out);
        for (std::size_t row = 0; row < table.RowCount(); ++row) {
            WriteRow(table.RowCells(row), table.columns.size(), out);
        }
    } else if (const MetaList* list = AsList(&result)) {
        for (const MetaObject* element : PresentElements(*list)) out << Cell(ScalarText(*element)) << '\n';
    } else {
        out << Cell(ScalarText(result)) << '\n';
    }
}

}  // namespace Formatting
}  // namespace AutoCli
