#include "hostctl/network/NetworkInfoImpl.h"

#include <algorithm>

#include "Operation.h"
#include "hostctl/network/ip/NetstackInstanceImpl.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/NetworkRecords.h"
#include "network/ip/IpLookup.h"
#include "network/ip/NetstackRules.h"
#include "network/nic/NicRecords.h"
#include "network/vswitch/VswitchLookup.h"

HostCtl::Network::NetworkInfo::~NetworkInfo() = default;

namespace PldCtl {
namespace Network {

using Detail::NicRecord;
using Detail::SystemRecord;
using HostCtl::Network::Pnic;

namespace {

// The stored NIC of that name if it is SR-IOV capable; throws otherwise.
NicRecord RequireSriovNic(Store::HostStore& store, const std::string& name) {
    NicRecord nic = Detail::RequireNic(store, name);
    if (!nic.sriovVfs) throw HostCtl::Lib::HostCtlException("NIC " + name + " is not SR-IOV capable");
    return nic;
}

}  // namespace

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

std::vector<std::unique_ptr<Pnic>> NetworkInfoImpl::GetPnics() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetPnics");
    // One read of the collection; each NIC is a snapshot of what it read.
    std::vector<std::unique_ptr<Pnic>> pnics;
    for (auto& nic : Detail::DecodeShared<NicRecord>(store.ListText(NicRecord::kSection))) {
        pnics.push_back(std::make_unique<PnicImpl>(std::move(nic)));
    }
    return pnics;
}

std::unique_ptr<Pnic> NetworkInfoImpl::GetPnicByName(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetPnicByName", name);
    std::optional<NicRecord> nic = Detail::Get<NicRecord>(store, name);
    if (!nic) return nullptr;
    return std::make_unique<PnicImpl>(std::make_shared<const NicRecord>(std::move(*nic)));
}

std::vector<std::unique_ptr<Pnic>> NetworkInfoImpl::GetSriovNics() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetSriovNics");
    std::vector<std::unique_ptr<Pnic>> pnics;
    for (auto& nic : Detail::DecodeShared<NicRecord>(store.ListText(NicRecord::kSection))) {
        if (nic->sriovVfs) pnics.push_back(std::make_unique<PnicImpl>(std::move(nic)));
    }
    return pnics;
}

std::unique_ptr<Pnic> NetworkInfoImpl::GetSriovNicByName(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetSriovNicByName", name);
    std::optional<NicRecord> nic = Detail::Get<NicRecord>(store, name);
    if (!nic || !nic->sriovVfs) return nullptr;
    return std::make_unique<PnicImpl>(std::make_shared<const NicRecord>(std::move(*nic)));
}

std::vector<std::unique_ptr<HostCtl::Network::SriovNicVFInfo>> NetworkInfoImpl::GetSriovNicVFInfo(
    const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetSriovNicVFInfo", name);
    std::vector<Detail::VfRecord> vfs = *RequireSriovNic(store, name).sriovVfs;
    std::stable_sort(vfs.begin(), vfs.end(), [](const auto& a, const auto& b) { return a.id < b.id; });
    std::vector<std::unique_ptr<HostCtl::Network::SriovNicVFInfo>> infos;
    for (const Detail::VfRecord& vf : vfs) {
        auto info = std::make_unique<HostCtl::Network::SriovNicVFInfo>();
        info->vfId = static_cast<std::uint8_t>(vf.id);
        info->active = vf.active;
        info->pciAddress = vf.pciAddress;
        info->ownerWorldId = std::to_string(vf.ownerWorldId);
        infos.push_back(std::move(info));
    }
    return infos;
}

void NetworkInfoImpl::GetSriovNicVFStats(HostCtl::Network::SriovNicVFStats& stats, const std::string& name,
                                         std::int64_t vfId) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetSriovNicVFStats", name);
    const NicRecord nic = RequireSriovNic(store, name);
    // The id is compared whole: 4294967299 is no VF, not VF 3.
    auto vf = std::find_if(nic.sriovVfs->begin(), nic.sriovVfs->end(),
                           [vfId](const Detail::VfRecord& candidate) { return candidate.id == vfId; });
    if (vf == nic.sriovVfs->end()) {
        throw HostCtl::Lib::HostCtlException("NIC " + name + " has no VF with ID " + std::to_string(vfId));
    }
    stats = vf->stats;
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

