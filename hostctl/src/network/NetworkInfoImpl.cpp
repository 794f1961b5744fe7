#include "hostctl/network/NetworkInfoImpl.h"

#include "Operation.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/NetworkRecords.h"
#include "network/nic/NicRecords.h"
#include "network/vswitch/VswitchLookup.h"

namespace PldCtl {
namespace Network {

using Detail::SystemRecord;

NetworkInfoImpl::NetworkInfoImpl() = default;
NetworkInfoImpl::~NetworkInfoImpl() = default;

bool NetworkInfoImpl::IsPldIpv6Enabled() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::IsPldIpv6Enabled");
    return Detail::GetSingleton<SystemRecord>(store).ipv6Enabled;
}

void NetworkInfoImpl::SetPldIpv6Enabled(bool enabled) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::SetPldIpv6Enabled");
    store.Change([enabled](Store::Transaction& t) {
        Detail::StoredObject<SystemRecord> system = Detail::FindSingleton<SystemRecord>(t);
        SystemRecord edited = system.record;
        edited.ipv6Enabled = enabled;
        Detail::WriteSingleton(t, system, edited);
    });
}

std::vector<std::unique_ptr<HostCtl::Network::Pnic>> NetworkInfoImpl::GetPnics() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetPnics");
    std::vector<std::unique_ptr<HostCtl::Network::Pnic>> pnics;
    for (const Detail::NicRecord& nic : Detail::List<Detail::NicRecord>(store)) {
        pnics.push_back(std::make_unique<PnicImpl>(nic.name));
    }
    return pnics;
}

std::vector<std::unique_ptr<HostCtl::Network::PortGroup>> NetworkInfoImpl::GetAllPortGroups() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetAllPortGroups");
    std::vector<std::unique_ptr<HostCtl::Network::PortGroup>> portGroups;
    store.Read([&](Store::Transaction& t) {
        // Port group names are unique on the host, so the in-use ports of all
        // port groups are counted in one pass, by port group name.
        const auto active = t.CountGroups(PortRecord::kSection, PortRecord::kPortGroupField,
                                          {Store::FieldTest{PortRecord::kClientField, std::nullopt}});
        // Switch by switch, each switch's port groups in their order.
        Detail::PortGroupsBySwitch bySwitch = Detail::ListPortGroupsBySwitch(t);
        for (const std::string& vswitch : t.ListKeys(Detail::VswitchRecord::kSection)) {
            auto own = bySwitch.find(vswitch);
            if (own == bySwitch.end()) continue;
            for (auto& portGroup : own->second) {
                auto count = active.find(portGroup->name);
                const int activeClients = count == active.end() ? 0 : static_cast<int>(count->second.passing);
                portGroups.push_back(std::make_unique<PortGroupImpl>(std::move(portGroup), activeClients));
            }
        }
    });
    return portGroups;
}

}  // namespace Network
}  // namespace PldCtl
