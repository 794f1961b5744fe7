#include "network/ip/IpLookup.h"

#include <algorithm>
#include <array>
#include <utility>

#include "Refusals.h"
#include "hostctl/network/ip/PldNic.h"

namespace PldCtl {
namespace Detail {

using HostCtl::Lib::HostCtlException;
using HostCtl::Network::IpConfig;
using HostCtl::Network::Ipv6Network;

namespace {

// The stored words of IPv6 address types and states with their numbers.
constexpr std::array<std::pair<const char*, int>, 3> kIpv6Types = {{
    {"static", Ipv6Network::TYPE_STATIC},
    {"autoconf", Ipv6Network::TYPE_AUTOCONF},
    {"dhcp", Ipv6Network::TYPE_DHCP},
}};
constexpr std::array<std::pair<const char*, int>, 4> kIpv6States = {{
    {"preferred", Ipv6Network::STATUS_PREFERRED},
    {"tentative", Ipv6Network::STATUS_TENTATIVE},
    {"duplicated", Ipv6Network::STATUS_DUPLICATED},
    {"deprecated", Ipv6Network::STATUS_DEPRECATED},
}};

template <std::size_t N>
int NumberOf(const std::array<std::pair<const char*, int>, N>& table, const std::string& word) {
    for (const auto& [name, number] : table) {
        if (word == name) return number;
    }
    return table[0].second;
}

constexpr const char* kStatic = "static";
constexpr const char* kDhcp = "dhcp";
constexpr const char* kNone = "none";

}  // namespace

int InterfaceNumber(const std::string& name) {
    if (name.size() < 4 || name.size() > 6 || name.compare(0, 3, "pld") != 0) return -1;
    const std::string digits = name.substr(3);
    if (digits.size() > 1 && digits[0] == '0') return -1;
    int number = 0;
    for (char c : digits) {
        if (c < '0' || c > '9') return -1;
        number = number * 10 + (c - '0');
    }
    return number <= kMaxInterfaceNumber ? number : -1;
}

std::string JoinedKey(std::initializer_list<std::string> parts) {
    std::string key;
    bool first = true;
    for (const std::string& part : parts) {
        if (!first) key += '|';
        key += part;
        first = false;
    }
    return key;
}

bool IsSingleWord(const std::string& text) {
    if (text.empty()) return false;
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte <= ' ' || byte == 0x7f) return false;
    }
    return true;
}

std::string MissingInterfaceMessage(const std::string& name) {
    return "Interface " + name + " does not exist";
}

std::string MissingNetstackMessage(const std::string& key) {
    return "Netstack instance " + key + " does not exist";
}

StoredObject<InterfaceRecord> RequireInterface(Store::Transaction& t, const std::string& name) {
    std::optional<StoredObject<InterfaceRecord>> stored = Find<InterfaceRecord>(t, name);
    if (!stored) throw HostCtlException(MissingInterfaceMessage(name));
    return std::move(*stored);
}

StoredObject<NetstackRecord> RequireNetstack(Store::Transaction& t, const std::string& key) {
    std::optional<StoredObject<NetstackRecord>> stored = Find<NetstackRecord>(t, key);
    if (!stored) throw HostCtlException(MissingNetstackMessage(key));
    return std::move(*stored);
}

void CheckMtu(std::int64_t mtu, const std::string& name) {
    using HostCtl::Network::PldNic;
    CheckRange("MTU", mtu, name.empty() ? std::string() : "interface " + name, PldNic::MIN_MTU, PldNic::MAX_MTU);
}

IpConfig IpConfigAccess::FromRecord(const InterfaceRecord& record, bool withDhcpDns) {
    IpConfig config;
    if (record.ipv4Mode == kStatic || record.ipv4Mode == kDhcp) {
        config.mode_ = record.ipv4Mode == kDhcp ? IpConfig::IPV4_DHCP : IpConfig::IPV4_STATIC;
        config.ipv4Address_ = HostCtl::Network::Ipv4Address(record.ipv4Address);
        config.ipv4Netmask_ = HostCtl::Network::Ipv4Address(record.ipv4Netmask);
    }
    config.dhcpDns_ = withDhcpDns && record.dhcpDns;
    config.ipv6Dhcp_ = record.ipv6Dhcp;
    config.ipv6RouterAdvertised_ = record.ipv6RouterAdv;
    for (const Ipv6AddressRecord& stored : record.ipv6Addresses) {
        Ipv6Network network(stored.address);
        network.SetIpv6AddressType(NumberOf(kIpv6Types, stored.type));
        network.SetIpv6AddressStatus(NumberOf(kIpv6States, stored.status));
        config.ipv6Networks_.push_back(network);
    }
    return config;
}

void IpConfigAccess::ToRecord(const IpConfig& config, InterfaceRecord& record) {
    switch (config.mode_) {
        case IpConfig::IPV4_STATIC:
            record.ipv4Mode = kStatic;
            break;
        case IpConfig::IPV4_DHCP:
            record.ipv4Mode = kDhcp;
            break;
        case IpConfig::IPV4_NONE:
            record.ipv4Mode = kNone;
            break;
    }
    record.ipv4Address = config.ipv4Address_.GetStringAddress();
    record.ipv4Netmask = config.ipv4Netmask_.GetStringAddress();
    record.dhcpDns = config.dhcpDns_;
    record.ipv6Dhcp = config.ipv6Dhcp_;
    record.ipv6RouterAdv = config.ipv6RouterAdvertised_;
    std::vector<Ipv6AddressRecord> addresses;
    for (const Ipv6Network& network : config.ipv6Networks_) {
        const auto kept =
            std::find_if(record.ipv6Addresses.begin(), record.ipv6Addresses.end(),
                         [&](const Ipv6AddressRecord& stored) { return Ipv6Network(stored.address) == network; });
        if (kept != record.ipv6Addresses.end()) {
            addresses.push_back(*kept);
        } else {
            Ipv6AddressRecord added;
            added.address = network.GetStringAddress();
            addresses.push_back(added);
        }
    }
    record.ipv6Addresses = std::move(addresses);
}

}  // namespace Detail
}  // namespace PldCtl
