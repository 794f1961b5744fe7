// The collections and singletons a host is made of. Adding one here adds a
// table to new stores; docs/host-profile.md describes the objects' fields.
#include <stdexcept>

#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Store {

const std::vector<CollectionInfo>& Collections() {
    static const std::vector<CollectionInfo> collections = {
        // Physical NICs with their driver data, offloads, SR-IOV functions.
        {"nics", {"name"}, nullptr, nullptr},
        // Standard switches with their uplinks and policies.
        {"vswitches", {"name"}, nullptr, nullptr, {"numPorts"}},
        // Port groups of standard switches, each with its own policies.
        {"portgroups", {"name"}, "vswitch", "vswitches"},
        // Distributed switches with their uplinks and LACP data.
        {"dvswitches", {"name"}, nullptr, nullptr, {"numPorts"}},
        {"dvports", {"dvswitch", "id"}, "dvswitch", "dvswitches"},
        // Network stack instances with their DNS and gateway settings.
        {"netstacks", {"key"}, nullptr, nullptr},
        // Kernel IP interfaces (pld0 ...).
        {"interfaces", {"name"}, "netstack", "netstacks"},
        {"routes", {"netstack", "network", "gateway"}, "netstack", "netstacks"},
        {"neighbors", {"netstack", "interface", "address"}, "netstack", "netstacks"},
        {"connections",
         {"netstack", "proto", "localAddress", "localPort", "foreignAddress", "foreignPort"},
         "netstack",
         "netstacks"},
        // Running worlds (virtual machines and host processes).
        {"worlds", {"id"}, nullptr, nullptr},
        // Virtual ports of standard and distributed switches; the owner is the
        // port set (either kind), so it is not checked against one section.
        {"ports", {"id"}, "portset", nullptr, {"client", "portgroup", "type"}},
        {"firewallRulesets", {"name"}, nullptr, nullptr},
        {"ipsecSAs", {"name"}, nullptr, nullptr},
        {"ipsecSPs", {"name"}, nullptr, nullptr},
        // Commands the host was asked to run (init scripts), in order.
        {"execLog", {}, nullptr, nullptr},
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
    static const std::vector<std::string> singletons = {"system", "firewall", "ipsec"};
    return singletons;
}

}  // namespace Store
}  // namespace PldCtl
