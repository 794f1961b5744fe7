// The stored records of kernel IP interfaces and netstack instances.
// Defaults are the member initialisers; docs/host-profile.md describes the
// same fields for profile writers.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "hostctl/network/ip/NetstackInstance.h"
#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

// One IPv6 address of an interface: "address/prefix" with its type and state
// as words ("static", "autoconf", "dhcp"; "preferred", "tentative",
// "duplicated", "deprecated").
struct Ipv6AddressRecord {
    std::string address;
    std::string type = "static";
    std::string status = "preferred";
};

struct InterfaceRecord {
    static constexpr const char* kSection = Store::Section::kInterfaces;

    std::string name;
    std::string netstack;
    // The connection point: at most one kind is set.
    std::string portgroup;
    std::string dvswitch;  // with dvPortId
    std::string dvPortId;
    std::string opaqueNetworkId;  // with the three below
    std::string opaqueNetworkType;
    std::string externalId;
    std::string opaqueSwitch;
    std::int64_t portId = 0;
    std::string mac = "00:00:00:00:00:00";
    int mtu = 1500;
    int tsoMss = 65535;
    bool enabled = true;
    std::string ipv4Mode = "none";  // "static", "dhcp" or "none"
    std::string ipv4Address = "0.0.0.0";
    std::string ipv4Netmask = "0.0.0.0";
    bool dhcpDns = false;
    bool ipv6Dhcp = false;
    bool ipv6RouterAdv = false;
    std::vector<Ipv6AddressRecord> ipv6Addresses;
    std::vector<std::string> tags;  // tag names, in the order they were added
};

struct NetstackRecord {
    static constexpr const char* kSection = Store::Section::kNetstacks;

    std::string key;
    std::optional<std::string> name;  // unset: the key
    int state = HostCtl::Network::NetstackInstance::STATE_IN_KERNEL;
    std::int64_t maxConnections = HostCtl::Network::NetstackInstance::DEFAULT_MAX_CONNECTIONS;
    // Unset: the configured value while the instance is in the kernel, else
    // none (0, false).
    std::optional<std::int64_t> currentMaxConnections;
    std::string ccAlgorithm = "newreno";
    bool ipv6Enabled = true;
    std::optional<bool> currentIpv6Enabled;
    // The configured default gateways, canonical address text; "" for none.
    std::string ipv4Gateway;
    std::string ipv6Gateway;
    // The resolver's servers (canonical address text) and search domains,
    // each in the order they are used.
    std::vector<std::string> dnsServers;
    std::vector<std::string> searchDomains;

    std::string DisplayName() const { return name ? *name : key; }
    bool InKernel() const { return state == HostCtl::Network::NetstackInstance::STATE_IN_KERNEL; }
    std::int64_t CurrentMaxConnections() const {
        return currentMaxConnections ? *currentMaxConnections : (InKernel() ? maxConnections : 0);
    }
    bool CurrentIpv6Enabled() const { return currentIpv6Enabled ? *currentIpv6Enabled : (InKernel() && ipv6Enabled); }
};

// One route of a netstack; both families share the collection and the
// network text tells them apart (':' means IPv6). Network and gateway are
// canonical text, as the key joins them.
struct RouteRecord {
    static constexpr const char* kSection = Store::Section::kRoutes;

    std::string netstack;
    std::string network;
    std::string gateway;
    std::string interfaceName;
    std::string source = "MANUAL";

    bool IsIpv6() const { return network.find(':') != std::string::npos; }
};

// One neighbor cache entry; the family is the address's.
struct NeighborRecord {
    static constexpr const char* kSection = Store::Section::kNeighbors;

    std::string netstack;
    std::string interfaceName;
    std::string address;
    std::string mac;
    std::int64_t expiry = 0;
    std::string type = "Dynamic";
    // IPv6 only; unset reads as "Reachable".
    std::optional<std::string> state;

    bool IsIpv6() const { return address.find(':') != std::string::npos; }
};

// One open endpoint: `proto` is "tcp", "udp" or "ip"; `state` a TCP state
// word ("" for UDP and raw IP).
struct ConnectionRecord {
    static constexpr const char* kSection = Store::Section::kConnections;

    std::string netstack;
    std::string proto;
    std::string localAddress = "0.0.0.0";
    std::int64_t localPort = 0;
    std::string foreignAddress = "0.0.0.0";
    std::int64_t foreignPort = 0;
    std::uint32_t recvQ = 0;
    std::uint32_t sendQ = 0;
    std::string state;
    std::uint32_t worldId = 0;
    std::string ccAlgorithm;
};

}  // namespace Detail
}  // namespace PldCtl
