// The table format: a header row, a row of dashes, one row per record, in
// left-aligned columns two blanks apart.
#include "Common.h"

#include <algorithm>
#include <string_view>
#include <utility>

namespace AutoCli {
namespace Formatting {

namespace {

const InlineStyle kTableStyle{", ", true, true};
const char kColumnGap[] = "  ";
const std::size_t kFlushSize = 32 * 1024;

// Appends one row, each cell padded to its column's width with blanks, the
// columns two blanks apart. `cell(i)` gives the text and display width of
// cell i.
template <typename Cell>
void AppendRow(std::string& text, std::size_t count, const std::vector<std::size_t>& widths, Cell cell) {
    const std::size_t gap = sizeof kColumnGap - 1;
    const std::size_t start = text.size();
    for (std::size_t i = 0; i < count; ++i) {
        if (i > 0) text.append(gap, ' ');
        const auto [cellText, cellWidth] = cell(i);
        text.append(cellText);
        if (i + 1 < count) text.append(widths[i] - cellWidth, ' ');
    }
    // Empty cells at the end of a row would otherwise leave the padding and
    // gaps before them hanging.
    const std::size_t end = text.find_last_not_of(' ');
    text.erase(end == std::string::npos || end < start ? start : end + 1);
    text += '\n';
}

}  // namespace

void WriteTable(const MetaObject& result, const FormatHints& hints, std::ostream& out) {
    Table table;
    if (!BuildTable(result, hints, ForHints(kTableStyle, hints), table)) {
        WriteSimple(result, hints, out);
        return;
    }
    if (table.columns.empty()) return;

    const std::size_t count = table.columns.size();
    std::vector<std::size_t> widths;
    std::vector<std::string> dashes;
    for (std::size_t i = 0; i < count; ++i) widths.push_back(DisplayWidth(table.columns[i]));
    for (std::size_t row = 0; row < table.RowCount(); ++row) {
        for (std::size_t i = 0; i < count; ++i) widths[i] = std::max(widths[i], table.CellWidth(row, i));
    }
    for (std::size_t width : widths) dashes.emplace_back(width, '-');
    // Rows are gathered and written out in pieces of a few kilobytes.
    std::string text;
    auto flush = [&] {
        out.write(text.data(), static_cast<std::streamsize>(text.size()));
        text.clear();
    };
    AppendRow(text, count, widths, [&](std::size_t i) {
        return std::pair<std::string_view, std::size_t>(table.columns[i], DisplayWidth(table.columns[i]));
    });
    AppendRow(text, count, widths,
              [&](std::size_t i) { return std::pair<std::string_view, std::size_t>(dashes[i], widths[i]); });
    std::string scratch;
    for (std::size_t row = 0; row < table.RowCount(); ++row) {
        AppendRow(text, count, widths, [&](std::size_t i) {
            return std::pair<std::string_view, std::size_t>(table.CellText(row, i, scratch), table.CellWidth(row, i));
        });
        if (text.size() >= kFlushSize) flush();
    }
    flush();
}

}  // namespace Formatting
}  // namespace AutoCli
