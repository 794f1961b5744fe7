// The stored record of a physical NIC, as far as the library uses it yet.
// docs/host-profile.md describes every field of a stored NIC.
#pragma once

#include <cstdint>
#include <string>

#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

struct NicRecord {
    static constexpr const char* kSection = Store::Section::kNics;

    std::string name;
    // The id of the NIC's port on the switch it is an uplink of; 0 for none.
    std::int64_t uplinkPortId = 0;
};

}  // namespace Detail
}  // namespace PldCtl
