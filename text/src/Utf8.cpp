#include "orvixtext/Utf8.h"

#include <algorithm>

namespace Orvix {
namespace Text {

std::size_t DecodeUtf8(std::string_view text, std::size_t pos, char32_t& codePoint) {
    const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    const unsigned char lead = byte(pos);
    codePoint = 0xFFFD;
    if (lead < 0x80) {
        codePoint = lead;
        return 1;
    }
    std::size_t length;
    char32_t value;
    char32_t smallest;
    if ((lead & 0xE0) == 0xC0) {
        length = 2, value = lead & 0x1F, smallest = 0x80;
    } else if ((lead & 0xF0) == 0xE0) {
        length = 3, value = lead & 0x0F, smallest = 0x800;
    } else if ((lead & 0xF8) == 0xF0) {
        length = 4, value = lead & 0x07, smallest = 0x10000;
    } else {
        return 1;
    }
    if (pos + length > text.size()) return 1;
    for (std::size_t i = 1; i < length; ++i) {
        if ((byte(pos + i) & 0xC0) != 0x80) return 1;
        value = (value << 6) | (byte(pos + i) & 0x3F);
    }
    // Overlong forms, UTF-16 surrogates and values past the last code point
    // are not characters; letting them through would break strict parsers.
    if (value < smallest || value > 0x10FFFF || (value >= 0xD800 && value <= 0xDFFF)) return 1;
    codePoint = value;
    return length;
}

std::optional<std::size_t> PrintableLength(std::string_view text) {
    std::size_t characters = 0;
    for (std::size_t pos = 0; pos < text.size(); ++characters) {
        char32_t c;
        const std::size_t length = DecodeUtf8(text, pos, c);
        if (IsBadByte(c, length) || IsControl(c)) return std::nullopt;
        pos += length;
    }
    return characters;
}

void AppendEscapedControls(std::string& out, std::string_view text) {
    // Most text is printable ASCII and is taken whole.
    const bool plain = std::all_of(text.begin(), text.end(), [](char c) {
        const auto byte = static_cast<unsigned char>(c);
        return byte >= 0x20 && byte < 0x7F;
    });
    if (plain) {
        out += text;
        return;
    }
    static const char kHex[] = "0123456789abcdef";
    auto escape = [&out](const char* prefix, unsigned value) {
        out += prefix;
        out += kHex[(value >> 4) & 0xF];
        out += kHex[value & 0xF];
    };
    for (std::size_t pos = 0; pos < text.size();) {
        char32_t c;
        const std::size_t length = DecodeUtf8(text, pos, c);
        if (IsBadByte(c, length) || c < 0x20 || c == 0x7F) {
            escape("\\x", static_cast<unsigned char>(text[pos]));
        } else if (c >= 0x80 && c <= 0x9F) {
            escape("\\u00", static_cast<unsigned>(c));
        } else {
            out.append(text, pos, length);
        }
        pos += length;
    }
}

std::string EscapeControls(std::string_view text) {
    std::string escaped;
    AppendEscapedControls(escaped, text);
    return escaped;
}

}  // namespace Text
}  // namespace Orvix
