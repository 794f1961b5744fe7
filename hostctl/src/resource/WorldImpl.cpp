#include "hostctl/resource/WorldImpl.h"

#include "network/port/Pending.h"

namespace PldCtl {
namespace Resource {

WorldImpl::WorldImpl(std::uint64_t id) : id_(id) {}
WorldImpl::~WorldImpl() = default;

std::string WorldImpl::GetWorldName() const {
    Detail::NotAvailableYet("WorldImpl::GetWorldName");
}

}  // namespace Resource
}  // namespace PldCtl
