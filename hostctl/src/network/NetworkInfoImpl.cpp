#include "hostctl/network/NetworkInfoImpl.h"

#include <algorithm>

#include "Operation.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/NetworkRecords.h"
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
    const Detail::VfStatsRecord& s = vf->stats;
    stats = HostCtl::Network::SriovNicVFStats{
        s.rxUnicastPackets, s.rxUnicastBytes,     s.rxMulticastPackets, s.rxMulticastBytes, s.rxBroadcastPackets,
        s.rxBroadcastBytes, s.rxOutOfBufferDrops, s.rxErrorDrops,       s.rxLroPackets,     s.rxLroBytes,
        s.txUnicastPackets, s.txUnicastBytes,     s.txMulticastPackets, s.txMulticastBytes, s.txBroadcastPackets,
        s.txBroadcastBytes, s.txErrors,           s.txDiscards,         s.txTsoPackets,     s.txTsoBytes};
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
