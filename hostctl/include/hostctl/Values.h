// Network value types of the host-control library: IP addresses, IP networks
// and MAC addresses.
//
// They are small copyable values. Each one is made from text, checks text
// without throwing (IsValid..., static), and prints itself in one canonical
// form, so that two spellings of the same value always print the same and
// text can be compared after a round trip. Text that does not parse throws
// HostCtl::Lib::HostCtlException with a message naming that text.
#pragma once

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include "hostctl/Export.h"

namespace HostCtl {
namespace Network {

// What an IPv4 and an IPv6 address have in common, so that one list (the
// name servers of a resolver, for instance) can hold either.
class HOSTCTL_EXPORT IpAddress {
public:
    enum class Family { Ipv4, Ipv6 };

    virtual ~IpAddress();

    virtual Family GetFamily() const = 0;
    virtual std::string GetStringAddress() const = 0;
    virtual std::unique_ptr<IpAddress> Clone() const = 0;

    bool IsIpv4() const { return GetFamily() == Family::Ipv4; }
    bool IsIpv6() const { return GetFamily() == Family::Ipv6; }

    // Reads an address of either family, trying IPv4 first; throws when the
    // text is neither.
    static std::unique_ptr<IpAddress> FromString(const std::string& text);

protected:
    // Only the concrete types copy themselves, so that a copy through a base
    // reference cannot slice.
    IpAddress() = default;
    IpAddress(const IpAddress&) = default;
    IpAddress& operator=(const IpAddress&) = default;
};

class HOSTCTL_EXPORT Ipv4Address : public IpAddress {
public:
    // 0.0.0.0: the library's "no address".
    Ipv4Address() = default;
    // Dotted quad only: four decimal parts 0-255, no leading zeros (01 could
    // be read as octal), no blanks.
    explicit Ipv4Address(const std::string& text);
    // A number in host byte order: 0xC0000201 is 192.0.2.1.
    explicit Ipv4Address(uint32_t hostOrder) : value_(hostOrder) {}

    static bool IsValidAddress(const std::string& text);

    // False for 0.0.0.0, which the library uses to mean "not configured".
    bool IsSet() const { return value_ != 0; }
    uint32_t ToUint32() const { return value_; }

    Family GetFamily() const override { return Family::Ipv4; }
    std::string GetStringAddress() const override;
    std::unique_ptr<IpAddress> Clone() const override;

    bool operator==(const Ipv4Address& other) const { return value_ == other.value_; }
    bool operator!=(const Ipv4Address& other) const { return value_ != other.value_; }
    bool operator<(const Ipv4Address& other) const { return value_ < other.value_; }

private:
    uint32_t value_ = 0;
};

class HOSTCTL_EXPORT Ipv6Address : public IpAddress {
public:
    using Bytes = std::array<uint8_t, 16>;

    // ::, the library's "no address".
    Ipv6Address() = default;
    // Any form the standard text syntax allows, including an embedded IPv4
    // tail; a zone suffix ("%eth0") and blanks are refused.
    explicit Ipv6Address(const std::string& text);
    explicit Ipv6Address(const Bytes& bytes) : bytes_(bytes) {}

    static bool IsValidAddress(const std::string& text);

    bool IsSet() const { return !IsUnspecified(); }
    bool IsUnspecified() const { return bytes_ == Bytes{}; }
    // fe80::/10.
    bool IsLinkLocal() const { return bytes_[0] == 0xfe && (bytes_[1] & 0xc0) == 0x80; }
    const Bytes& GetBytes() const { return bytes_; }

    Family GetFamily() const override { return Family::Ipv6; }
    // The canonical form of RFC 5952: lower case, no leading zeros, the
    // longest run of two or more zero fields (the first of equal runs) written
    // "::", and IPv4-mapped addresses with a dotted tail.
    std::string GetStringAddress() const override;
    std::unique_ptr<IpAddress> Clone() const override;

    bool operator==(const Ipv6Address& other) const { return bytes_ == other.bytes_; }
    bool operator!=(const Ipv6Address& other) const { return bytes_ != other.bytes_; }
    bool operator<(const Ipv6Address& other) const { return bytes_ < other.bytes_; }

private:
    Bytes bytes_{};
};

// An IPv4 address with a prefix length: a route's destination, a firewall
// range, an interface's address with its netmask.
class HOSTCTL_EXPORT Ipv4Network {
public:
    // 0.0.0.0/0, the whole address space.
    Ipv4Network() = default;
    // "address/prefix" (0-32, decimal, no leading zeros) or
    // "address/netmask" with a contiguous dotted netmask.
    explicit Ipv4Network(const std::string& text);
    // Throws when the prefix length is outside 0-32.
    Ipv4Network(const Ipv4Address& address, int prefixLength);

