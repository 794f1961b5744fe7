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

void WriteRow(const std::vector<std::string>& cells, std::ostream& out) {
    const char* separator = "";
    for (const auto& cell : cells) {
        out << separator << Cell(cell);
        separator = ",";
    }
    out << '\n';
}

}  // namespace

void WriteCsv(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    Table table;
    if (BuildTable(result, hints, kCsvStyle, table)) {
        if (table.columns.empty()) return;
        WriteRow(table.columns, out);
        std::vector<std::string> cells(table.columns.size());
        std::string scratch;
        for (std::size_t row = 0; row < table.RowCount(); ++row) {
            for (std::size_t i = 0; i < cells.size(); ++i) cells[i] = table.CellText(row, i, scratch);
            WriteRow(cells, out);
        }
    } else if (const MetaList* list = AsList(&result)) {
        for (const MetaObject* element : PresentElements(*list)) out << Cell(ScalarText(*element)) << '\n';
    } else {
        out << Cell(ScalarText(result)) << '\n';
    }
}

}  // namespace Formatting
}  // namespace AutoCli
