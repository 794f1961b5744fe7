// The host's running worlds over the host store.
#include "hostctl/resource/ResourceInfoImpl.h"

#include <string>

#include "Operation.h"
#include "resource/WorldRecords.h"

namespace PldCtl {
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
