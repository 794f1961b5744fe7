// The names of the host's collections and singletons: each is both a section
// of a host profile and a table of the store. Collections.cpp says what each
// collection is keyed and owned by; docs/host-profile.md describes the fields.
#pragma once

namespace PldCtl {
namespace Store {
namespace Section {

inline constexpr const char* kNics = "nics";
inline constexpr const char* kVswitches = "vswitches";
inline constexpr const char* kPortGroups = "portgroups";
inline constexpr const char* kDvSwitches = "dvswitches";
inline constexpr const char* kDvPorts = "dvports";
inline constexpr const char* kNetstacks = "netstacks";
inline constexpr const char* kInterfaces = "interfaces";
inline constexpr const char* kRoutes = "routes";
inline constexpr const char* kNeighbors = "neighbors";
inline constexpr const char* kConnections = "connections";
inline constexpr const char* kWorlds = "worlds";
inline constexpr const char* kPorts = "ports";
inline constexpr const char* kFirewallRulesets = "firewallRulesets";
inline constexpr const char* kIpsecSAs = "ipsecSAs";
inline constexpr const char* kIpsecSPs = "ipsecSPs";
inline constexpr const char* kExecLog = "execLog";

// The singletons, one JSON object each.
inline constexpr const char* kSystem = "system";
inline constexpr const char* kFirewall = "firewall";
inline constexpr const char* kIpsec = "ipsec";

}  // namespace Section
}  // namespace Store
}  // namespace PldCtl
