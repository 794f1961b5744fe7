// The host's running worlds over the host store.
#include "hostctl/resource/ResourceInfoImpl.h"

#include <string>

#include "Operation.h"
#include "hoststore/CollectionNames.h"
#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// One running world, keyed by its id; `kind` is "vm" or "host".
struct WorldRecord {
    static constexpr const char* kSection = Store::Section::kWorlds;

    std::uint64_t id = 0;
    std::string name;
    std::string kind = "host";
};

// clang-format off
template <>
struct RecordFields<WorldRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("id", &WorldRecord::id),
            Field("name", &WorldRecord::name),
            Field("kind", &WorldRecord::kind));
    }
};
// clang-format on

}  // namespace Detail

namespace Resource {

ResourceInfoImpl::ResourceInfoImpl() = default;
ResourceInfoImpl::~ResourceInfoImpl() = default;

std::string ResourceInfoImpl::GetWorldName(unsigned long long id) {
    const std::string key = std::to_string(id);
    // The fault check comes first for every call, so a fault injected for
    // one world fires however often its name was asked before.
    Store::HostStore& store = Detail::EnterOperation("ResourceInfoImpl::GetWorldName", key);
    auto known = names_.find(id);
    if (known != names_.end()) return known->second;
    std::optional<Detail::WorldRecord> world = Detail::Get<Detail::WorldRecord>(store, key);
    return names_.emplace(id, world ? world->name : std::string()).first->second;
}

}  // namespace Resource
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::WorldRecord);
