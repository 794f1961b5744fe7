#include "Text.h"

#include <cstdint>

namespace PldCtl {
namespace Detail {

std::optional<std::size_t> PrintableLength(std::string_view text) {
    std::size_t characters = 0;
    for (std::size_t i = 0; i < text.size(); ++characters) {
        const auto lead = static_cast<unsigned char>(text[i]);
        std::size_t length = 1;
        std::uint32_t code = lead;
        // The lead bytes that can start a shortest form; 0xC0, 0xC1 and
        // 0xF5 and above never do.
        if (lead >= 0xC2 && lead <= 0xDF) {
            length = 2;
            code = lead & 0x1Fu;
        } else if (lead >= 0xE0 && lead <= 0xEF) {
            length = 3;
            code = lead & 0x0Fu;
        } else if (lead >= 0xF0 && lead <= 0xF4) {
            length = 4;
            code = lead & 0x07u;
        } else if (lead >= 0x80) {
            return std::nullopt;
        }
        if (text.size() - i < length) return std::nullopt;
        for (std::size_t k = 1; k < length; ++k) {
            const auto next = static_cast<unsigned char>(text[i + k]);
            if ((next & 0xC0u) != 0x80u) return std::nullopt;
            code = code << 6 | (next & 0x3Fu);
        }
        const bool overlong = (length == 3 && code < 0x800) || (length == 4 && code < 0x10000);
        const bool surrogate = code >= 0xD800 && code <= 0xDFFF;
        const bool control = code < 0x20 || (code >= 0x7F && code <= 0x9F);
        if (overlong || surrogate || control || code > 0x10FFFF) return std::nullopt;
        i += length;
    }
    return characters;
}

}  // namespace Detail
}  // namespace PldCtl
