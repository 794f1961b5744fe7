// The stored records of distributed switches and their DV ports, as far as
// the library uses them: standard switches share the host's names, ports and
// NICs with them, and kernel interfaces connect to their DV ports.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

struct DvSwitchRecord {
    static constexpr const char* kSection = Store::Section::kDvSwitches;
    // Summed over all switches by the store itself.
    static constexpr const char* kNumPortsField = "numPorts";

    std::string name;
    std::string uuid;
    int numPorts = 128;
    std::vector<std::string> uplinks;
};

// A port of a distributed switch, keyed by its switch and its id.
struct DvPortRecord {
    static constexpr const char* kSection = Store::Section::kDvPorts;

    std::string dvswitch;
    std::string id;
    std::uint32_t connectionId = 0;
};

// The store's key of the DV port `id` on the switch `dvswitch`. The profile
// checks refuse a '|' in either part, so no two ports share a key; a part
// with a '|' names no port.
std::string DvPortKey(const std::string& dvswitch, const std::string& id);

// Whether a text may be part of a key the store joins from several fields.
bool FitsJoinedKey(const std::string& part);

}  // namespace Detail
}  // namespace PldCtl
