#include "hostctl/network/NetworkFactory.h"

#include "Operation.h"
#include "hostctl/network/ip/PldNic.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/Document.h"

namespace HostCtl {
namespace Network {

Portset::~Portset() = default;
VirtualSwitch::~VirtualSwitch() = default;
PortGroup::~PortGroup() = default;
PldNic::~PldNic() = default;

std::unique_ptr<VirtualSwitch> NetworkFactory::GetVirtualSwitchById(const std::string& name) {
    PldCtl::Store::HostStore& store = PldCtl::Detail::EnterOperation("NetworkFactory::GetVirtualSwitchById", name);
    std::optional<PldCtl::Store::Json> vswitch = store.Get("vswitches", name);
    if (!vswitch) return nullptr;
    return std::make_unique<PldCtl::Network::VirtualSwitchImpl>(PldCtl::Detail::MakeDocument(std::move(*vswitch)));
}

std::unique_ptr<PortGroup> NetworkFactory::GetPortGroupByName(const std::string& name) {
    PldCtl::Store::HostStore& store = PldCtl::Detail::EnterOperation("NetworkFactory::GetPortGroupByName", name);
    std::optional<PldCtl::Store::Json> portGroup = store.Get("portgroups", name);
    if (!portGroup) return nullptr;
    return std::make_unique<PldCtl::Network::PortGroupImpl>(PldCtl::Detail::MakeDocument(std::move(*portGroup)));
}

}  // namespace Network
}  // namespace HostCtl