    static bool IsValidAddressAndNetmask(const std::string& text);
    // True when the mask's one bits are all on the left (255.255.240.0).
    static bool IsValidNetmask(const Ipv4Address& mask);
    // Throws when the prefix length is outside 0-32.
    static Ipv4Address NetmaskFromNumber(int prefixLength);
    // Throws when the mask is not contiguous.
    static int PrefixFromNetmask(const Ipv4Address& mask);

    // The address as it was given, host bits included.
    const Ipv4Address& GetNetwork() const { return address_; }
    Ipv4Address GetNetmask() const { return NetmaskFromNumber(prefix_); }
    int GetPrefixLength() const { return prefix_; }
    std::string GetStringAddress() const;

    // True when no bit beyond the prefix is set (192.0.2.0/24, not 192.0.2.1/24).
    bool IsNetworkAddress() const { return Masked() == *this; }
    // The same network with the host bits cleared.
    Ipv4Network Masked() const;

    bool operator==(const Ipv4Network& other) const;
    bool operator!=(const Ipv4Network& other) const { return !(*this == other); }
    bool operator<(const Ipv4Network& other) const;

private:
    Ipv4Address address_;
    int prefix_ = 0;
};

// An IPv6 address with its prefix length. As an interface's address it also
// carries the type and state the IP stack reports for it; they describe the
// address's life on the interface, not which address it is, so comparisons
// ignore them.
class HOSTCTL_EXPORT Ipv6Network {
public:
    // Values of GetIpv6AddressType.
    static constexpr int TYPE_STATIC = 0;
    static constexpr int TYPE_AUTOCONF = 7;
    static constexpr int TYPE_DHCP = 9;
    // Values of GetIpv6AddressStatus; any value but the last three means
    // the address is preferred.
    static constexpr int STATUS_PREFERRED = 0;
    static constexpr int STATUS_TENTATIVE = 2;
    static constexpr int STATUS_DUPLICATED = 3;
    static constexpr int STATUS_DEPRECATED = 5;

    // ::/0, the whole address space.
    Ipv6Network() = default;
    // "address/prefix", the prefix 0-128, decimal, no leading zeros.
    explicit Ipv6Network(const std::string& text);
    // Throws when the prefix length is outside 0-128.
    Ipv6Network(const Ipv6Address& address, int prefixLength);

    static bool IsValidAddressAndNetmask(const std::string& text);
    // The mask in address form: 64 gives ffff:ffff:ffff:ffff::. Throws when
    // the prefix length is outside 0-128.
    static Ipv6Address NetmaskFromNumber(int prefixLength);

    // The address as it was given, host bits included.
    const Ipv6Address& GetAddress() const { return address_; }
    // The prefix length (not a mask: IPv6 masks are always written that way).
    int GetNetmask() const { return prefix_; }
    int GetPrefixLength() const { return prefix_; }
    std::string GetStringAddress() const;

    int GetIpv6AddressType() const { return type_; }
    void SetIpv6AddressType(int type) { type_ = type; }
    int GetIpv6AddressStatus() const { return status_; }
    void SetIpv6AddressStatus(int status) { status_ = status; }

    bool IsNetworkAddress() const { return Masked() == *this; }
    // The same network with the host bits cleared (type and status kept).
    Ipv6Network Masked() const;

    bool operator==(const Ipv6Network& other) const;
    bool operator!=(const Ipv6Network& other) const { return !(*this == other); }
    bool operator<(const Ipv6Network& other) const;

private:
    Ipv6Address address_;
    int prefix_ = 0;
    int type_ = TYPE_STATIC;
    int status_ = STATUS_PREFERRED;
};

class HOSTCTL_EXPORT MacAddress {
public:
    using Bytes = std::array<uint8_t, 6>;

    // 00:00:00:00:00:00, the library's "no address".
    MacAddress() = default;
    // Six parts of exactly two hex digits, any case, all separated by ':' or
    // all by '-'.
    explicit MacAddress(const std::string& text);
    explicit MacAddress(const Bytes& bytes) : bytes_(bytes) {}

    static bool IsValid(const std::string& text);

    bool IsSet() const { return bytes_ != Bytes{}; }
    const Bytes& GetBytes() const { return bytes_; }
    // Lower case, colon-separated: 00:50:56:aa:0b:1c.
    std::string GetStringAddress() const;

    bool operator==(const MacAddress& other) const { return bytes_ == other.bytes_; }
    bool operator!=(const MacAddress& other) const { return bytes_ != other.bytes_; }
    bool operator<(const MacAddress& other) const { return bytes_ < other.bytes_; }

private:
    Bytes bytes_{};
};

}  // namespace Network
}  // namespace HostCtl
