// Port sets and standard switches over the host store.
//
// Objects are snapshots of stored objects. Every change re-reads the stored
// object inside its own transaction, applies the change, checks the host's
// rules there and writes it back, so concurrent commands never lose each
// other's changes; the snapshot is refreshed from what was written.
#include <algorithm>

#include "hostctl/Lib.h"
#include "hostctl/network/ip/PldNic.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"
#include "network/dvs/DvsRecords.h"
#include "network/nic/NicRecords.h"
#include "network/vswitch/VswitchLookup.h"

namespace PldCtl {
namespace Network {

using HostCtl::Network::PortGroup;

namespace {

bool Contains(const std::vector<std::string>& names, const std::string& name) {
    return std::find(names.begin(), names.end(), name) != names.end();
}

// A change of a stored switch that applies the edits `policy` made to the
// switch's policy of that kind as the snapshot `base` had it. The switch's
// policy is written whole, with every field a hand-written profile left out
// filled in from the defaults.
template <typename Policy>
auto EditSwitchPolicy(const VswitchRecord& base, const Policy& policy) {
    return [&base, &policy](Transaction&, VswitchRecord& vswitch) {
        const Policy before = Detail::SwitchPolicy<Policy>(base);
        auto& stored = Detail::PolicySlot<Policy>::Of(vswitch);
        stored = Detail::FromPolicy(Detail::SwitchPolicy<Policy>(vswitch));
        Detail::ApplyEdits(stored, Detail::FromPolicy(before), Detail::FromPolicy(before.OverlaidWith(policy)));
    };
}

}  // namespace

// ---------------------------------------------------------------- PortsetImpl

PortsetImpl::PortsetImpl(std::shared_ptr<const VswitchRecord> record, std::optional<std::pair<int, int>> portCounts)
    : record_(std::move(record)), portCounts_(portCounts) {}

PortsetImpl::~PortsetImpl() = default;

void PortsetImpl::Refresh(std::shared_ptr<const VswitchRecord> record) {
    record_ = std::move(record);
    portCounts_.reset();
}

bool PortsetImpl::IsValidVirtualSwitch(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("PortsetImpl::IsValidVirtualSwitch", name);
    return store.GetText(VswitchRecord::kSection, name).has_value();
}

std::string PortsetImpl::GetName() const {
    return record_->name;
}

std::string PortsetImpl::GetClassName() const {
    return record_->className;
}

int PortsetImpl::GetNumPorts() const {
    return record_->numPorts;
}

const std::pair<int, int>& PortsetImpl::PortCounts() const {
    Store::HostStore& store = Detail::EnterOperation("PortsetImpl::GetPortCounts", GetName());
    if (!portCounts_) {
        const int configured = static_cast<int>(store.CountChildren(PortRecord::kSection, GetName()));
        const int used = static_cast<int>(
            store.CountChildren(PortRecord::kSection, GetName(), {FieldTest{PortRecord::kClientField, std::nullopt}}));
        portCounts_ = std::make_pair(configured, used);
    }
    return *portCounts_;
}

int PortsetImpl::GetNumUsedPorts() const {
    return PortCounts().second;
}

int PortsetImpl::GetNumConfiguredPorts() const {
    return PortCounts().first;
}

std::vector<std::string> PortsetImpl::GetUplinks() const {
    return record_->uplinks;
}

namespace {

// The uplink port of `nic` on `vswitch`, found through the NIC's own record
// rather than by listing the switch's ports; HostCtlException when the NIC
// is no uplink of the switch.
Detail::StoredObject<PortRecord> RequireUplinkPort(Transaction& t, const std::string& vswitch, const std::string& nic) {
    auto notUplink = [&]() { throw HostCtlException(nic + " is not an uplink of " + vswitch); };
    std::optional<Detail::NicRecord> pnic = Detail::Get<Detail::NicRecord>(t, nic);
    if (!pnic || pnic->uplinkPortId == 0) notUplink();
    std::optional<Detail::StoredObject<PortRecord>> port =
        Detail::Find<PortRecord>(t, std::to_string(pnic->uplinkPortId));
    if (!port || port->record.portset != vswitch || port->record.client != nic) notUplink();
    return std::move(*port);
}

}  // namespace

std::vector<std::unique_ptr<HostCtl::Network::VlanStats>> PortsetImpl::GetUplinkVlanStats(
    const std::string& uplink) const {
    Store::HostStore& store = Detail::EnterOperation("PortsetImpl::GetUplinkVlanStats", GetName());
    std::vector<std::unique_ptr<HostCtl::Network::VlanStats>> stats;
    store.Read([&](Transaction& t) {
        const PortRecord port = RequireUplinkPort(t, GetName(), uplink).record;
        if (!port.vlanStatsEnabled) return;
        for (const Detail::VlanStatsRecord& vlan : port.vlanStats) {
            auto entry = std::make_unique<HostCtl::Network::VlanStats>();
            entry->vlanId = static_cast<std::uint16_t>(vlan.vlanId);
            entry->rxPackets = vlan.rxPackets;
            entry->txPackets = vlan.txPackets;
            stats.push_back(std::move(entry));
        }
    });
    return stats;
}

void PortsetImpl::SetUplinkVlanStatsEnabled(const std::string& uplink, bool enabled) {
    Store::HostStore& store = Detail::EnterOperation("PortsetImpl::SetUplinkVlanStatsEnabled", GetName());
    store.Change([&](Transaction& t) {
        Detail::StoredObject<PortRecord> port = RequireUplinkPort(t, GetName(), uplink);
        PortRecord edited = port.record;
        edited.vlanStatsEnabled = enabled;
        // Counting starts afresh each time it is turned on.
        if (!enabled) edited.vlanStats.clear();
        Detail::Write(t, port, edited);
    });
}

// ---------------------------------------------------------- VirtualSwitchImpl

VirtualSwitchImpl::VirtualSwitchImpl(std::shared_ptr<const VswitchRecord> record) : PortsetImpl(std::move(record)) {}

VirtualSwitchImpl::VirtualSwitchImpl(std::shared_ptr<const VswitchRecord> record, std::pair<int, int> portCounts,
                                     std::vector<std::shared_ptr<const PortGroupRecord>> portGroups)
    : PortsetImpl(std::move(record), portCounts), portGroups_(std::move(portGroups)) {}

VirtualSwitchImpl::~VirtualSwitchImpl() = default;

int VirtualSwitchImpl::GetMTU() const {
    return record_->mtu;
}

void VirtualSwitchImpl::SetMTU(long long mtu) {
    using HostCtl::Network::PldNic;
    if (mtu < PldNic::MIN_MTU || mtu > PldNic::MAX_MTU) {
        throw HostCtlException("Invalid MTU " + std::to_string(mtu) + " for virtual switch " + GetName() +
                               ": it must be between " + std::to_string(PldNic::MIN_MTU) + " and " +
                               std::to_string(PldNic::MAX_MTU));
    }
    Refresh(Detail::ChangeStored<VswitchRecord>("VirtualSwitchImpl::SetMTU", GetName(),
                                                [&](Transaction&, auto& s) { s.mtu = static_cast<int>(mtu); }));
}

std::string VirtualSwitchImpl::GetCDPStatus() const {
    return record_->cdp;
}

void VirtualSwitchImpl::SetCDPStatus(int index) {
    if (index < 0 || index > 3) throw HostCtlException("Invalid CDP status index " + std::to_string(index));
    Refresh(Detail::ChangeStored<VswitchRecord>(
        "VirtualSwitchImpl::SetCDPStatus", GetName(),
        [&](Transaction&, auto& s) { s.cdp = HostCtl::Network::kCdpStatusWords[static_cast<std::size_t>(index)]; }));
}

bool VirtualSwitchImpl::IsBeaconEnabled() const {
    return Detail::SwitchPolicy<NicTeamingPolicy>(*record_).GetLinkCriteria().IsBeaconChecking();
}

int VirtualSwitchImpl::GetBeaconInterval() const {
    return record_->beacon.interval;
}

int VirtualSwitchImpl::GetBeaconThreshold() const {
    return record_->beacon.threshold;
}

const std::vector<std::shared_ptr<const PortGroupRecord>>& VirtualSwitchImpl::PortGroupRecords() const {
    if (!portGroups_) {
        std::vector<std::shared_ptr<const PortGroupRecord>> records;
        for (PortGroupRecord& portGroup :
             Detail::ListChildren<PortGroupRecord>(Store::HostStore::Default(), GetName())) {
            records.push_back(std::make_shared<const PortGroupRecord>(std::move(portGroup)));
        }
        portGroups_ = std::move(records);
    }
    return *portGroups_;
}

std::vector<std::string> VirtualSwitchImpl::GetBeaconRequiredBy() const {
    // Each operation stays a place a fault can be injected, also when a
    // listing already read what it needs.
    Detail::EnterOperation("VirtualSwitchImpl::GetBeaconRequiredBy", GetName());
    const bool switchProbes = IsBeaconEnabled();
    std::vector<std::string> names;
    for (const auto& portGroup : PortGroupRecords()) {
        // The detection in force: the port group's own if it sets one, else
        // its switch's.
        const NicTeamingPolicy own = Detail::OwnPolicy<NicTeamingPolicy>(*portGroup);
        const bool probes = own.IsLinkCriteriaSet() ? own.GetLinkCriteria().IsBeaconChecking() : switchProbes;
        if (probes) names.push_back(portGroup->name);
    }
    return names;
}

std::vector<std::unique_ptr<PortGroup>> VirtualSwitchImpl::GetPortGroups() const {
    Detail::EnterOperation("VirtualSwitchImpl::GetPortGroups", GetName());
    std::vector<std::unique_ptr<PortGroup>> portGroups;
    // The records are never changed in place, so the objects share them.
    for (const auto& portGroup : PortGroupRecords()) portGroups.push_back(std::make_unique<PortGroupImpl>(portGroup));
    return portGroups;
}

std::unique_ptr<PortGroup> VirtualSwitchImpl::AddPortGroup(const std::string& name) {
    Detail::CheckPortGroupName(name);
    PortGroupRecord created;
    created.name = name;
    created.vswitch = GetName();
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchImpl::AddPortGroup", GetName());
    store.Change([&](Transaction& t) {
        Detail::Require<VswitchRecord>(t, GetName());
        if (std::optional<PortGroupRecord> existing = Detail::Get<PortGroupRecord>(t, name)) {
            throw HostCtlException("A port group with the name " + name + " already exists on virtual switch " +
                                   existing->vswitch);
        }
        Detail::Create(t, created);
    });
    portGroups_.reset();
    return std::make_unique<PortGroupImpl>(std::make_shared<const PortGroupRecord>(std::move(created)));
}

void VirtualSwitchImpl::RemovePortGroup(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchImpl::RemovePortGroup", GetName());
    store.Change([&](Transaction& t) {
        Detail::Require<VswitchRecord>(t, GetName());
        std::optional<PortGroupRecord> portGroup = Detail::Get<PortGroupRecord>(t, name);
        if (!portGroup || portGroup->vswitch != GetName()) {
            throw HostCtlException("Unable to find port group " + name + " on virtual switch " + GetName());
        }
        const std::vector<FieldTest> inUse = {FieldTest{PortRecord::kPortGroupField, name},
                                              FieldTest{PortRecord::kClientField, std::nullopt}};
        if (t.CountChildren(PortRecord::kSection, GetName(), inUse) > 0) {
            throw HostCtlException(
                "Unable to remove port group " + name + ": it is in use by " +
                Detail::ClientsOf(t, GetName(), [&](const PortRecord& port) { return port.portgroup == name; }));
        }
        t.Remove(PortGroupRecord::kSection, name);
    });
    portGroups_.reset();
}

void VirtualSwitchImpl::AddUplink(const std::string& nic) {
    Refresh(Detail::ChangeStored<VswitchRecord>(
        "VirtualSwitchImpl::AddUplink", GetName(), [&](Transaction& t, VswitchRecord& s) {
            std::optional<Detail::StoredObject<Detail::NicRecord>> pnic = Detail::Find<Detail::NicRecord>(t, nic);
            if (!pnic)
                throw HostCtlException("Unable to add uplink " + nic + ": the host has no physical NIC of that name");
            auto alreadyUplinkOf = [&](const std::string& owner) {
                throw HostCtlException("Unable to add uplink " + nic + ": it is already an uplink of " + owner);
            };
            for (const VswitchRecord& other : Detail::List<VswitchRecord>(t)) {
                if (Contains(other.uplinks, nic)) alreadyUplinkOf(other.name);
            }
            for (const Detail::DvSwitchRecord& other : Detail::List<Detail::DvSwitchRecord>(t)) {
                if (Contains(other.uplinks, nic)) alreadyUplinkOf(other.name);
            }
            const std::string name = GetName();
            const std::vector<PortRecord> ports = Detail::ListChildren<PortRecord>(t, name);
            if (static_cast<std::int64_t>(ports.size()) >= s.numPorts) {
                throw HostCtlException("Unable to add uplink " + nic + ": virtual switch " + name +
                                       " has no free port");
            }
            const std::int64_t id = Detail::NextPortId(t, ports);
            PortRecord uplink;
            uplink.id = id;
            uplink.portset = name;
            uplink.type = PortRecord::kUplinkType;
            uplink.client = nic;
            // A new port stores only what sets it apart from a free one.
            Store::Json port = Store::Json::object();
            Detail::Merge(port, PortRecord(), uplink);
            t.Put(PortRecord::kSection, port);
            Detail::NicRecord attached = pnic->record;
            attached.uplinkPortId = id;
            Detail::Write(t, *pnic, attached);
            s.uplinks.push_back(nic);
        }));
}

void VirtualSwitchImpl::RemoveUplink(const std::string& nic) {
    Refresh(Detail::ChangeStored<VswitchRecord>(
        "VirtualSwitchImpl::RemoveUplink", GetName(), [&](Transaction& t, VswitchRecord& s) {
            auto at = std::find(s.uplinks.begin(), s.uplinks.end(), nic);
            if (at == s.uplinks.end()) {
                throw HostCtlException("Unable to remove uplink " + nic + ": it is not an uplink of virtual switch " +
                                       GetName());
            }
            s.uplinks.erase(at);
            for (const PortRecord& port : Detail::ListChildren<PortRecord>(t, GetName())) {
                if (port.type == PortRecord::kUplinkType && port.client == nic) {
                    t.Remove(PortRecord::kSection, std::to_string(port.id));
                }
            }
            Detail::ReleaseNic(t, nic);
        }));
}

NicTeamingPolicy VirtualSwitchImpl::GetTeamingPolicy() const {
    return Detail::SwitchPolicy<NicTeamingPolicy>(*record_);
}

NicTeamingPolicy VirtualSwitchImpl::GetConfiguredTeamingPolicy() const {
    return Detail::SwitchPolicy<NicTeamingPolicy>(*record_);
}

void VirtualSwitchImpl::SetTeamingPolicy(const NicTeamingPolicy& policy) {
    std::vector<std::string> sorted = policy.GetUplinkOrder();
    std::sort(sorted.begin(), sorted.end());
    if (std::adjacent_find(sorted.begin(), sorted.end()) != sorted.end()) {
        throw HostCtlException("Invalid failover policy for virtual switch " + GetName() +
                               ": an uplink appears more than once in its order");
    }
    Refresh(Detail::ChangeStored<VswitchRecord>("VirtualSwitchImpl::SetTeamingPolicy", GetName(),
                                                EditSwitchPolicy(*record_, policy)));
}

PortSecurityPolicy VirtualSwitchImpl::GetSecurityPolicy() const {
    return Detail::SwitchPolicy<PortSecurityPolicy>(*record_);
}

void VirtualSwitchImpl::SetSecurityPolicy(const PortSecurityPolicy& policy) {
    Refresh(Detail::ChangeStored<VswitchRecord>("VirtualSwitchImpl::SetSecurityPolicy", GetName(),
                                                EditSwitchPolicy(*record_, policy)));
}

ShapingPolicy VirtualSwitchImpl::GetShapingPolicy() const {
    return Detail::SwitchPolicy<ShapingPolicy>(*record_);
}

void VirtualSwitchImpl::SetShapingPolicy(const ShapingPolicy& policy) {
    Refresh(Detail::ChangeStored<VswitchRecord>("VirtualSwitchImpl::SetShapingPolicy", GetName(),
                                                EditSwitchPolicy(*record_, policy)));
}

}  // namespace Network
}  // namespace PldCtl
