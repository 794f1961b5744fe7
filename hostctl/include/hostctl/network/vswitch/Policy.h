// The policies of standard switches and port groups: failover (NIC
// teaming), port security and traffic shaping.
//
// Every field carries its own "is set" mark. A switch's policies have every
// field set; a port group's own policy has only the fields it overrides, and
// the policy in force for the port group is its switch's policy with those
// fields laid over it (OverlaidWith). A getter of a field that is not set
// returns the default value of GetDefaultPolicy().
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>
#include "hostctl/Export.h"

namespace HostCtl {
namespace Network {

// How a team of uplinks spreads traffic.
enum TeamPolicyType {
    TEAM_IP_HASH = 1,   // hash of source and destination IP
    TEAM_SRC_MAC = 2,   // source MAC address
    TEAM_PORT_ID = 3,   // originating virtual port
    TEAM_EXPLICIT = 4,  // first active uplink that passes failure detection
};

// How a failed uplink is detected.
class HOSTCTL_EXPORT LinkCriteriaSelectionPolicy {
public:
    LinkCriteriaSelectionPolicy() = default;

    // true: by link state only; false: by beacon probing as well.
    void SetBeacon(bool linkStateOnly) { beaconChecking_ = !linkStateOnly; }
    // Whether beacon probing is in force.
    bool IsBeaconChecking() const { return beaconChecking_; }

    bool operator==(const LinkCriteriaSelectionPolicy& o) const { return beaconChecking_ == o.beaconChecking_; }

private:
    bool beaconChecking_ = false;
};

class HOSTCTL_EXPORT NicTeamingPolicy {
public:
    // Port ID load balancing, link state detection, notify switches, no
    // rolling restoration, an empty uplink order, one active uplink.
    static NicTeamingPolicy GetDefaultPolicy();

    TeamPolicyType GetTeamingPolicy() const;
    LinkCriteriaSelectionPolicy GetLinkCriteria() const;
    bool GetNotifySwitchOnFailure() const;
    bool GetRollingRestoration() const;
    std::vector<std::string> GetUplinkOrder() const;
    int GetMaxActiveUplinks() const;

    // Throw HostCtlException for a type outside 1-4 or a negative count.
    void SetTeamingPolicy(TeamPolicyType type);
    void SetLinkCriteria(const LinkCriteriaSelectionPolicy& criteria) { linkCriteria_ = criteria; }
    void SetNotifySwitchOnFailure(bool notify) { notifySwitches_ = notify; }
    void SetRollingRestoration(bool rolling) { rollingRestoration_ = rolling; }
    void SetUplinkOrder(const std::vector<std::string>& order) { uplinkOrder_ = order; }
    void SetMaxActiveUplinks(int count);

    bool IsTeamingPolicySet() const { return teamPolicy_.has_value(); }
    bool IsLinkCriteriaSet() const { return linkCriteria_.has_value(); }
    bool IsNotifySwitchOnFailureSet() const { return notifySwitches_.has_value(); }
    bool IsRollingRestorationSet() const { return rollingRestoration_.has_value(); }
    bool IsUplinkOrderSet() const { return uplinkOrder_.has_value(); }
    bool IsMaxActiveUplinksSet() const { return maxActive_.has_value(); }

    // Clears every mark: as a port group's own policy, it inherits all.
    void UnsetAll();
    // This policy with every field that `own` sets replaced by own's value.
    NicTeamingPolicy OverlaidWith(const NicTeamingPolicy& own) const;

    bool operator==(const NicTeamingPolicy& o) const;

private:
    std::optional<TeamPolicyType> teamPolicy_;
    std::optional<LinkCriteriaSelectionPolicy> linkCriteria_;
    std::optional<bool> notifySwitches_;
    std::optional<bool> rollingRestoration_;
    std::optional<std::vector<std::string>> uplinkOrder_;
    std::optional<int> maxActive_;
};

class HOSTCTL_EXPORT PortSecurityPolicy {
public:
    // No promiscuous mode; MAC changes and forged transmits allowed.
    static PortSecurityPolicy GetDefaultPolicy();

    bool GetAllowPromiscuous() const;
    bool GetAllowMacAddressChange() const;
    bool GetAllowForgedTransmits() const;
    void SetAllowPromiscuous(bool allow) { promiscuous_ = allow; }
    void SetAllowMacAddressChange(bool allow) { macChange_ = allow; }
    void SetAllowForgedTransmits(bool allow) { forgedTransmits_ = allow; }
    bool IsAllowPromiscuousSet() const { return promiscuous_.has_value(); }
    bool IsAllowMacAddressChangeSet() const { return macChange_.has_value(); }
    bool IsAllowForgedTransmitsSet() const { return forgedTransmits_.has_value(); }

    void UnsetAll();
    PortSecurityPolicy OverlaidWith(const PortSecurityPolicy& own) const;
    bool operator==(const PortSecurityPolicy& o) const;

private:
    std::optional<bool> promiscuous_;
    std::optional<bool> macChange_;
    std::optional<bool> forgedTransmits_;
};

// Bandwidths in bits per second, burst size in bytes.
class HOSTCTL_EXPORT ShapingPolicy {
public:
    // Disabled; 100 Mbit/s average and peak; 100 MiB burst.
    static ShapingPolicy GetDefaultPolicy();

    bool GetEnabled() const;
    unsigned long long GetAverageBps() const;
    unsigned long long GetPeakBps() const;
    unsigned long long GetBurstSize() const;
    void SetEnabled(bool enabled) { enabled_ = enabled; }
    void SetAverageBps(unsigned long long bps) { averageBps_ = bps; }
    void SetPeakBps(unsigned long long bps) { peakBps_ = bps; }
    void SetBurstSize(unsigned long long bytes) { burstSize_ = bytes; }
    bool IsEnabledSet() const { return enabled_.has_value(); }
    bool IsAverageBpsSet() const { return averageBps_.has_value(); }
    bool IsPeakBpsSet() const { return peakBps_.has_value(); }
    bool IsBurstSizeSet() const { return burstSize_.has_value(); }

    void UnsetAll();
    ShapingPolicy OverlaidWith(const ShapingPolicy& own) const;
    bool operator==(const ShapingPolicy& o) const;

private:
    std::optional<bool> enabled_;
    std::optional<unsigned long long> averageBps_;
    std::optional<unsigned long long> peakBps_;
    std::optional<unsigned long long> burstSize_;
};

// The offloads a switch offers its ports.
class HOSTCTL_EXPORT NicCapabilities {
public:
    // Checksum offload, segmentation offload and VLAN tagging all on.
    static NicCapabilities GetDefaultPolicy();

    bool GetChecksumOffload() const { return checksumOffload_; }
    bool GetSegmentationOffload() const { return segmentationOffload_; }
    bool GetVlanTagging() const { return vlanTagging_; }
    void SetChecksumOffload(bool on) { checksumOffload_ = on; }
    void SetSegmentationOffload(bool on) { segmentationOffload_ = on; }
    void SetVlanTagging(bool on) { vlanTagging_ = on; }

private:
    bool checksumOffload_ = true;
    bool segmentationOffload_ = true;
    bool vlanTagging_ = true;
};

}  // namespace Network
}  // namespace HostCtl
