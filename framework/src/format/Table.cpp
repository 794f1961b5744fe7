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

void AppendRow(std::string& text, const std::string* cells, const std::size_t* cellWidths, std::size_t count,
               const std::vector<std::size_t>& widths) {
    // The row is laid out in room made for it at once: blanks everywhere,
    // then each cell's text at its column. A padded cell takes the bytes of
    // its text plus the blanks its width lacks.
    const std::size_t gap = sizeof kColumnGap - 1;
    std::size_t length = 0;
    for (std::size_t i = 0; i < count; ++i) {
        if (i > 0) length += gap;
        length += cells[i].size();
        if (i + 1 < count) length += widths[i] - cellWidths[i];
    }
    const std::size_t start = text.size();
    text.resize(start + length, ' ');
    std::size_t pos = start;
    for (std::size_t i = 0; i < count; ++i) {
        if (i > 0) pos += gap;
        std::memcpy(&text[pos], cells[i].data(), cells[i].size());
        pos += cells[i].size();
        if (i + 1 < count) pos += widths[i] - cellWidths[i];
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
    std::vector<std::size_t> headerWidths;
    std::vector<std::string> dashes;
    for (std::size_t i = 0; i < count; ++i) headerWidths.push_back(DisplayWidth(table.columns[i]));
    widths = headerWidths;
    for (std::size_t row = 0; row < table.RowCount(); ++row) {
        const std::size_t* cellWidths = table.RowWidths(row);
        for (std::size_t i = 0; i < count; ++i) widths[i] = std::max(widths[i], cellWidths[i]);
    }
    for (std::size_t width : widths) dashes.emplace_back(width, '-');
    // Rows are gathered and written out in pieces of a few kilobytes.
    std::string text;
    auto flush = [&] {
        out.write(text.data(), static_cast<std::streamsize>(text.size()));
        text.clear();
    };
    AppendRow(text, table.columns.data(), headerWidths.data(), count, widths);
    AppendRow(text, dashes.data(), widths.data(), count, widths);
    for (std::size_t row = 0; row < table.RowCount(); ++row) {
        AppendRow(text, table.RowCells(row), table.RowWidths(row), count, widths);
        if (text.size() >= kFlushSize) flush();
    }
    flush();
}

}  // namespace Formatting
}  // namespace AutoCli
