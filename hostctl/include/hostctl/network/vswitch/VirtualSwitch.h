// The host-control library's view of standard switches and port groups, as
// interfaces. Every object and vector the library hands out is new and
// belongs to the caller.
//
// Objects are snapshots: a switch or port group object holds the state it
// had when it was fetched (or last changed through it). Operations that
// change the host are each one transaction, and throw
// HostCtl::Lib::HostCtlException with a message for the user when the host
// refuses them.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/nic/Pnic.h"
#include "hostctl/network/port/Port.h"
#include "hostctl/network/vswitch/Policy.h"

namespace HostCtl {
namespace Network {

class PortGroup;

// A set of ports: a standard or a distributed switch.
class HOSTCTL_EXPORT Portset {
public:
    // The ports a new switch gets when none are asked for.
    static constexpr int DEF_NUM_PORTS = 128;
    // The most ports one switch may have.
    static constexpr int MAX_NUM_PORTS = 4096;

    virtual ~Portset();

    virtual std::string GetName() const = 0;
    virtual std::string GetClassName() const = 0;
    // The ports the switch may have.
    virtual int GetNumPorts() const = 0;
    // The ports in use by a client (a virtual NIC, a kernel interface, an uplink).
    virtual int GetNumUsedPorts() const = 0;
    // The ports that exist.
    virtual int GetNumConfiguredPorts() const = 0;
    // The names of its uplinks, in order.
    virtual std::vector<std::string> GetUplinks() const = 0;
    // The per-VLAN packet counters of one of its uplinks, one entry per VLAN
    // seen, in the order they were seen; empty while counting is off. Throws
    // for a name that is not an uplink of this switch.
    virtual std::vector<std::unique_ptr<VlanStats>> GetUplinkVlanStats(const std::string& uplink) const = 0;
    // Turns per-VLAN counting of one uplink on or off; turning it off drops
    // the counters. Throws for a name that is not an uplink of this switch.
    virtual void SetUplinkVlanStatsEnabled(const std::string& uplink, bool enabled) = 0;
    // Its ports, by ascending id.
    virtual std::vector<std::unique_ptr<Port>> GetPorts() const = 0;
};

// A standard virtual switch.
class HOSTCTL_EXPORT VirtualSwitch : public virtual Portset {
public:
    ~VirtualSwitch() override;

    virtual int GetMTU() const = 0;
    // Throws for an MTU outside PldNic::MIN_MTU to PldNic::MAX_MTU.
    virtual void SetMTU(long long mtu) = 0;
    // "down", "listen", "advertise" or "both".
    virtual std::string GetCDPStatus() const = 0;
    // 0 down, 1 listen, 2 advertise, 3 both; throws for any other index.
    virtual void SetCDPStatus(int index) = 0;

    // Whether the switch's failover policy detects failures by beacon probing.
    virtual bool IsBeaconEnabled() const = 0;
    virtual int GetBeaconInterval() const = 0;
    virtual int GetBeaconThreshold() const = 0;
    // The port groups of the switch whose policy in force probes beacons.
    virtual std::vector<std::string> GetBeaconRequiredBy() const = 0;

    virtual std::vector<std::unique_ptr<PortGroup>> GetPortGroups() const = 0;
    // Throws for a name in use on the host or not fit for a port group.
    virtual std::unique_ptr<PortGroup> AddPortGroup(const std::string& name) = 0;
    // Throws for a port group the switch does not have, or one in use.
    virtual void RemovePortGroup(const std::string& name) = 0;

    // Throws for a NIC the host does not have or that is an uplink already,
    // or when the switch has no free port.
    virtual void AddUplink(const std::string& nic) = 0;
    // Throws for a NIC that is not an uplink of this switch. The failover
    // policies of the switch and its port groups keep naming the NIC:
    // changing them is a step of its own.
    virtual void RemoveUplink(const std::string& nic) = 0;

    // The failover policy shown as the switch's, and the one that is edited
    // and written back (for a standard switch the same policy).
    virtual NicTeamingPolicy GetTeamingPolicy() const = 0;
    virtual NicTeamingPolicy GetConfiguredTeamingPolicy() const = 0;
    virtual void SetTeamingPolicy(const NicTeamingPolicy& policy) = 0;
    virtual PortSecurityPolicy GetSecurityPolicy() const = 0;
    virtual void SetSecurityPolicy(const PortSecurityPolicy& policy) = 0;
    virtual ShapingPolicy GetShapingPolicy() const = 0;
    virtual void SetShapingPolicy(const ShapingPolicy& policy) = 0;
};

// A port group of a standard switch.
class HOSTCTL_EXPORT PortGroup {
public:
    static constexpr std::uint16_t MIN_VLAN_ID = 0;
    static constexpr std::uint16_t MAX_VLAN_ID = 4095;

    virtual ~PortGroup();

    virtual std::string GetName() const = 0;
    virtual std::string GetVirtualSwitchName() const = 0;
    virtual std::unique_ptr<VirtualSwitch> GetVirtualSwitch() const = 0;
    virtual int GetVlanId() const = 0;
    // Throws for an ID outside MIN_VLAN_ID to MAX_VLAN_ID.
    virtual void SetVlanId(long long vlanId) = 0;

    // For each policy: the one in force (the switch's, with the port
    // group's own fields laid over it), the port group's own (only the
    // fields it overrides are set), and the setter of its own.
    virtual NicTeamingPolicy GetTeamingPolicy() const = 0;
    virtual NicTeamingPolicy GetOwnTeamingPolicy() const = 0;
    virtual void SetOwnTeamingPolicy(const NicTeamingPolicy& policy) = 0;
    virtual PortSecurityPolicy GetSecurityPolicy() const = 0;
    virtual PortSecurityPolicy GetOwnSecurityPolicy() const = 0;
    virtual void SetOwnSecurityPolicy(const PortSecurityPolicy& policy) = 0;
    virtual ShapingPolicy GetShapingPolicy() const = 0;
    virtual ShapingPolicy GetOwnShapingPolicy() const = 0;
    virtual void SetOwnShapingPolicy(const ShapingPolicy& policy) = 0;
};

}  // namespace Network
}  // namespace HostCtl
