// The stored record of a port of a standard or distributed switch, with its
// counters and traffic filters. Defaults are the member initialisers;
// docs/host-profile.md describes the same fields for profile writers.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

// The packets of one VLAN seen on an uplink port.
struct VlanStatsRecord {
    std::int64_t vlanId = 0;
    std::uint64_t rxPackets = 0;
    std::uint64_t txPackets = 0;
};

// A port's traffic counters, seen from its client.
struct PortStatsRecord {
    std::uint64_t rxPackets = 0;
    std::uint64_t txPackets = 0;
    std::uint64_t rxBytes = 0;
    std::uint64_t txBytes = 0;
    std::uint64_t rxBroadcast = 0;
    std::uint64_t txBroadcast = 0;
    std::uint64_t rxMulticast = 0;
    std::uint64_t txMulticast = 0;
    std::uint64_t rxDropped = 0;
    std::uint64_t txDropped = 0;
};

// A traffic filter attached to a port.
struct FilterRecord {
    static constexpr const char* kTransmit = "transmit";

    std::string name;
    std::string key;  // orders the filters of a direction
    bool present = true;
    std::string direction = "receive";  // "receive" or "transmit"
    bool extended = false;
    std::uint64_t packetsIn = 0;
    std::uint64_t packetsOut = 0;
    std::uint64_t packetsDropped = 0;
    std::uint64_t packetsFiltered = 0;
    std::uint64_t packetsFaulted = 0;
    std::uint64_t packetsQueued = 0;
    std::uint64_t packetsInjected = 0;
    std::uint64_t packetErrors = 0;
};

// A port of a standard or distributed switch, keyed by its id.
struct PortRecord {
    static constexpr const char* kSection = Store::Section::kPorts;
    // Fields the store counts ports by without decoding them.
    static constexpr const char* kClientField = "client";
    static constexpr const char* kPortGroupField = "portgroup";
    static constexpr const char* kTypeField = "type";
    static constexpr const char* kUplinkType = "uplink";

    std::int64_t id = 0;
    std::string portset;
    std::string type = "vm";  // "vm", "kernel", "internal" or "uplink"
    std::string client;       // "" for a free port
    std::string portgroup;
    std::string dvPortId;  // the DV port of a port on a distributed switch
    std::uint64_t worldId = 0;
    std::string mac = "00:00:00:00:00:00";
    std::string ip = "0.0.0.0";
    std::string teamUplink;
    PortStatsRecord stats;
    std::vector<FilterRecord> filters;
    // Uplink ports: per-VLAN counting, and its counters while it is on.
    bool vlanStatsEnabled = false;
    std::vector<VlanStatsRecord> vlanStats;
};

}  // namespace Detail
}  // namespace PldCtl
