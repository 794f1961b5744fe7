// The stored record of the host's system settings (the "system" singleton),
// as far as networking uses them.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "hostctl/network/vswitch/VswitchTables.h"
#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

struct SystemRecord {
    static constexpr const char* kSingleton = Store::Section::kSystem;

    bool ipv6Enabled = true;
    // The ports all switches may have together.
    std::int64_t maxPorts = HostCtl::Network::kMaxHostPorts;
    // The congestion-control algorithms netstacks may use; unset: the
    // library's own list.
    std::optional<std::vector<std::string>> congestionControlAlgorithms;
};

}  // namespace Detail
}  // namespace PldCtl
