#include "network/dvs/DVSwitchImpl.h"

#include "Operation.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/dvs/DvsRecords.h"

HostCtl::Network::DVSwitch::~DVSwitch() = default;

namespace PldCtl {
namespace Network {

DVSwitchImpl::~DVSwitchImpl() = default;

std::unique_ptr<HostCtl::Network::DVSwitch> DVSwitchImpl::Find(Store::HostStore& store, const std::string& name) {
    std::optional<Detail::DvSwitchRecord> dvswitch = Detail::Get<Detail::DvSwitchRecord>(store, name);
    if (!dvswitch) return nullptr;
    return std::make_unique<DVSwitchImpl>(dvswitch->name, dvswitch->uuid);
}

std::unique_ptr<HostCtl::Network::DVSwitch> VirtualSwitchInfoImpl::GetDVSwitchByName(const std::string& name) {
    return DVSwitchImpl::Find(Detail::EnterOperation("VirtualSwitchInfoImpl::GetDVSwitchByName", name), name);
}

}  // namespace Network
}  // namespace PldCtl
