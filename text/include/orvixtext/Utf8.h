// UTF-8 rules shared by every component that stores text or shows it: the
// CLI framework's formatters and messages, the host-control library's name
// checks and orvix-hostsim's messages. Names end up in JSON documents, which
// hold only valid UTF-8, and on terminals, where a control character can act
// instead of being shown.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace Orvix {
namespace Text {

// Decodes the character at `pos` and returns the number of bytes it takes.
// A byte that does not begin a well-formed UTF-8 sequence (truncated,
// overlong, a surrogate, above U+10FFFF) decodes as U+FFFD and takes one byte.
std::size_t DecodeUtf8(std::string_view text, std::size_t pos, char32_t& codePoint);
// True when DecodeUtf8 stood in for a bad byte rather than read a real U+FFFD.
inline bool IsBadByte(char32_t codePoint, std::size_t length) {
    return codePoint == 0xFFFD && length == 1;
}
// C0, DEL and C1 control characters.
inline bool IsControl(char32_t codePoint) {
    return codePoint < 0x20 || (codePoint >= 0x7F && codePoint <= 0x9F);
}

// The number of characters in `text` when it is valid UTF-8 without control
// characters; nullopt otherwise.
std::optional<std::size_t> PrintableLength(std::string_view text);

// Appends `text` as a terminal may show it: each control character (C0,
// DEL) and each byte that does not begin a well-formed UTF-8 sequence as
// "\xNN", each C1 control character as "\u00NN", everything else as it is.
// A control character in a name could otherwise move the cursor, recolour
// the terminal or set its title.
void AppendEscapedControls(std::string& out, std::string_view text);
std::string EscapeControls(std::string_view text);

}  // namespace Text
}  // namespace Orvix