int NetworkInfoImpl::GetNetstackInstanceState(const std::string& key) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::GetNetstackInstanceState", key);
    std::optional<Detail::NetstackRecord> netstack = Detail::Get<Detail::NetstackRecord>(store, key);
    return netstack ? netstack->state : 0;
}

void NetworkInfoImpl::AddNetstackInstance(HostCtl::Network::NetstackInstance* instance, bool disabled) {
    if (!instance) throw HostCtl::Lib::HostCtlException("No netstack instance given");
    const std::string key = instance->GetKey();
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::AddNetstackInstance", key);
    Detail::CheckNetstackKey(key);
    Detail::CheckMaxConnections(instance->GetMaxConnections(), key);
    Detail::NetstackRecord record;
    record.key = key;
    record.name = instance->GetName();
    record.maxConnections = instance->GetMaxConnections();
    record.ccAlgorithm = instance->GetCongestionControlAlgorithm();
    record.ipv6Enabled = instance->GetIpv6Enabled();
    if (disabled) {
        Detail::KeepInConfigurationOnly(record);
    } else {
        Detail::CreateInKernel(record);
    }
    store.Change([&](Store::Transaction& t) {
        if (t.Exists(Detail::NetstackRecord::kSection, key)) {
            throw HostCtl::Lib::HostCtlException("Netstack instance " + key + " already exists");
        }
        Detail::CheckCongestionControlAlgorithm(t, record.ccAlgorithm);
        Detail::Create(t, record);
    });
}

void NetworkInfoImpl::RemoveNetstackInstance(const std::string& key, bool) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::RemoveNetstackInstance", key);
    if (key == HostCtl::Network::NetstackInstance::DEFAULT_KEY) {
        throw HostCtl::Lib::HostCtlException("The default netstack instance cannot be removed");
    }
    store.Change([&](Store::Transaction& t) {
        Detail::RequireNetstack(t, key);
        std::vector<Detail::InterfaceRecord> interfaces = Detail::ListChildren<Detail::InterfaceRecord>(t, key);
        if (!interfaces.empty()) {
            std::stable_sort(interfaces.begin(), interfaces.end(), [](const auto& a, const auto& b) {
                return Detail::InterfaceNumber(a.name) < Detail::InterfaceNumber(b.name);
            });
            std::string names;
            for (const auto& nic : interfaces) names += (names.empty() ? "" : ", ") + nic.name;
            throw HostCtl::Lib::HostCtlException("Netstack instance " + key + " still has interfaces: " + names);
        }
        // What lives in the instance goes with it.
        for (const char* section :
             {Store::Section::kRoutes, Store::Section::kNeighbors, Store::Section::kConnections}) {
            t.RemoveChildren(section, key);
        }
        t.Remove(Detail::NetstackRecord::kSection, key);
    });
}

std::unique_ptr<HostCtl::Network::NetstackInstance> NetworkInfoImpl::LookupNetstackInstanceByKey(
    const std::string& key) {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::LookupNetstackInstanceByKey", key);
    std::optional<Detail::NetstackRecord> netstack = Detail::Get<Detail::NetstackRecord>(store, key);
    if (!netstack) return nullptr;
    return std::make_unique<NetstackInstanceImpl>(std::make_shared<const Detail::NetstackRecord>(std::move(*netstack)));
}

std::vector<std::unique_ptr<HostCtl::Network::NetstackInstance>> NetworkInfoImpl::ListNetstackInstances() {
    Store::HostStore& store = Detail::EnterOperation("NetworkInfoImpl::ListNetstackInstances");
    std::vector<std::unique_ptr<HostCtl::Network::NetstackInstance>> instances;
    for (auto& netstack :
         Detail::DecodeShared<Detail::NetstackRecord>(store.ListText(Detail::NetstackRecord::kSection))) {
        instances.push_back(std::make_unique<NetstackInstanceImpl>(std::move(netstack)));
    }
    return instances;
}

}  // namespace Network
}  // namespace PldCtl
