// The table format: a header row, a row of dashes, one row per record, in
// left-aligned columns two blanks apart.
#include "Common.h"

#include <algorithm>

namespace AutoCli {
namespace Formatting {

namespace {

const InlineStyle kTableStyle{", ", true};
const char kColumnGap[] = "  ";

void WriteRow(const std::vector<std::string>& cells, const std::vector<std::size_t>& widths, std::ostream& out) {
    std::string line;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        if (i > 0) line += kColumnGap;
        line += cells[i];
        if (i + 1 < cells.size()) line.append(widths[i] - DisplayWidth(cells[i]), ' ');
    }
    // Empty cells at the end of a row would otherwise leave the padding and
    // gaps before them hanging.
    line.erase(line.find_last_not_of(' ') + 1);
    out << line << '\n';
}

}  // namespace

void WriteTable(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    Table table;
    if (!BuildTable(result, hints, kTableStyle, table)) {
        WriteSimple(result, hints, out);
        return;
    }
    if (table.columns.empty()) return;

    std::vector<std::size_t> widths;
    std::vector<std::string> dashes;
    for (std::size_t i = 0; i < table.columns.size(); ++i) {
        std::size_t width = DisplayWidth(table.columns[i]);
        for (const auto& row : table.rows) width = std::max(width, DisplayWidth(row[i]));
        widths.push_back(width);
        dashes.emplace_back(width, '-');
    }
    WriteRow(table.columns, widths, out);
    WriteRow(dashes, widths, out);
    for (const auto& row : table.rows) WriteRow(row, widths, out);
}

}  // namespace Formatting
}  // namespace AutoCli
