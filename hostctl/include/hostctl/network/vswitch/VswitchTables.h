// Tables and messages of standard switching that both the library and its
// callers use: a command offers the words the library stores and reports a
// missing object in the library's words, so the two cannot drift.
#pragma once

#include <array>
#include <cstdint>
#include <string>

#include "hostctl/network/vswitch/Policy.h"

namespace HostCtl {
namespace Network {

// The CDP status words of a standard switch. A word's position is the index
// VirtualSwitch::SetCDPStatus takes.
inline constexpr std::array<const char*, 4> kCdpStatusWords = {"down", "listen", "advertise", "both"};

// The load-balancing words of failover policies, as the host stores them
// and the policy commands show them. (The set commands take words of their
// own, "portid" and "mac" among them, and map them to these types.)
struct LoadBalancingWord {
    TeamPolicyType type;
    const char* word;
};
inline constexpr std::array<LoadBalancingWord, 4> kLoadBalancingWords = {{
    {TEAM_IP_HASH, "iphash"},
    {TEAM_SRC_MAC, "srcmac"},
    {TEAM_PORT_ID, "srcport"},
    {TEAM_EXPLICIT, "explicit"},
}};

// The ports all switches of a host may have together, unless the host's
// system settings say otherwise ("maxPorts").
inline constexpr std::int64_t kMaxHostPorts = 4608;

// The messages for a standard switch or port group the host does not have.
inline std::string UnknownVirtualSwitchMessage(const std::string& name) {
    return "Unable to find virtual switch with the name " + name;
}
inline std::string UnknownPortGroupMessage(const std::string& name) {
    return "Unable to find a port group with the name " + name;
}

}  // namespace Network
}  // namespace HostCtl
