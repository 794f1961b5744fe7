#include "hostctl/network/NetworkInfoImpl.h"

#include "Operation.h"
#include "network/Document.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace PldCtl {
namespace Network {

using Store::Json;

NetworkInfoImpl::NetworkInfoImpl() = default;
NetworkInfoImpl::~NetworkInfoImpl() = default;

bool NetworkInfoImpl::IsPldIpv6Enabled() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::IsPldIpv6Enabled");
    return store.GetSingleton("system").value("ipv6Enabled", true);
}

void NetworkInfoImpl::SetPldIpv6Enabled(bool enabled) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::SetPldIpv6Enabled");
    store.Change([enabled](Store::Transaction& t) {
        Json system = t.GetSingleton("system");
        system["ipv6Enabled"] = enabled;
        t.PutSingleton("system", system);
    });
}

std::vector<std::unique_ptr<HostCtl::Network::Pnic>> NetworkInfoImpl::GetPnics() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetPnics");
    std::vector<std::unique_ptr<HostCtl::Network::Pnic>> pnics;
    for (const Json& nic : store.List("nics")) pnics.push_back(std::make_unique<PnicImpl>(nic.value("name", "")));
    return pnics;
}

std::vector<std::unique_ptr<HostCtl::Network::PortGroup>> NetworkInfoImpl::GetAllPortGroups() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetAllPortGroups");
    std::vector<std::unique_ptr<HostCtl::Network::PortGroup>> portGroups;
    store.Read([&](Store::Transaction& t) {
        // Port group names are unique on the host, so the in-use ports of all
        // port groups are counted in one pass, by port group name.
        const auto active = t.CountByField("ports", "portgroup", {Store::FieldTest{"client", std::nullopt}});
        for (Json& portGroup : t.ListByParentOrder("portgroups")) {
            auto count = active.find(portGroup.value("name", ""));
            portGroups.push_back(
                std::make_unique<PortGroupImpl>(Detail::MakeDocument(std::move(portGroup)),
                                                count == active.end() ? 0 : static_cast<int>(count->second)));
        }
    });
    return portGroups;
}

}  // namespace Network
}  // namespace PldCtl
