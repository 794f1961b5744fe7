#include "ip/ipsec/IpsecOptions.h"

#include <cctype>

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

constexpr std::uint64_t kMaxSpi = 0xffffffffu;
constexpr std::int64_t kMaxPort = 65535;

int HexDigitValue(char c) {
    if (c >= '0' && c <= '9') return c - '0';
    if (c >= 'a' && c <= 'f') return c - 'a' + 10;
    if (c >= 'A' && c <= 'F') return c - 'A' + 10;
    return -1;
}

}  // namespace

std::optional<std::uint32_t> ParseSpi(const std::string& text) {
    std::size_t at = 0;
    while (at < text.size() && std::isspace(static_cast<unsigned char>(text[at]))) ++at;
    // A plus sign is harmless; a minus sign would turn a small number into a
    // huge one when read as unsigned, so it is refused.
    if (at < text.size() && text[at] == '+') ++at;
    // "0x" counts as a prefix only when a digit follows it; "0x" alone, or
    // "0xg", is the number 0 followed by text that is not read.
    if (at + 2 < text.size() && text[at] == '0' && (text[at + 1] == 'x' || text[at + 1] == 'X') &&
        HexDigitValue(text[at + 2]) >= 0) {
        at += 2;
    }
    std::uint64_t value = 0;
    std::size_t digits = 0;
    for (; at < text.size(); ++at, ++digits) {
        const int digit = HexDigitValue(text[at]);
        if (digit < 0) break;
        value = value * 16 + static_cast<std::uint64_t>(digit);
        if (value > kMaxSpi) return std::nullopt;
    }
    if (digits == 0) return std::nullopt;
    return static_cast<std::uint32_t>(value);
}

std::optional<std::uint32_t> ReadSpi(const CallSpec::Input& input, CallSpec::Output& output) {
    const std::string text = input.GetString("sa-spi");
    std::optional<std::uint32_t> spi = ParseSpi(text);
    if (!spi) output.SetError("Check the input value for '--sa-spi'. Should be hex integer. Got " + text);
    return spi;
}

HostCtl::Network::Ipv6Address SaEndAddress(const std::string& text) {
    return HostCtl::Network::Ipv6Address(text == "any" ? std::string("::") : text);
}

std::optional<int> ReadPort(const CallSpec::Input& input, const std::string& name, CallSpec::Output& output) {
    const std::int64_t port = input.GetInt(name);
    if (port < 0 || port > kMaxPort) {
        output.SetError("Check the input value for '--" + name + "'. Should be in range 0-65535. Got " +
                        input.GetString(name));
        return std::nullopt;
    }
    return static_cast<int>(port);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
