// The stored records of standard switching: switches, their port groups and
// policies; the ports of switches are in network/port/PortRecords.h.
// Defaults are the member initialisers; docs/host-profile.md describes the
// same fields for profile writers.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "hostctl/network/vswitch/Policy.h"
#include "hostctl/network/vswitch/VirtualSwitch.h"
#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"
#include "network/port/PortRecords.h"

namespace PldCtl {
namespace Detail {

// A stored policy object. A field that is set is one the owner sets itself:
// a switch's policies normally set every field, a port group's only those it
// overrides.
struct TeamingRecord {
    std::optional<std::string> loadBalancing;  // a word of kLoadBalancingWords
    std::optional<bool> beacon;                // failures detected by beacon probing
    std::optional<bool> notifySwitches;
    std::optional<bool> rollingRestoration;
    std::optional<std::vector<std::string>> uplinkOrder;
    std::optional<int> maxActive;
};

struct SecurityRecord {
    std::optional<bool> allowPromiscuous;
    std::optional<bool> allowMacChange;
    std::optional<bool> allowForgedTransmits;
};

struct ShapingRecord {
    std::optional<bool> enabled;
    std::optional<std::uint64_t> averageBps;
    std::optional<std::uint64_t> peakBps;
    std::optional<std::uint64_t> burstBytes;
};

struct BeaconRecord {
    int interval = 1;  // seconds
    int threshold = 3;
};

struct CapabilitiesRecord {
    bool checksumOffload = true;
    bool segmentationOffload = true;
    bool vlanTagging = true;
};

struct VswitchRecord {
    static constexpr const char* kSection = Store::Section::kVswitches;
    // Summed over all switches by the store itself.
    static constexpr const char* kNumPortsField = "numPorts";

    std::string name;
    std::string className = "stdswitch";
    int numPorts = HostCtl::Network::Portset::DEF_NUM_PORTS;
    int mtu = 1500;
    std::string cdp = "listen";
    BeaconRecord beacon;
    std::vector<std::string> uplinks;
    TeamingRecord teaming;
    SecurityRecord security;
    ShapingRecord shaping;
    CapabilitiesRecord capabilities;
};

struct PortGroupRecord {
    static constexpr const char* kSection = Store::Section::kPortGroups;

    std::string name;
    std::string vswitch;
    int vlanId = 0;
    TeamingRecord teaming;
    SecurityRecord security;
    ShapingRecord shaping;
};

// A stored policy as the library's policy type, and back. Reading throws
// HostCtlException for a load-balancing word the library does not know or a
// negative active count.
HostCtl::Network::NicTeamingPolicy ToPolicy(const TeamingRecord& record);
TeamingRecord FromPolicy(const HostCtl::Network::NicTeamingPolicy& policy);
HostCtl::Network::PortSecurityPolicy ToPolicy(const SecurityRecord& record);
SecurityRecord FromPolicy(const HostCtl::Network::PortSecurityPolicy& policy);
HostCtl::Network::ShapingPolicy ToPolicy(const ShapingRecord& record);
ShapingRecord FromPolicy(const HostCtl::Network::ShapingPolicy& policy);

// Where each kind of policy is stored in a switch or port group record.
template <typename Policy>
struct PolicySlot;

template <>
struct PolicySlot<HostCtl::Network::NicTeamingPolicy> {
    template <typename Owner>
    static auto& Of(Owner& owner) {
        return owner.teaming;
    }
};

template <>
struct PolicySlot<HostCtl::Network::PortSecurityPolicy> {
    template <typename Owner>
    static auto& Of(Owner& owner) {
        return owner.security;
    }
};

template <>
struct PolicySlot<HostCtl::Network::ShapingPolicy> {
    template <typename Owner>
    static auto& Of(Owner& owner) {
        return owner.shaping;
    }
};

// The policy a switch or port group holds itself (for a port group, only the
// fields it overrides are set).
template <typename Policy, typename Owner>
Policy OwnPolicy(const Owner& owner) {
    return ToPolicy(PolicySlot<Policy>::Of(owner));
}

// A switch's policy over the defaults, so that a field a hand-written
// profile left out reads as its default.
template <typename Policy>
Policy SwitchPolicy(const VswitchRecord& vswitch) {
    return Policy::GetDefaultPolicy().OverlaidWith(OwnPolicy<Policy>(vswitch));
}

}  // namespace Detail
}  // namespace PldCtl
