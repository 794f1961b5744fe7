#include "hostctl/network/vswitch/Policy.h"

#include "hostctl/Lib.h"

namespace HostCtl {
namespace Network {

namespace {

// The defaults of a new switch's shaping policy.
constexpr unsigned long long kDefaultBandwidthBps = 100000000ULL;  // 100 Mbit/s
constexpr unsigned long long kDefaultBurstBytes = 104857600ULL;    // 100 MiB

// The field of `own` where it is set, else this policy's.
template <typename T>
void Overlay(std::optional<T>& field, const std::optional<T>& own) {
    if (own) field = own;
}

}  // namespace

NicTeamingPolicy NicTeamingPolicy::GetDefaultPolicy() {
    NicTeamingPolicy p;
    p.teamPolicy_ = TEAM_PORT_ID;
    p.linkCriteria_ = LinkCriteriaSelectionPolicy();
    p.notifySwitches_ = true;
    p.rollingRestoration_ = false;
    p.uplinkOrder_ = std::vector<std::string>();
    p.maxActive_ = 1;
    return p;
}

TeamPolicyType NicTeamingPolicy::GetTeamingPolicy() const {
    return teamPolicy_.value_or(TEAM_PORT_ID);
}
LinkCriteriaSelectionPolicy NicTeamingPolicy::GetLinkCriteria() const {
    return linkCriteria_.value_or(LinkCriteriaSelectionPolicy());
}
bool NicTeamingPolicy::GetNotifySwitchOnFailure() const {
    return notifySwitches_.value_or(true);
}
bool NicTeamingPolicy::GetRollingRestoration() const {
    return rollingRestoration_.value_or(false);
}
std::vector<std::string> NicTeamingPolicy::GetUplinkOrder() const {
    return uplinkOrder_.value_or(std::vector<std::string>());
}
int NicTeamingPolicy::GetMaxActiveUplinks() const {
    return maxActive_.value_or(1);
}

void NicTeamingPolicy::SetTeamingPolicy(TeamPolicyType type) {
    if (type < TEAM_IP_HASH || type > TEAM_EXPLICIT) {
        throw Lib::HostCtlException("Invalid load balancing policy type " + std::to_string(static_cast<int>(type)));
    }
    teamPolicy_ = type;
}

void NicTeamingPolicy::SetMaxActiveUplinks(int count) {
    if (count < 0) {
        throw Lib::HostCtlException("Invalid number of active uplinks " + std::to_string(count) +
                                    ": it cannot be negative");
    }
    maxActive_ = count;
}

void NicTeamingPolicy::UnsetAll() {
    *this = NicTeamingPolicy();
}

NicTeamingPolicy NicTeamingPolicy::OverlaidWith(const NicTeamingPolicy& own) const {
    NicTeamingPolicy merged = *this;
    Overlay(merged.teamPolicy_, own.teamPolicy_);
    Overlay(merged.linkCriteria_, own.linkCriteria_);
    Overlay(merged.notifySwitches_, own.notifySwitches_);
    Overlay(merged.rollingRestoration_, own.rollingRestoration_);
    Overlay(merged.uplinkOrder_, own.uplinkOrder_);
    Overlay(merged.maxActive_, own.maxActive_);
    return merged;
}

bool NicTeamingPolicy::operator==(const NicTeamingPolicy& o) const {
    return teamPolicy_ == o.teamPolicy_ && linkCriteria_ == o.linkCriteria_ && notifySwitches_ == o.notifySwitches_ &&
           rollingRestoration_ == o.rollingRestoration_ && uplinkOrder_ == o.uplinkOrder_ && maxActive_ == o.maxActive_;
}

PortSecurityPolicy PortSecurityPolicy::GetDefaultPolicy() {
    PortSecurityPolicy p;
    p.promiscuous_ = false;
    p.macChange_ = true;
    p.forgedTransmits_ = true;
    return p;
}

bool PortSecurityPolicy::GetAllowPromiscuous() const {
    return promiscuous_.value_or(false);
}
bool PortSecurityPolicy::GetAllowMacAddressChange() const {
    return macChange_.value_or(true);
}
bool PortSecurityPolicy::GetAllowForgedTransmits() const {
    return forgedTransmits_.value_or(true);
}

void PortSecurityPolicy::UnsetAll() {
    *this = PortSecurityPolicy();
}

PortSecurityPolicy PortSecurityPolicy::OverlaidWith(const PortSecurityPolicy& own) const {
    PortSecurityPolicy merged = *this;
    Overlay(merged.promiscuous_, own.promiscuous_);
    Overlay(merged.macChange_, own.macChange_);
    Overlay(merged.forgedTransmits_, own.forgedTransmits_);
    return merged;
}

bool PortSecurityPolicy::operator==(const PortSecurityPolicy& o) const {
    return promiscuous_ == o.promiscuous_ && macChange_ == o.macChange_ && forgedTransmits_ == o.forgedTransmits_;
}

ShapingPolicy ShapingPolicy::GetDefaultPolicy() {
    ShapingPolicy p;
    p.enabled_ = false;
    p.averageBps_ = kDefaultBandwidthBps;
    p.peakBps_ = kDefaultBandwidthBps;
    p.burstSize_ = kDefaultBurstBytes;
    return p;
}

bool ShapingPolicy::GetEnabled() const {
    return enabled_.value_or(false);
}
unsigned long long ShapingPolicy::GetAverageBps() const {
    return averageBps_.value_or(kDefaultBandwidthBps);
}
unsigned long long ShapingPolicy::GetPeakBps() const {
    return peakBps_.value_or(kDefaultBandwidthBps);
}
unsigned long long ShapingPolicy::GetBurstSize() const {
    return burstSize_.value_or(kDefaultBurstBytes);
}

void ShapingPolicy::UnsetAll() {
    *this = ShapingPolicy();
}

ShapingPolicy ShapingPolicy::OverlaidWith(const ShapingPolicy& own) const {
    ShapingPolicy merged = *this;
    Overlay(merged.enabled_, own.enabled_);
    Overlay(merged.averageBps_, own.averageBps_);
    Overlay(merged.peakBps_, own.peakBps_);
    Overlay(merged.burstSize_, own.burstSize_);
    return merged;
}

bool ShapingPolicy::operator==(const ShapingPolicy& o) const {
    return enabled_ == o.enabled_ && averageBps_ == o.averageBps_ && peakBps_ == o.peakBps_ &&
           burstSize_ == o.burstSize_;
}

NicCapabilities NicCapabilities::GetDefaultPolicy() {
    return NicCapabilities();
}

}  // namespace Network
}  // namespace HostCtl
