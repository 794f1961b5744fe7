// The stored record of a distributed switch, as far as the library uses it
// yet: standard switches share the host's names, ports and NICs with it.
#pragma once

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
    std::vector<std::string> uplinks;
};

}  // namespace Detail
}  // namespace PldCtl
