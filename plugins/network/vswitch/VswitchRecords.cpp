#include "vswitch/VswitchRecords.h"

#include <algorithm>
#include <iterator>

#include "framework/Format.h"
#include "hostctl/network/vswitch/VswitchTables.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::NicTeamingPolicy;
using HostCtl::Network::PortSecurityPolicy;
using HostCtl::Network::ShapingPolicy;

namespace {

// Field names, each written once: the fields hints are built from the same
// names the records are filled with, so the two cannot drift apart.
const char kLoadBalancing[] = "Load Balancing";
const char kFailureDetection[] = "Network Failure Detection";
const char kNotifySwitches[] = "Notify Switches";
const char kFailback[] = "Failback";
const char kActiveAdapters[] = "Active Adapters";
const char kStandbyAdapters[] = "Standby Adapters";
const char kUnusedAdapters[] = "Unused Adapters";
const char kUplinks[] = "Uplinks";

const char kAllowPromiscuous[] = "Allow Promiscuous";
const char kAllowMacChange[] = "Allow MAC Address Change";
const char kAllowForgedTransmits[] = "Allow Forged Transmits";

const char kEnabled[] = "Enabled";
const char kAverageBandwidth[] = "Average Bandwidth";
const char kPeakBandwidth[] = "Peak Bandwidth";
const char kBurstSize[] = "Burst Size";

// The adapters share one override: a port group either keeps its switch's
// order and count or sets its own.
const std::vector<std::string> kFailoverFields = {kLoadBalancing,  kFailureDetection, kNotifySwitches, kFailback,
                                                  kActiveAdapters, kStandbyAdapters,  kUnusedAdapters};
const std::vector<std::string> kFailoverOverridden = {kLoadBalancing, kFailureDetection, kNotifySwitches, kFailback,
                                                      kUplinks};
const std::vector<std::string> kSecurityFields = {kAllowPromiscuous, kAllowMacChange, kAllowForgedTransmits};
const std::vector<std::string> kShapingFields = {kEnabled, kAverageBandwidth, kPeakBandwidth, kBurstSize};

std::string Override(const std::string& field) {
    return "Override Vswitch " + field;
}

const std::vector<std::string>& ValueFields(PolicyKind kind) {
    switch (kind) {
        case PolicyKind::Failover:
            return kFailoverFields;
        case PolicyKind::Security:
            return kSecurityFields;
        case PolicyKind::Shaping:
            break;
    }
    return kShapingFields;
}

// The settings a port group may override: for failover the adapters count
// as one, otherwise each value field is one.
const std::vector<std::string>& OverriddenSettings(PolicyKind kind) {
    return kind == PolicyKind::Failover ? kFailoverOverridden : ValueFields(kind);
}

// The word a failover policy's load balancing is shown with: the host's own.
const char* LoadBalancingWord(HostCtl::Network::TeamPolicyType type) {
    for (const auto& entry : HostCtl::Network::kLoadBalancingWords) {
        if (entry.type == type) return entry.word;
    }
    return "unknown";
}

constexpr long long kBitsPerKbit = 1000;
constexpr long long kBytesPerKib = 128;
// Shown for every value of a policy that does not shape.
constexpr long long kNotShaping = -1;

}  // namespace

void DescribePolicyFetcher(AutoCli::Command& command, PolicyKind kind, const std::string& record, bool withOverrides) {
    command.SetMetaDataField("type", "fetcher");
    command.SetDefaultOutputFormatter("simple");
    std::vector<std::string> fields = ValueFields(kind);
    if (withOverrides) {
        for (const std::string& setting : OverriddenSettings(kind)) fields.push_back(Override(setting));
    }
    command.SetDefaultOutputParameter("fields:" + record, AutoCli::JoinNames(fields, ","));
    command.SetDefaultOutputParameter("header:" + record, "<NONE>");
    if (kind == PolicyKind::Shaping) {
        for (const char* field : {kAverageBandwidth, kPeakBandwidth}) {
            command.SetDefaultOutputParameter("units:" + record + "." + field, "Kbps");
        }
        command.SetDefaultOutputParameter("units:" + record + "." + kBurstSize, "Kib");
    }
}

