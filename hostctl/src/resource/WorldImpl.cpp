// One running world over the host store.
#include "hostctl/resource/WorldImpl.h"

#include "Operation.h"
#include "resource/WorldRecords.h"

namespace PldCtl {
namespace Resource {

WorldImpl::WorldImpl(std::uint64_t id) : id_(id) {}
WorldImpl::~WorldImpl() = default;

std::string WorldImpl::GetWorldName() const {
    const std::string key = std::to_string(id_);
    Store::HostStore& store = Detail::EnterOperation("WorldImpl::GetWorldName", key);
    std::optional<Detail::WorldRecord> world = Detail::Get<Detail::WorldRecord>(store, key);
    return world ? world->name : std::string();
}

}  // namespace Resource
}  // namespace PldCtl
