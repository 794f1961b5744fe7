#include "network/Document.h"

#include "hostctl/Lib.h"

namespace PldCtl {
namespace Detail {

using HostCtl::Network::LinkCriteriaSelectionPolicy;
using HostCtl::Network::NicTeamingPolicy;
using HostCtl::Network::PortSecurityPolicy;
using HostCtl::Network::ShapingPolicy;
using HostCtl::Network::TeamPolicyType;
using Store::Json;

namespace {

// The load-balancing words of stored policies, by type.
const char* const kLoadBalancingWords[] = {"", "iphash", "srcmac", "srcport", "explicit"};

TeamPolicyType TeamTypeFromWord(const std::string& word) {
    for (int type = HostCtl::Network::TEAM_IP_HASH; type <= HostCtl::Network::TEAM_EXPLICIT; ++type) {
        if (word == kLoadBalancingWords[type]) return static_cast<TeamPolicyType>(type);
    }
    throw HostCtl::Lib::HostCtlException("The host holds an unknown load balancing policy '" + word + "'");
}

// Calls `set` with the field's value when the object has the field.
template <typename T, typename Setter>
void IfPresent(const Json& json, const char* field, Setter set) {
    auto it = json.find(field);
    if (it != json.end() && !it->is_null()) set(it->get<T>());
}

}  // namespace

NicTeamingPolicy TeamingFromJson(const Json& json) {
    NicTeamingPolicy p;
    if (!json.is_object()) return p;
    IfPresent<std::string>(json, "loadBalancing",
                           [&](const std::string& w) { p.SetTeamingPolicy(TeamTypeFromWord(w)); });
    IfPresent<bool>(json, "beacon", [&](bool beacon) {
        LinkCriteriaSelectionPolicy criteria;
        criteria.SetBeacon(!beacon);
        p.SetLinkCriteria(criteria);
    });
    IfPresent<bool>(json, "notifySwitches", [&](bool v) { p.SetNotifySwitchOnFailure(v); });
    IfPresent<bool>(json, "rollingRestoration", [&](bool v) { p.SetRollingRestoration(v); });
    IfPresent<std::vector<std::string>>(json, "uplinkOrder",
                                        [&](const std::vector<std::string>& v) { p.SetUplinkOrder(v); });
    IfPresent<int>(json, "maxActive", [&](int v) { p.SetMaxActiveUplinks(v); });
    return p;
}

Json TeamingToJson(const NicTeamingPolicy& p) {
    Json json = Json::object();
    if (p.IsTeamingPolicySet()) json["loadBalancing"] = kLoadBalancingWords[p.GetTeamingPolicy()];
    if (p.IsLinkCriteriaSet()) json["beacon"] = p.GetLinkCriteria().IsBeaconChecking();
    if (p.IsNotifySwitchOnFailureSet()) json["notifySwitches"] = p.GetNotifySwitchOnFailure();
    if (p.IsRollingRestorationSet()) json["rollingRestoration"] = p.GetRollingRestoration();
    if (p.IsUplinkOrderSet()) json["uplinkOrder"] = p.GetUplinkOrder();
    if (p.IsMaxActiveUplinksSet()) json["maxActive"] = p.GetMaxActiveUplinks();
    return json;
}

PortSecurityPolicy SecurityFromJson(const Json& json) {
    PortSecurityPolicy p;
    if (!json.is_object()) return p;
    IfPresent<bool>(json, "allowPromiscuous", [&](bool v) { p.SetAllowPromiscuous(v); });
    IfPresent<bool>(json, "allowMacChange", [&](bool v) { p.SetAllowMacAddressChange(v); });
    IfPresent<bool>(json, "allowForgedTransmits", [&](bool v) { p.SetAllowForgedTransmits(v); });
    return p;
}

Json SecurityToJson(const PortSecurityPolicy& p) {
    Json json = Json::object();
    if (p.IsAllowPromiscuousSet()) json["allowPromiscuous"] = p.GetAllowPromiscuous();
    if (p.IsAllowMacAddressChangeSet()) json["allowMacChange"] = p.GetAllowMacAddressChange();
    if (p.IsAllowForgedTransmitsSet()) json["allowForgedTransmits"] = p.GetAllowForgedTransmits();
    return json;
}

ShapingPolicy ShapingFromJson(const Json& json) {
    ShapingPolicy p;
    if (!json.is_object()) return p;
    IfPresent<bool>(json, "enabled", [&](bool v) { p.SetEnabled(v); });
    IfPresent<unsigned long long>(json, "averageBps", [&](unsigned long long v) { p.SetAverageBps(v); });
    IfPresent<unsigned long long>(json, "peakBps", [&](unsigned long long v) { p.SetPeakBps(v); });
    IfPresent<unsigned long long>(json, "burstBytes", [&](unsigned long long v) { p.SetBurstSize(v); });
    return p;
}

Json ShapingToJson(const ShapingPolicy& p) {
    Json json = Json::object();
    if (p.IsEnabledSet()) json["enabled"] = p.GetEnabled();
    if (p.IsAverageBpsSet()) json["averageBps"] = p.GetAverageBps();
    if (p.IsPeakBpsSet()) json["peakBps"] = p.GetPeakBps();
    if (p.IsBurstSizeSet()) json["burstBytes"] = p.GetBurstSize();
    return json;
}

}  // namespace Detail
}  // namespace PldCtl
