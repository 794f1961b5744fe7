// The host-control library's interface of one kernel IP interface (a
// Pallad network interface, pld0 to pld255). Objects are snapshots of the
// interface when it was fetched; every change is one transaction and throws
// HostCtl::Lib::HostCtlException, writing nothing, when the host refuses it.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/Values.h"
#include "hostctl/network/ConnectionPoint.h"
#include "hostctl/network/ip/IpConfig.h"

namespace HostCtl {
namespace Network {

// The kinds of traffic an interface is tagged for. 1 to 8 are tags;
// PLDNIC_TAG_INVALID is what a name no tag has maps to.
enum PldNicTagType : int {
    PLDNIC_TAG_MANAGEMENT = 1,
    PLDNIC_TAG_LIVE_MIGRATION = 2,
    PLDNIC_TAG_FAULT_TOLERANCE = 3,
    PLDNIC_TAG_BACKUP = 4,
    PLDNIC_TAG_REPLICATION = 5,
    PLDNIC_TAG_PROVISIONING = 6,
    PLDNIC_TAG_STORAGE = 7,
    PLDNIC_TAG_TELEMETRY = 8,
    PLDNIC_TAG_INVALID = 9,
};

class HOSTCTL_EXPORT PldNic {
public:
    static constexpr int MIN_MTU = 1280;
    static constexpr int MAX_MTU = 9000;

    virtual ~PldNic();

    virtual std::string GetName() const = 0;
    virtual MacAddress GetMacAddress() const = 0;
    virtual int GetMtu() const = 0;
    // Throws for an MTU outside MIN_MTU to MAX_MTU (the value is never
    // narrowed).
    virtual void SetMtu(std::int64_t mtu) = 0;
    virtual int GetTsoMss() const = 0;
    virtual bool IsEnabled() const = 0;
    virtual void Enable() = 0;
    virtual void Disable() = 0;
    // Null for an interface without a connection point.
    virtual std::unique_ptr<ConnectionPoint> GetConnectionPoint() const = 0;
    // The id of the interface's port; 0 without a connection point.
    virtual std::int64_t GetPortId() const = 0;
    // The key of its netstack instance.
    virtual std::string GetNetstackInstance() const = 0;

    // The interface's IP configuration. Its DNS-from-DHCP flag is not filled
    // in (it reads false): GetDnsConfig carries the flag in force.
    virtual IpConfig GetIpConfig() const = 0;
    virtual IpConfig GetDnsConfig() const = 0;
    // Writes the whole configuration, the DNS-from-DHCP flag included.
    virtual void SetIpConfig(const IpConfig& config) = 0;

    // In the order they were added.
    virtual std::vector<PldNicTagType> GetTags() const = 0;
    // Adding a tag the interface has already changes nothing. `persistOnly`
    // is accepted for callers that pass it and has no effect here.
    virtual void AddTag(PldNicTagType tag, bool persistOnly) = 0;
    // Removing a tag the interface does not have changes nothing.
    virtual void RemoveTag(PldNicTagType tag) = 0;
    // Removes the interface from the host, with its port.
    virtual void Remove() = 0;
};

}  // namespace Network
}  // namespace HostCtl
