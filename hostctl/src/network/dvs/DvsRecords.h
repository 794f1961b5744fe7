// The stored records of distributed switches, their LAGs and their DV
// ports. Defaults are the member initialisers; docs/host-profile.md
// describes the same fields for profile writers.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

// The host's side of a LAG member's LACP session.
struct LacpLocalRecord {
    std::uint16_t adminKey = 0;
    std::uint16_t operKey = 0;
    std::uint16_t portPriority = 0;
    std::uint16_t portNumber = 0;
    std::uint8_t state = 0;  // actor state byte
};

struct LacpPartnerRecord {
    std::string deviceId;
    std::string flags;
    std::uint64_t age = 0;  // seconds
    std::uint16_t operKey = 0;
    std::uint16_t portPriority = 0;
    std::uint16_t portNumber = 0;
    std::uint8_t state = 0;  // partner state byte
};

struct LacpStatsRecord {
    std::uint64_t txLacpdus = 0;
    std::uint64_t rxLacpdus = 0;
    std::uint64_t txErrors = 0;
    std::uint64_t rxErrors = 0;
};

// One NIC of a LAG. `shortTimeout` and the short-timeout bit of
// `local.state` are changed together.
struct LagMemberRecord {
    std::string nic;
    std::string state;
    bool shortTimeout = false;
    LacpLocalRecord local;
    LacpPartnerRecord partner;
    LacpStatsRecord stats;
};

struct LagRecord {
    std::int64_t id = 0;
    std::string name;
    std::string mode = "active";  // "active", "passive" or "none"
    int loadBalance = 0;          // index into the load-balancing table
    std::vector<LagMemberRecord> members;
};

struct DvSwitchRecord {
    static constexpr const char* kSection = Store::Section::kDvSwitches;
    // Summed over all switches by the store itself.
    static constexpr const char* kNumPortsField = "numPorts";

    std::string name;
    std::string uuid;
    std::string className = "dvswitch";
    int numPorts = 128;
    int mtu = 1500;
    std::string cdp = "listen";
    int beaconTimeout = -1;  // seconds; -1 while beaconing is off
    bool orvixBranded = true;
    std::vector<std::string> uplinks;
    std::vector<LagRecord> lags;
};

// A port of a distributed switch, keyed by its switch and its id.
struct DvPortRecord {
    static constexpr const char* kSection = Store::Section::kDvPorts;

    std::string dvswitch;
    std::string id;
    std::string portgroupId;
    std::uint32_t connectionId = 0;
    bool lacpEnabled = false;
    std::string lacpMode = "active";  // "active", "passive" or "none"
};

// The LACP mode number (HostCtl::Network::LACP_MODE_*) of a stored word.
int LacpModeNumber(const std::string& word);

// The store's key of the DV port `id` on the switch `dvswitch`. Neither
// part may hold a '|' (FitsJoinedKey), so no two ports share a key; a part
// with a '|' names no port.
std::string DvPortKey(const std::string& dvswitch, const std::string& id);

// Whether a text may be part of a key the store joins from several fields.
bool FitsJoinedKey(const std::string& part);

}  // namespace Detail
}  // namespace PldCtl
