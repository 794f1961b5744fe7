// The library's implementations of port sets, standard switches and port
// groups, and the entry classes that find and create them.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/ConnectionPoint.h"
#include "hostctl/network/dvs/DVSwitch.h"
#include "hostctl/network/port/Port.h"
#include "hostctl/network/vswitch/VirtualSwitch.h"

namespace PldCtl {
namespace Detail {
// The stored records of switches and port groups, private to the library.
struct VswitchRecord;
struct PortGroupRecord;
}  // namespace Detail

namespace Network {

// A port set as the host stores it; the base of every kind of switch.
class HOSTCTL_EXPORT PortsetImpl : public virtual HostCtl::Network::Portset {
public:
    ~PortsetImpl() override;

    // Whether the host has a standard switch of that name.
    static bool IsValidVirtualSwitch(const std::string& name);

    std::string GetName() const override;
    std::string GetClassName() const override;
    int GetNumPorts() const override;
    int GetNumUsedPorts() const override;
    int GetNumConfiguredPorts() const override;
    std::vector<std::string> GetUplinks() const override;
    std::vector<std::unique_ptr<HostCtl::Network::VlanStats>> GetUplinkVlanStats(
        const std::string& uplink) const override;
    void SetUplinkVlanStatsEnabled(const std::string& uplink, bool enabled) override;
    // Its ports, by ascending id, from one read (fault name
    // "PortsetImpl::GetPorts", keyed by the switch's name).
    std::vector<std::unique_ptr<HostCtl::Network::Port>> GetPorts() const override;
    // The UUID of a distributed switch; "" for a standard switch.
    virtual std::string GetSwitchUuid() const;

protected:
    explicit PortsetImpl(std::shared_ptr<const Detail::VswitchRecord> record,
                         std::optional<std::pair<int, int>> portCounts = std::nullopt);
    // Takes the stored object as a change left it.
    void Refresh(std::shared_ptr<const Detail::VswitchRecord> record);
    std::shared_ptr<const Detail::VswitchRecord> record_;

private:
    // Read from the host's ports on first use: configured, used.
    mutable std::optional<std::pair<int, int>> portCounts_;
    const std::pair<int, int>& PortCounts() const;
};

class HOSTCTL_EXPORT VirtualSwitchImpl : public PortsetImpl, public virtual HostCtl::Network::VirtualSwitch {
public:
    // A snapshot of a stored switch.
    explicit VirtualSwitchImpl(std::shared_ptr<const Detail::VswitchRecord> record);
    // The same, with the port counts (configured, used) and the port groups a
    // listing read for it.
    VirtualSwitchImpl(std::shared_ptr<const Detail::VswitchRecord> record, std::pair<int, int> portCounts,
                      std::vector<std::shared_ptr<const Detail::PortGroupRecord>> portGroups);
    ~VirtualSwitchImpl() override;

