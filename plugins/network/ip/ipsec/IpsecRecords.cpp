#include "ip/ipsec/IpsecRecords.h"

#include <cstdio>

namespace OrvixCli {
namespace NetworkNamespace {

std::string ConvertToHrsMinsAndSecs(unsigned long long seconds) {
    const unsigned long long parts[] = {seconds / 3600, (seconds % 3600) / 60, seconds % 60};
    const char* const letters[] = {"h ", "m ", "s "};
    std::string text;
    for (std::size_t i = 0; i < 3; ++i) {
        if (parts[i] != 0) text += std::to_string(parts[i]) + letters[i];
    }
    return text.empty() ? std::string("infinite") : text;
}

std::string DisplayWord(const std::vector<std::string>& table, int code) {
    if (code < 0 || static_cast<std::size_t>(code) >= table.size()) return std::string();
    return table[static_cast<std::size_t>(code)];
}

std::string SpiText(std::uint32_t spi) {
    char text[sizeof "0xffffffff"];
    std::snprintf(text, sizeof text, "0x%x", static_cast<unsigned>(spi));
    return text;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
