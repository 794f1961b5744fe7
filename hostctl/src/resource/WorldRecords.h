// The stored record of a running world (a host process or a virtual
// machine); docs/host-profile.md describes its fields for profile writers.
#pragma once

#include <cstdint>
#include <string>

#include "hoststore/CollectionNames.h"
#include "network/StoredRecord.h"

namespace PldCtl {
namespace Detail {

// One running world, keyed by its id; `kind` is "vm" or "host".
struct WorldRecord {
    static constexpr const char* kSection = Store::Section::kWorlds;

    std::uint64_t id = 0;
    std::string name;
    std::string kind = "host";
};

}  // namespace Detail
}  // namespace PldCtl
