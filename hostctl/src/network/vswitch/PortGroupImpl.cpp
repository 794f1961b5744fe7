// Port groups over the host store: snapshots changed as VirtualSwitchImpl.cpp
// describes.
#include "hostctl/Lib.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"
#include "network/vswitch/VswitchLookup.h"

namespace PldCtl {
namespace Network {

using HostCtl::Network::VirtualSwitch;

namespace {

// A port group's policy in force: its switch's with its own fields over it.
// A field the switch does not store stays unset here (its getter still
// answers the default), so a port group can tell a value its switch really
// has from one nobody gave.
template <typename Policy>
Policy InForce(const VswitchRecord& vswitch, const PortGroupRecord& portGroup) {
    return Detail::OwnPolicy<Policy>(vswitch).OverlaidWith(Detail::OwnPolicy<Policy>(portGroup));
}

// Applies to a port group's own policy of that kind the edits `policy` made
// to it as the snapshot `base` had it.
template <typename Policy>
std::shared_ptr<const PortGroupRecord> WriteOwnPolicy(const char* operation, const PortGroupRecord& base,
                                                      const Policy& policy) {
    return Detail::ChangeStored<PortGroupRecord>(operation, base.name, [&](Transaction&, PortGroupRecord& p) {
        auto& own = Detail::PolicySlot<Policy>::Of(p);
        own = Detail::FromPolicy(Detail::OwnPolicy<Policy>(p));
        Detail::ApplyEdits(own, Detail::FromPolicy(Detail::OwnPolicy<Policy>(base)), Detail::FromPolicy(policy));
    });
}

}  // namespace

PortGroupImpl::PortGroupImpl(const std::string& name) : name_(name) {}

PortGroupImpl::PortGroupImpl(std::shared_ptr<const PortGroupRecord> record, std::optional<int> activeClients)
    : name_(record->name), record_(std::move(record)), activeClients_(activeClients) {}

PortGroupImpl::~PortGroupImpl() = default;

const PortGroupRecord& PortGroupImpl::Stored() const {
    if (!record_) {
        Store::HostStore& store = Detail::EnterOperation("PortGroupImpl::Get", name_);
        std::optional<PortGroupRecord> portGroup = Detail::Get<PortGroupRecord>(store, name_);
        if (!portGroup) throw HostCtlException(HostCtl::Network::UnknownPortGroupMessage(name_));
        record_ = std::make_shared<const PortGroupRecord>(std::move(*portGroup));
    }
    return *record_;
}

std::shared_ptr<const VswitchRecord> PortGroupImpl::SwitchRecord() const {
    const std::string vswitch = GetVirtualSwitchName();
    Store::HostStore& store = Detail::EnterOperation("PortGroupImpl::GetVirtualSwitch", name_);
    std::optional<VswitchRecord> stored = Detail::Get<VswitchRecord>(store, vswitch);
    if (!stored) throw HostCtlException(HostCtl::Network::UnknownVirtualSwitchMessage(vswitch));
    return std::make_shared<const VswitchRecord>(std::move(*stored));
}

int PortGroupImpl::GetActiveClients() const {
    Store::HostStore& store = Detail::EnterOperation("PortGroupImpl::GetActiveClients", name_);
    if (activeClients_) return *activeClients_;
    return static_cast<int>(store.CountChildren(
        PortRecord::kSection, GetVirtualSwitchName(),
        {FieldTest{PortRecord::kPortGroupField, name_}, FieldTest{PortRecord::kClientField, std::nullopt}}));
}

std::string PortGroupImpl::GetName() const {
    return name_;
}

std::string PortGroupImpl::GetVirtualSwitchName() const {
    return Stored().vswitch;
}

std::unique_ptr<VirtualSwitch> PortGroupImpl::GetVirtualSwitch() const {
    return std::make_unique<VirtualSwitchImpl>(SwitchRecord());
}

int PortGroupImpl::GetVlanId() const {
    return Stored().vlanId;
}

void PortGroupImpl::SetVlanId(long long vlanId) {
    if (vlanId < MIN_VLAN_ID || vlanId > MAX_VLAN_ID) {
        throw HostCtlException("Invalid VLAN ID " + std::to_string(vlanId) + ": it must be between " +
                               std::to_string(MIN_VLAN_ID) + " and " + std::to_string(MAX_VLAN_ID));
    }
    record_ = Detail::ChangeStored<PortGroupRecord>(
        "PortGroupImpl::SetVlanId", name_, [&](Transaction&, auto& p) { p.vlanId = static_cast<int>(vlanId); });
}

NicTeamingPolicy PortGroupImpl::GetTeamingPolicy() const {
    return InForce<NicTeamingPolicy>(*SwitchRecord(), Stored());
}
NicTeamingPolicy PortGroupImpl::GetOwnTeamingPolicy() const {
    return Detail::OwnPolicy<NicTeamingPolicy>(Stored());
}
void PortGroupImpl::SetOwnTeamingPolicy(const NicTeamingPolicy& policy) {
    record_ = WriteOwnPolicy("PortGroupImpl::SetOwnTeamingPolicy", Stored(), policy);
}

PortSecurityPolicy PortGroupImpl::GetSecurityPolicy() const {
    return InForce<PortSecurityPolicy>(*SwitchRecord(), Stored());
}
PortSecurityPolicy PortGroupImpl::GetOwnSecurityPolicy() const {
    return Detail::OwnPolicy<PortSecurityPolicy>(Stored());
}
void PortGroupImpl::SetOwnSecurityPolicy(const PortSecurityPolicy& policy) {
    record_ = WriteOwnPolicy("PortGroupImpl::SetOwnSecurityPolicy", Stored(), policy);
}

ShapingPolicy PortGroupImpl::GetShapingPolicy() const {
    return InForce<ShapingPolicy>(*SwitchRecord(), Stored());
}
ShapingPolicy PortGroupImpl::GetOwnShapingPolicy() const {
    return Detail::OwnPolicy<ShapingPolicy>(Stored());
}
void PortGroupImpl::SetOwnShapingPolicy(const ShapingPolicy& policy) {
    record_ = WriteOwnPolicy("PortGroupImpl::SetOwnShapingPolicy", Stored(), policy);
}

int PortGroupImpl::GetType() const {
    return TYPE_PORT_GROUP;
}

std::string PortGroupImpl::GetPortsetName() const {
    return GetVirtualSwitchName();
}

std::string PortGroupImpl::GetPortGroupName() const {
    return name_;
}

HostCtl::Network::DVPortParam PortGroupImpl::GetDVPortParam() const {
    return {};
}

HostCtl::Network::OpaqueNetworkParam PortGroupImpl::GetOpaqueNetworkParam() const {
    return {};
}

bool PortGroupImpl::IsValid() const {
    try {
        Stored();
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

}  // namespace Network
}  // namespace PldCtl
