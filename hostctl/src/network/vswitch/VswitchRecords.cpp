#include "network/vswitch/VswitchRecords.h"

#include "hostctl/Lib.h"
#include "hostctl/network/vswitch/VswitchTables.h"
#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

using HostCtl::Network::LinkCriteriaSelectionPolicy;
using HostCtl::Network::NicTeamingPolicy;
using HostCtl::Network::PortSecurityPolicy;
using HostCtl::Network::ShapingPolicy;

// The stored field names of each record, one field a line.
// clang-format off
template <>
struct RecordFields<TeamingRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("loadBalancing", &TeamingRecord::loadBalancing),
            Field("beacon", &TeamingRecord::beacon),
            Field("notifySwitches", &TeamingRecord::notifySwitches),
            Field("rollingRestoration", &TeamingRecord::rollingRestoration),
            Field("uplinkOrder", &TeamingRecord::uplinkOrder),
            Field("maxActive", &TeamingRecord::maxActive));
    }
};

template <>
struct RecordFields<SecurityRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("allowPromiscuous", &SecurityRecord::allowPromiscuous),
            Field("allowMacChange", &SecurityRecord::allowMacChange),
            Field("allowForgedTransmits", &SecurityRecord::allowForgedTransmits));
    }
};

template <>
struct RecordFields<ShapingRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("enabled", &ShapingRecord::enabled),
            Field("averageBps", &ShapingRecord::averageBps),
            Field("peakBps", &ShapingRecord::peakBps),
            Field("burstBytes", &ShapingRecord::burstBytes));
    }
};

template <>
struct RecordFields<BeaconRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("interval", &BeaconRecord::interval),
            Field("threshold", &BeaconRecord::threshold));
    }
};

template <>
struct RecordFields<CapabilitiesRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("checksumOffload", &CapabilitiesRecord::checksumOffload),
            Field("segmentationOffload", &CapabilitiesRecord::segmentationOffload),
            Field("vlanTagging", &CapabilitiesRecord::vlanTagging));
    }
};

template <>
struct RecordFields<VswitchRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &VswitchRecord::name),
            Field("class", &VswitchRecord::className),
            Field(VswitchRecord::kNumPortsField, &VswitchRecord::numPorts),
            Field("mtu", &VswitchRecord::mtu),
            Field("cdp", &VswitchRecord::cdp),
            Field("beacon", &VswitchRecord::beacon),
            Field("uplinks", &VswitchRecord::uplinks),
            Field("teaming", &VswitchRecord::teaming),
            Field("security", &VswitchRecord::security),
            Field("shaping", &VswitchRecord::shaping),
            Field("capabilities", &VswitchRecord::capabilities));
    }
};

template <>
struct RecordFields<PortGroupRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &PortGroupRecord::name),
            Field("vswitch", &PortGroupRecord::vswitch),
            Field("vlanId", &PortGroupRecord::vlanId),
            Field("teaming", &PortGroupRecord::teaming),
            Field("security", &PortGroupRecord::security),
            Field("shaping", &PortGroupRecord::shaping));
    }
};

// clang-format on

NicTeamingPolicy ToPolicy(const TeamingRecord& record) {
    NicTeamingPolicy policy;
    if (record.loadBalancing) {
        const auto& words = HostCtl::Network::kLoadBalancingWords;
        auto known = std::find_if(words.begin(), words.end(),
                                  [&](const auto& entry) { return *record.loadBalancing == entry.word; });
        if (known == words.end()) {
            throw HostCtl::Lib::HostCtlException("The host holds an unknown load balancing policy '" +
                                                 *record.loadBalancing + "'");
        }
        policy.SetTeamingPolicy(known->type);
    }
    if (record.beacon) {
        LinkCriteriaSelectionPolicy criteria;
        criteria.SetBeacon(!*record.beacon);
        policy.SetLinkCriteria(criteria);
    }
    if (record.notifySwitches) policy.SetNotifySwitchOnFailure(*record.notifySwitches);
    if (record.rollingRestoration) policy.SetRollingRestoration(*record.rollingRestoration);
    if (record.uplinkOrder) policy.SetUplinkOrder(*record.uplinkOrder);
    if (record.maxActive) policy.SetMaxActiveUplinks(*record.maxActive);
    return policy;
}

TeamingRecord FromPolicy(const NicTeamingPolicy& policy) {
    TeamingRecord record;
    if (policy.IsTeamingPolicySet()) {
        for (const auto& entry : HostCtl::Network::kLoadBalancingWords) {
            if (entry.type == policy.GetTeamingPolicy()) record.loadBalancing = entry.word;
        }
    }
    if (policy.IsLinkCriteriaSet()) record.beacon = policy.GetLinkCriteria().IsBeaconChecking();
    if (policy.IsNotifySwitchOnFailureSet()) record.notifySwitches = policy.GetNotifySwitchOnFailure();
    if (policy.IsRollingRestorationSet()) record.rollingRestoration = policy.GetRollingRestoration();
    if (policy.IsUplinkOrderSet()) record.uplinkOrder = policy.GetUplinkOrder();
    if (policy.IsMaxActiveUplinksSet()) record.maxActive = policy.GetMaxActiveUplinks();
    return record;
}

PortSecurityPolicy ToPolicy(const SecurityRecord& record) {
    PortSecurityPolicy policy;
    if (record.allowPromiscuous) policy.SetAllowPromiscuous(*record.allowPromiscuous);
    if (record.allowMacChange) policy.SetAllowMacAddressChange(*record.allowMacChange);
    if (record.allowForgedTransmits) policy.SetAllowForgedTransmits(*record.allowForgedTransmits);
    return policy;
}

SecurityRecord FromPolicy(const PortSecurityPolicy& policy) {
    SecurityRecord record;
    if (policy.IsAllowPromiscuousSet()) record.allowPromiscuous = policy.GetAllowPromiscuous();
    if (policy.IsAllowMacAddressChangeSet()) record.allowMacChange = policy.GetAllowMacAddressChange();
    if (policy.IsAllowForgedTransmitsSet()) record.allowForgedTransmits = policy.GetAllowForgedTransmits();
    return record;
}

ShapingPolicy ToPolicy(const ShapingRecord& record) {
    ShapingPolicy policy;
    if (record.enabled) policy.SetEnabled(*record.enabled);
    if (record.averageBps) policy.SetAverageBps(*record.averageBps);
    if (record.peakBps) policy.SetPeakBps(*record.peakBps);
    if (record.burstBytes) policy.SetBurstSize(*record.burstBytes);
    return policy;
}

ShapingRecord FromPolicy(const ShapingPolicy& policy) {
    ShapingRecord record;
    if (policy.IsEnabledSet()) record.enabled = policy.GetEnabled();
    if (policy.IsAverageBpsSet()) record.averageBps = policy.GetAverageBps();
    if (policy.IsPeakBpsSet()) record.peakBps = policy.GetPeakBps();
    if (policy.IsBurstSizeSet()) record.burstBytes = policy.GetBurstSize();
    return record;
}

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::TeamingRecord);
STORED_RECORD(PldCtl::Detail::SecurityRecord);
STORED_RECORD(PldCtl::Detail::ShapingRecord);
STORED_RECORD(PldCtl::Detail::VswitchRecord);
STORED_RECORD(PldCtl::Detail::PortGroupRecord);