void FillPolicyFields(MetaObj::MetaStruct& record, const NicTeamingPolicy& policy,
                      const std::vector<std::string>& vswitchUplinks) {
    const std::vector<std::string> order = policy.GetUplinkOrder();
    // A count beyond the order makes every ordered adapter active, none standby.
    const auto activeEnd =
        order.begin() + std::clamp<std::ptrdiff_t>(policy.GetMaxActiveUplinks(), 0, std::ptrdiff_t(order.size()));
    std::vector<std::string> unused;
    std::copy_if(
        vswitchUplinks.begin(), vswitchUplinks.end(), std::back_inserter(unused),
        [&](const std::string& uplink) { return std::find(order.begin(), order.end(), uplink) == order.end(); });

    record.SetField(kLoadBalancing, LoadBalancingWord(policy.GetTeamingPolicy()));
    record.SetField(kFailureDetection, policy.GetLinkCriteria().IsBeaconChecking() ? "beacon" : "link");
    record.SetField(kNotifySwitches, policy.GetNotifySwitchOnFailure());
    record.SetField(kFailback, !policy.GetRollingRestoration());
    record.SetField(kActiveAdapters, std::vector<std::string>(order.begin(), activeEnd));
    record.SetField(kStandbyAdapters, std::vector<std::string>(activeEnd, order.end()));
    record.SetField(kUnusedAdapters, unused);
}

void FillPolicyFields(MetaObj::MetaStruct& record, const PortSecurityPolicy& policy) {
    record.SetField(kAllowPromiscuous, policy.GetAllowPromiscuous());
    record.SetField(kAllowMacChange, policy.GetAllowMacAddressChange());
    record.SetField(kAllowForgedTransmits, policy.GetAllowForgedTransmits());
}

void FillPolicyFields(MetaObj::MetaStruct& record, const ShapingPolicy& policy) {
    const bool enabled = policy.GetEnabled();
    // The library keeps unsigned values; divided down they fit a signed field.
    auto shown = [&](unsigned long long value, long long unit) {
        return enabled ? static_cast<long long>(value / static_cast<unsigned long long>(unit)) : kNotShaping;
    };
    record.SetField(kEnabled, enabled);
    record.SetField(kAverageBandwidth, shown(policy.GetAverageBps(), kBitsPerKbit));
    record.SetField(kPeakBandwidth, shown(policy.GetPeakBps(), kBitsPerKbit));
    record.SetField(kBurstSize, shown(policy.GetBurstSize(), kBytesPerKib));
}

void FillOverrideFields(MetaObj::MetaStruct& record, const NicTeamingPolicy& own) {
    record.SetField(Override(kLoadBalancing), own.IsTeamingPolicySet());
    record.SetField(Override(kFailureDetection), own.IsLinkCriteriaSet());
    record.SetField(Override(kNotifySwitches), own.IsNotifySwitchOnFailureSet());
    record.SetField(Override(kFailback), own.IsRollingRestorationSet());
    record.SetField(Override(kUplinks), own.IsUplinkOrderSet() || own.IsMaxActiveUplinksSet());
}

void FillOverrideFields(MetaObj::MetaStruct& record, const PortSecurityPolicy& own) {
    record.SetField(Override(kAllowPromiscuous), own.IsAllowPromiscuousSet());
    record.SetField(Override(kAllowMacChange), own.IsAllowMacAddressChangeSet());
    record.SetField(Override(kAllowForgedTransmits), own.IsAllowForgedTransmitsSet());
}

void FillOverrideFields(MetaObj::MetaStruct& record, const ShapingPolicy& own) {
    record.SetField(Override(kEnabled), own.IsEnabledSet());
    record.SetField(Override(kAverageBandwidth), own.IsAverageBpsSet());
    record.SetField(Override(kPeakBandwidth), own.IsPeakBpsSet());
    record.SetField(Override(kBurstSize), own.IsBurstSizeSet());
}

std::set<std::string> HostNicNames(PldCtl::Network::NetworkInfoImpl& networkInfo) {
    std::set<std::string> names;
    for (const auto& pnic : networkInfo.GetPnics()) names.insert(pnic->GetName());
    return names;
}

void KeepHostNics(std::vector<std::string>& uplinks, const std::set<std::string>& hostNics) {
    uplinks.erase(std::remove_if(uplinks.begin(), uplinks.end(),
                                 [&](const std::string& uplink) { return hostNics.count(uplink) == 0; }),
                  uplinks.end());
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
