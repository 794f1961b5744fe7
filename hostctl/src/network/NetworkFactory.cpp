#include "hostctl/network/NetworkFactory.h"

#include "Operation.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/dvs/DVSwitchImpl.h"
#include "hostctl/network/ip/PldNic.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/dvs/DvsRecords.h"
#include "network/vswitch/VswitchRecords.h"

namespace HostCtl {
namespace Network {

Portset::~Portset() = default;
VirtualSwitch::~VirtualSwitch() = default;
PortGroup::~PortGroup() = default;
PldNic::~PldNic() = default;

std::unique_ptr<VirtualSwitch> NetworkFactory::GetVirtualSwitchById(const std::string& name) {
    using PldCtl::Detail::VswitchRecord;
    PldCtl::Store::HostStore& store = PldCtl::Detail::EnterOperation("NetworkFactory::GetVirtualSwitchById", name);
    std::optional<VswitchRecord> vswitch = PldCtl::Detail::Get<VswitchRecord>(store, name);
    if (!vswitch) return nullptr;
    return std::make_unique<PldCtl::Network::VirtualSwitchImpl>(
        std::make_shared<const VswitchRecord>(std::move(*vswitch)));
}

std::unique_ptr<PortGroup> NetworkFactory::GetPortGroupByName(const std::string& name) {
    using PldCtl::Detail::PortGroupRecord;
    PldCtl::Store::HostStore& store = PldCtl::Detail::EnterOperation("NetworkFactory::GetPortGroupByName", name);
    std::optional<PortGroupRecord> portGroup = PldCtl::Detail::Get<PortGroupRecord>(store, name);
    if (!portGroup) return nullptr;
    return std::make_unique<PldCtl::Network::PortGroupImpl>(
        std::make_shared<const PortGroupRecord>(std::move(*portGroup)));
}

std::unique_ptr<NetworkInfo> NetworkFactory::GetNetworkInfo() {
    return std::make_unique<PldCtl::Network::NetworkInfoImpl>();
}

std::unique_ptr<DVSwitch> NetworkFactory::GetDVSwitchByName(const std::string& name) {
    using PldCtl::Detail::DvSwitchRecord;
    PldCtl::Store::HostStore& store = PldCtl::Detail::EnterOperation("NetworkFactory::GetDVSwitchByName", name);
    std::optional<DvSwitchRecord> dvswitch = PldCtl::Detail::Get<DvSwitchRecord>(store, name);
    if (!dvswitch) return nullptr;
    return std::make_unique<PldCtl::Network::DVSwitchImpl>(
        std::make_shared<const DvSwitchRecord>(std::move(*dvswitch)));
}

}  // namespace Network
}  // namespace HostCtl