    int GetMTU() const override;
    void SetMTU(long long mtu) override;
    std::string GetCDPStatus() const override;
    void SetCDPStatus(int index) override;
    bool IsBeaconEnabled() const override;
    int GetBeaconInterval() const override;
    int GetBeaconThreshold() const override;
    std::vector<std::string> GetBeaconRequiredBy() const override;
    std::vector<std::unique_ptr<HostCtl::Network::PortGroup>> GetPortGroups() const override;
    std::unique_ptr<HostCtl::Network::PortGroup> AddPortGroup(const std::string& name) override;
    void RemovePortGroup(const std::string& name) override;
    void AddUplink(const std::string& nic) override;
    void RemoveUplink(const std::string& nic) override;
    HostCtl::Network::NicTeamingPolicy GetTeamingPolicy() const override;
    HostCtl::Network::NicTeamingPolicy GetConfiguredTeamingPolicy() const override;
    void SetTeamingPolicy(const HostCtl::Network::NicTeamingPolicy& policy) override;
    HostCtl::Network::PortSecurityPolicy GetSecurityPolicy() const override;
    void SetSecurityPolicy(const HostCtl::Network::PortSecurityPolicy& policy) override;
    HostCtl::Network::ShapingPolicy GetShapingPolicy() const override;
    void SetShapingPolicy(const HostCtl::Network::ShapingPolicy& policy) override;

private:
    // The switch's port groups as stored, read on first use: listing a switch
    // asks for them twice (names, and which of them require beaconing).
    const std::vector<std::shared_ptr<const Detail::PortGroupRecord>>& PortGroupRecords() const;
    mutable std::optional<std::vector<std::shared_ptr<const Detail::PortGroupRecord>>> portGroups_;
};

// A port group, found by name. Made from a name it never throws; its
// operations throw when the host has no port group of that name.
class HOSTCTL_EXPORT PortGroupImpl : public virtual HostCtl::Network::PortGroup,
                                     public virtual HostCtl::Network::ConnectionPoint {
public:
    explicit PortGroupImpl(const std::string& name);
    // A snapshot of a stored port group; a listing that counted the active
    // clients of every port group at once hands the count along.
    explicit PortGroupImpl(std::shared_ptr<const Detail::PortGroupRecord> record,
                           std::optional<int> activeClients = std::nullopt);
    ~PortGroupImpl() override;

    // The ports of the port group that are in use by a client.
    int GetActiveClients() const;

    std::string GetName() const override;
    std::string GetVirtualSwitchName() const override;
    std::unique_ptr<HostCtl::Network::VirtualSwitch> GetVirtualSwitch() const override;
    int GetVlanId() const override;
    void SetVlanId(long long vlanId) override;
    HostCtl::Network::NicTeamingPolicy GetTeamingPolicy() const override;
    HostCtl::Network::NicTeamingPolicy GetOwnTeamingPolicy() const override;
    void SetOwnTeamingPolicy(const HostCtl::Network::NicTeamingPolicy& policy) override;
    HostCtl::Network::PortSecurityPolicy GetSecurityPolicy() const override;
    HostCtl::Network::PortSecurityPolicy GetOwnSecurityPolicy() const override;
    void SetOwnSecurityPolicy(const HostCtl::Network::PortSecurityPolicy& policy) override;
    HostCtl::Network::ShapingPolicy GetShapingPolicy() const override;
    HostCtl::Network::ShapingPolicy GetOwnShapingPolicy() const override;
    void SetOwnShapingPolicy(const HostCtl::Network::ShapingPolicy& policy) override;

    // As a connection point: TYPE_PORT_GROUP, its switch and its name; valid
    // when the host has the port group.
    int GetType() const override;
    std::string GetPortsetName() const override;
    std::string GetPortGroupName() const override;
    HostCtl::Network::DVPortParam GetDVPortParam() const override;
    HostCtl::Network::OpaqueNetworkParam GetOpaqueNetworkParam() const override;
    bool IsValid() const override;

private:
    // The stored object, read on first use.
    const Detail::PortGroupRecord& Stored() const;
    // The switch's stored object, for the policies in force.
    std::shared_ptr<const Detail::VswitchRecord> SwitchRecord() const;
    std::string name_;
    mutable std::shared_ptr<const Detail::PortGroupRecord> record_;
    std::optional<int> activeClients_;
};

// The host's standard and distributed switches.
class HOSTCTL_EXPORT VirtualSwitchInfoImpl {
public:
    VirtualSwitchInfoImpl();
    virtual ~VirtualSwitchInfoImpl();

    // The standard switches, in the host's order.
    virtual std::vector<std::unique_ptr<HostCtl::Network::VirtualSwitch>> GetVirtualSwitches();
    // The distributed switches, in the host's order, from one read (their DV
    // ports too are read once for all of them, when first asked for).
    virtual std::vector<std::unique_ptr<HostCtl::Network::DVSwitch>> GetDVSwitches();
    // Every switch as a port set: the standard switches, then the
    // distributed ones, each in the host's order.
    virtual std::vector<std::unique_ptr<HostCtl::Network::Portset>> GetAllSwitches();
    // The distributed switch of that name, or null.
    virtual std::unique_ptr<HostCtl::Network::DVSwitch> GetDVSwitchByName(const std::string& name);
    // What kind of switch has that name: a standard, a distributed or an
    // opaque switch (this host has no opaque switches). A switch this
    // object listed is answered from the listing, without a read.
    virtual bool IsLegacySwitch(const std::string& name);
    virtual bool IsDVSwitch(const std::string& name);
    virtual bool IsOpaqueSwitch(const std::string& name);
    // The port of that id, or null; a port whose switch the host does not
    // have is not found, as by walking GetAllSwitches (fault name
    // "VirtualSwitchInfoImpl::GetPortById", keyed by the decimal id). Its
    // cost does not grow with the number of ports.
    virtual std::unique_ptr<HostCtl::Network::Port> GetPortById(std::uint32_t id);
    // Null when there is none.
    virtual std::unique_ptr<HostCtl::Network::VirtualSwitch> GetVirtualSwitchByName(const std::string& name);
    // Throws for a name in use or not fit for a switch, a port count outside
    // 1 to Portset::MAX_NUM_PORTS, or one that would take the host past its
    // limit of ports.
    virtual std::unique_ptr<HostCtl::Network::VirtualSwitch> AddVirtualSwitchWithPolicy(
        const HostCtl::Network::NicTeamingPolicy& teaming, const HostCtl::Network::PortSecurityPolicy& security,
        const HostCtl::Network::ShapingPolicy& shaping, const HostCtl::Network::NicCapabilities& capabilities,
        const std::string& name, long long numPorts);
    // Throws for a switch the host does not have, or one whose ports are in
    // use by anything but its uplinks.
    virtual void RemoveVirtualSwitch(const std::string& name);

private:
    enum class SwitchKind { Standard, Distributed };
    // The switches the last listing of this object saw, by name.
    std::unordered_map<std::string, SwitchKind> listedKinds_;
    std::optional<SwitchKind> KindOf(const std::string& name);
};

}  // namespace Network
}  // namespace PldCtl
