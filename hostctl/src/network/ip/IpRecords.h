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

    std::string DisplayName() const { return name ? *name : key; }
    bool InKernel() const { return state == HostCtl::Network::NetstackInstance::STATE_IN_KERNEL; }
    std::int64_t CurrentMaxConnections() const {
        return currentMaxConnections ? *currentMaxConnections : (InKernel() ? maxConnections : 0);
    }
    bool CurrentIpv6Enabled() const { return currentIpv6Enabled ? *currentIpv6Enabled : (InKernel() && ipv6Enabled); }
};

}  // namespace Detail
}  // namespace PldCtl
