#include "hostctl/Values.h"

#include <arpa/inet.h>

#include <algorithm>
#include <bitset>
#include <optional>
#include <string_view>
#include <tuple>
#include <utility>

#include "hostctl/Lib.h"

namespace HostCtl {
namespace Network {

namespace {

using Lib::HostCtlException;

// Every parser below returns nothing for bad text, so the IsValid... checks
// and the constructors share one path; only the constructors turn a failure
// into an exception.
template <typename T>
T ValueOrThrow(std::optional<T> value, const char* what, const std::string& text) {
    if (!value) {
        throw HostCtlException(std::string("Invalid ") + what + ": '" + text + "'");
    }
    return *std::move(value);
}

int CheckedPrefix(int prefixLength, int maximum, const char* family) {
    if (prefixLength < 0 || prefixLength > maximum) {
        throw HostCtlException(std::string("Invalid ") + family + " prefix length: " + std::to_string(prefixLength));
    }
    return prefixLength;
}

template <int AddressFamily, std::size_t Size>
std::optional<std::array<uint8_t, Size>> ParseWithPton(std::string_view text) {
    // inet_pton reads a C string: an embedded NUL would silently cut the
    // text short and let whatever follows it pass unchecked.
    std::array<uint8_t, Size> bytes{};
    if (text.find('\0') != std::string_view::npos ||
        inet_pton(AddressFamily, std::string(text).c_str(), bytes.data()) != 1) {
        return std::nullopt;
    }
    return bytes;
}

template <int AddressFamily, std::size_t Size>
std::string FormatWithNtop(const std::array<uint8_t, Size>& bytes) {
    char text[INET6_ADDRSTRLEN] = {};
    inet_ntop(AddressFamily, bytes.data(), text, sizeof text);
    return text;
}

// Exactly four decimal parts of 0-255 without leading zeros, the spelling
// the C library's reader insists on too; other spellings the classic
// resolver functions take (hex, octal, fewer parts) are refused. Read
// directly: listings parse tens of thousands of stored addresses.
std::optional<Ipv4Address> ParseIpv4(std::string_view text) {
    uint32_t value = 0;
    std::size_t pos = 0;
    for (int part = 0; part < 4; ++part) {
        if (part > 0) {
            if (pos >= text.size() || text[pos] != '.') return std::nullopt;
            ++pos;
        }
        const std::size_t start = pos;
        unsigned octet = 0;
        while (pos < text.size() && text[pos] >= '0' && text[pos] <= '9' && pos - start < 3) {
            octet = octet * 10 + static_cast<unsigned>(text[pos] - '0');
            ++pos;
        }
        const std::size_t digits = pos - start;
        if (digits == 0 || octet > 255 || (digits > 1 && text[start] == '0')) return std::nullopt;
        value = value << 8 | octet;
    }
    if (pos != text.size()) return std::nullopt;
    return Ipv4Address(value);
}

std::optional<Ipv6Address> ParseIpv6(std::string_view text) {
    const auto bytes = ParseWithPton<AF_INET6, 16>(text);
    return bytes ? std::optional<Ipv6Address>(Ipv6Address(*bytes)) : std::nullopt;
}

// A prefix length in plain decimal: "0", or digits without a leading zero,
// so that every length has exactly one spelling.
std::optional<int> ParsePrefix(std::string_view text, int maximum) {
    if (text.empty() || text.size() > 3 || (text.size() > 1 && text[0] == '0')) {
        return std::nullopt;
    }
    int value = 0;
    for (const char c : text) {
        if (c < '0' || c > '9') {
            return std::nullopt;
        }
        value = value * 10 + (c - '0');
    }
    return value <= maximum ? std::optional<int>(value) : std::nullopt;
}

// "address/suffix" split at the first slash; a second slash stays in the
// suffix, where it fails to parse.
std::optional<std::pair<std::string_view, std::string_view>> SplitAtSlash(std::string_view text) {
    const auto slash = text.find('/');
    if (slash == std::string_view::npos) {
        return std::nullopt;
    }
    return std::make_pair(text.substr(0, slash), text.substr(slash + 1));
}

std::string WithPrefix(const IpAddress& address, int prefixLength) {
    return address.GetStringAddress() + "/" + std::to_string(prefixLength);
}

bool IsContiguousMask(uint32_t mask) {
    // The zero bits of a contiguous mask are a run at the right: adding one
    // to that run carries past all of it, leaving no bit in common.
    const uint32_t hostBits = ~mask;
    return (hostBits & (hostBits + 1)) == 0;
}

std::optional<Ipv4Network> ParseIpv4Network(const std::string& text) {
    const auto parts = SplitAtSlash(text);
    const auto address = parts ? ParseIpv4(parts->first) : std::nullopt;
    if (!address) {
        return std::nullopt;
    }
    if (const auto prefix = ParsePrefix(parts->second, 32)) {
        return Ipv4Network(*address, *prefix);
    }
    const auto mask = ParseIpv4(parts->second);
    if (!mask || !Ipv4Network::IsValidNetmask(*mask)) {
        return std::nullopt;
    }
    return Ipv4Network(*address, Ipv4Network::PrefixFromNetmask(*mask));
}

std::optional<Ipv6Network> ParseIpv6Network(const std::string& text) {
    const auto parts = SplitAtSlash(text);
    const auto address = parts ? ParseIpv6(parts->first) : std::nullopt;
    const auto prefix = parts ? ParsePrefix(parts->second, 128) : std::nullopt;
    if (!address || !prefix) {
        return std::nullopt;
    }
    return Ipv6Network(*address, *prefix);
}

int HexDigit(char c) {
    if (c >= '0' && c <= '9') return c - '0';
    if (c >= 'a' && c <= 'f') return c - 'a' + 10;
    if (c >= 'A' && c <= 'F') return c - 'A' + 10;
    return -1;
}

std::optional<MacAddress::Bytes> ParseMac(const std::string& text) {
    MacAddress::Bytes bytes{};
    constexpr std::size_t partWidth = 3;  // two digits and a separator
    if (text.size() != bytes.size() * partWidth - 1) {
        return std::nullopt;
    }
    const char separator = text[2];
    if (separator != ':' && separator != '-') {
        return std::nullopt;
    }
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        const std::size_t at = i * partWidth;
        const int high = HexDigit(text[at]);
        const int low = HexDigit(text[at + 1]);
        if (high < 0 || low < 0 || (i > 0 && text[at - 1] != separator)) {
            return std::nullopt;
        }
        bytes[i] = static_cast<uint8_t>(high << 4 | low);
    }
    return bytes;
}

}  // namespace

// ---- IpAddress ----

IpAddress::~IpAddress() = default;

std::unique_ptr<IpAddress> IpAddress::FromString(const std::string& text) {
    if (const auto v4 = ParseIpv4(text)) {
        return v4->Clone();
    }
    return ValueOrThrow(ParseIpv6(text), "IP address", text).Clone();
}

// ---- Ipv4Address ----

Ipv4Address::Ipv4Address(const std::string& text) : Ipv4Address(ValueOrThrow(ParseIpv4(text), "IPv4 address", text)) {}

bool Ipv4Address::IsValidAddress(const std::string& text) {
    return ParseIpv4(text).has_value();
}

std::string Ipv4Address::GetStringAddress() const {
    // Written out directly: listings print tens of thousands of addresses,
    // and the formatted conversion of the C library costs several times
    // more for the same four decimal numbers.
    char text[16];
    char* end = text;
    for (int shift = 24; shift >= 0; shift -= 8) {
        const unsigned octet = (value_ >> shift) & 0xFFu;
        if (octet >= 100) *end++ = static_cast<char>('0' + octet / 100);
        if (octet >= 10) *end++ = static_cast<char>('0' + octet / 10 % 10);
        *end++ = static_cast<char>('0' + octet % 10);
        if (shift > 0) *end++ = '.';
    }
    return std::string(text, end);
}

std::unique_ptr<IpAddress> Ipv4Address::Clone() const {
    return std::make_unique<Ipv4Address>(*this);
}

// ---- Ipv6Address ----

Ipv6Address::Ipv6Address(const std::string& text) : Ipv6Address(ValueOrThrow(ParseIpv6(text), "IPv6 address", text)) {}

bool Ipv6Address::IsValidAddress(const std::string& text) {
    return ParseIpv6(text).has_value();
}

// glibc's writer follows RFC 5952 already, including the choice of the first
// of two equally long zero runs and leaving a single zero field alone.
std::string Ipv6Address::GetStringAddress() const {
    return FormatWithNtop<AF_INET6>(bytes_);
}

std::unique_ptr<IpAddress> Ipv6Address::Clone() const {
    return std::make_unique<Ipv6Address>(*this);
}

// ---- Ipv4Network ----

Ipv4Network::Ipv4Network(const std::string& text)
    : Ipv4Network(ValueOrThrow(ParseIpv4Network(text), "IPv4 network", text)) {}

Ipv4Network::Ipv4Network(const Ipv4Address& address, int prefixLength)
    : address_(address), prefix_(CheckedPrefix(prefixLength, 32, "IPv4")) {}

bool Ipv4Network::IsValidAddressAndNetmask(const std::string& text) {
    return ParseIpv4Network(text).has_value();
}

bool Ipv4Network::IsValidNetmask(const Ipv4Address& mask) {
    return IsContiguousMask(mask.ToUint32());
}

Ipv4Address Ipv4Network::NetmaskFromNumber(int prefixLength) {
    CheckedPrefix(prefixLength, 32, "IPv4");
    // Shifting a 32-bit value by 32 is undefined, hence the special case.
    return Ipv4Address(prefixLength == 0 ? 0u : ~uint32_t{0} << (32 - prefixLength));
}

int Ipv4Network::PrefixFromNetmask(const Ipv4Address& mask) {
    if (!IsValidNetmask(mask)) {
        throw HostCtlException("Invalid IPv4 netmask: '" + mask.GetStringAddress() + "'");
    }
    return static_cast<int>(std::bitset<32>(mask.ToUint32()).count());
}

std::string Ipv4Network::GetStringAddress() const {
    return WithPrefix(address_, prefix_);
}

Ipv4Network Ipv4Network::Masked() const {
    return Ipv4Network(Ipv4Address(address_.ToUint32() & GetNetmask().ToUint32()), prefix_);
}

bool Ipv4Network::operator==(const Ipv4Network& other) const {
    return address_ == other.address_ && prefix_ == other.prefix_;
}

bool Ipv4Network::operator<(const Ipv4Network& other) const {
    return std::tie(address_, prefix_) < std::tie(other.address_, other.prefix_);
}

// ---- Ipv6Network ----

Ipv6Network::Ipv6Network(const std::string& text)
    : Ipv6Network(ValueOrThrow(ParseIpv6Network(text), "IPv6 network", text)) {}

Ipv6Network::Ipv6Network(const Ipv6Address& address, int prefixLength)
    : address_(address), prefix_(CheckedPrefix(prefixLength, 128, "IPv6")) {}

bool Ipv6Network::IsValidAddressAndNetmask(const std::string& text) {
    return ParseIpv6Network(text).has_value();
}

Ipv6Address Ipv6Network::NetmaskFromNumber(int prefixLength) {
    CheckedPrefix(prefixLength, 128, "IPv6");
    Ipv6Address::Bytes mask{};
    for (std::size_t i = 0; i < mask.size(); ++i) {
        const int bits = std::min(std::max(prefixLength - static_cast<int>(i) * 8, 0), 8);
        mask[i] = static_cast<uint8_t>(0xff00 >> bits);
    }
    return Ipv6Address(mask);
}

std::string Ipv6Network::GetStringAddress() const {
    return WithPrefix(address_, prefix_);
}

Ipv6Network Ipv6Network::Masked() const {
    Ipv6Address::Bytes bytes = address_.GetBytes();
    const Ipv6Address mask = NetmaskFromNumber(prefix_);
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        bytes[i] &= mask.GetBytes()[i];
    }
    Ipv6Network masked = *this;
    masked.address_ = Ipv6Address(bytes);
    return masked;
}

bool Ipv6Network::operator==(const Ipv6Network& other) const {
    return address_ == other.address_ && prefix_ == other.prefix_;
}

bool Ipv6Network::operator<(const Ipv6Network& other) const {
    return std::tie(address_, prefix_) < std::tie(other.address_, other.prefix_);
}

// ---- MacAddress ----

MacAddress::MacAddress(const std::string& text) : bytes_(ValueOrThrow(ParseMac(text), "MAC address", text)) {}

bool MacAddress::IsValid(const std::string& text) {
    return ParseMac(text).has_value();
}

std::string MacAddress::GetStringAddress() const {
    static const char digits[] = "0123456789abcdef";
    std::string text;
    for (const uint8_t byte : bytes_) {
        if (!text.empty()) {
            text += ':';
        }
        text += digits[byte >> 4];
        text += digits[byte & 0x0f];
    }
    return text;
}

}  // namespace Network
}  // namespace HostCtl
