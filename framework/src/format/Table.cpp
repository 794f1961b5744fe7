// The table format: a header row, a row of dashes, one row per record, in
// left-aligned columns two blanks apart.
#include "Common.h"

#include <algorithm>
#include <cstring>

namespace AutoCli {
namespace Formatting {

namespace {

const InlineStyle kTableStyle{", ", true, true};
const char kColumnGap[] = "  ";
const std::size_t kFlushSize = 32 * 1024;

void AppendRow(std::string& text, const std::vector<std::string>& cells, const std::vector<std::size_t>& widths) {
    // The row is laid out in room made for it at once: blanks everywhere,
    // then each cell's text at its column. A padded cell takes the bytes of
    // its text plus the blanks its width lacks.
    const std::size_t gap = sizeof kColumnGap - 1;
    std::size_t length = 0;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        if (i > 0) length += gap;
        length += cells[i].size();
        if (i + 1 < cells.size()) length += widths[i] - DisplayWidth(cells[i]);
    }
    const std::size_t start = text.size();
    text.resize(start + length, ' ');
    std::size_t pos = start;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        if (i > 0) pos += gap;
        std::memcpy(&text[pos], cells[i].data(), cells[i].size());
        pos += cells[i].size();
        if (i + 1 < cells.size()) pos += widths[i] - DisplayWidth(cells[i]);
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

    std::vector<std::size_t> widths;
    std::vector<std::string> dashes;
    for (std::size_t i = 0; i < table.columns.size(); ++i) {
        std::size_t width = DisplayWidth(table.columns[i]);
        for (const auto& row : table.rows) width = std::max(width, DisplayWidth(row[i]));
        widths.push_back(width);
        dashes.emplace_back(width, '-');
    }
    // Rows are gathered and written out in pieces of a few kilobytes.
    std::string text;
    auto flush = [&] {
        out.write(text.data(), static_cast<std::streamsize>(text.size()));
        text.clear();
    };
    AppendRow(text, table.columns, widths);
    AppendRow(text, dashes, widths);
    for (const auto& row : table.rows) {
        AppendRow(text, row, widths);
        if (text.size() >= kFlushSize) flush();
    }
    flush();
}

}  // namespace Formatting
}  // namespace AutoCli
