// Physical NICs over the host store.
#include "hostctl/network/nic/PnicImpl.h"

#include "Operation.h"
#include "network/nic/NicRecords.h"

HostCtl::Network::Pnic::~Pnic() = default;

namespace PldCtl {
namespace Network {

PnicImpl::PnicImpl(const std::string& name) : name_(name) {}

PnicImpl::~PnicImpl() = default;

bool PnicImpl::IsValidPnic(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("PnicImpl::IsValidPnic", name);
    return store.GetText(Detail::NicRecord::kSection, name).has_value();
}

std::string PnicImpl::GetName() const {
    return name_;
}

}  // namespace Network
}  // namespace PldCtl
