// The collections and singletons a host is made of. Adding one here adds a
// table to new stores; docs/host-profile.md describes the objects' fields.
#include <stdexcept>

#include "hoststore/CollectionNames.h"
#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Store {

const std::vector<CollectionInfo>& Collections() {
    static const std::vector<CollectionInfo> collections = {
        // Physical NICs with their driver data, offloads, SR-IOV functions.
        {Section::kNics, {"name"}, nullptr, nullptr},
        // Standard switches with their uplinks and policies.
        {Section::kVswitches, {"name"}, nullptr, nullptr, {"numPorts"}},
        // Port groups of standard switches, each with its own policies.
        {Section::kPortGroups, {"name"}, "vswitch", Section::kVswitches},
        // Distributed switches with their uplinks and LACP data.
        {Section::kDvSwitches, {"name"}, nullptr, nullptr, {"numPorts"}},
        {Section::kDvPorts, {"dvswitch", "id"}, "dvswitch", Section::kDvSwitches},
        // Network stack instances with their DNS and gateway settings.
        {Section::kNetstacks, {"key"}, nullptr, nullptr},
        // Kernel IP interfaces (pld0 ...).
        {Section::kInterfaces, {"name"}, "netstack", Section::kNetstacks},
        {Section::kRoutes, {"netstack", "network", "gateway"}, "netstack", Section::kNetstacks},
        {Section::kNeighbors, {"netstack", "interface", "address"}, "netstack", Section::kNetstacks},
        {Section::kConnections,
         {"netstack", "proto", "localAddress", "localPort", "foreignAddress", "foreignPort"},
         "netstack",
         Section::kNetstacks},
        // Running worlds (virtual machines and host processes).
        {Section::kWorlds, {"id"}, nullptr, nullptr},
        // Virtual ports of standard and distributed switches; the owner is the
        // port set (either kind), so it is not checked against one section.
        {Section::kPorts, {"id"}, "portset", nullptr, {"client", "portgroup", "type"}},
        {Section::kFirewallRulesets, {"name"}, nullptr, nullptr},
        {Section::kIpsecSAs, {"name"}, nullptr, nullptr},
        {Section::kIpsecSPs, {"name"}, nullptr, nullptr},
        // Commands the host was asked to run (init scripts), in order.
        {Section::kExecLog, {}, nullptr, nullptr},
    };
    return collections;
}

std::string ColumnOf(const CollectionInfo& collection, const std::string& field) {
    for (const char* columnField : collection.columnFields) {
        if (field == columnField) return "\"f_" + field + "\"";
    }
    return std::string();
}

const CollectionInfo& Collection(const std::string& section) {
    for (const auto& c : Collections()) {
        if (section == c.section) return c;
    }
    throw std::invalid_argument("unknown host collection '" + section + "'");
}

const std::vector<std::string>& Singletons() {
    static const std::vector<std::string> singletons = {Section::kSystem, Section::kFirewall, Section::kIpsec};
    return singletons;
}

}  // namespace Store
}  // namespace PldCtl
