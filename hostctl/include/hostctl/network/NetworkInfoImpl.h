// Host-wide networking information and settings.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/NetworkInfo.h"
#include "hostctl/network/ip/NetstackInstance.h"
#include "hostctl/network/ip/TcpIpConnection.h"
#include "hostctl/network/vswitch/VirtualSwitch.h"

namespace PldCtl {
namespace Network {

class HOSTCTL_EXPORT NetworkInfoImpl : public HostCtl::Network::NetworkInfo {
public:
    // Never throws: the host is reached by the operations.
    NetworkInfoImpl();
    ~NetworkInfoImpl() override;

    // Whether the kernel's IPv6 support is on.
    virtual bool IsPldIpv6Enabled();
    virtual void SetPldIpv6Enabled(bool enabled);

    // The host's physical NICs, in the host's order, and one by name (null
    // when the host has none of that name). One read of the one NIC.
    std::vector<std::unique_ptr<HostCtl::Network::Pnic>> GetPnics() override;
    std::unique_ptr<HostCtl::Network::Pnic> GetPnicByName(const std::string& name) override;

    // The SR-IOV capable NICs, in the host's order, and one by name (null
    // when the host has no SR-IOV NIC of that name).
    virtual std::vector<std::unique_ptr<HostCtl::Network::Pnic>> GetSriovNics();
    virtual std::unique_ptr<HostCtl::Network::Pnic> GetSriovNicByName(const std::string& name);
    // The virtual functions of that SR-IOV NIC, in VF id order. Throws for a
    // NIC that is not SR-IOV capable.
    virtual std::vector<std::unique_ptr<HostCtl::Network::SriovNicVFInfo>> GetSriovNicVFInfo(const std::string& name);
    // The counters of one VF. Throws for a NIC that is not SR-IOV capable and
    // for a VF id the NIC does not have (the id is never narrowed).
    virtual void GetSriovNicVFStats(HostCtl::Network::SriovNicVFStats& stats, const std::string& name,
                                    std::int64_t vfId);
    int GetNetstackInstanceState(const std::string& key) override;

    // Netstack instances. AddNetstackInstance records `instance` (a
    // NetstackInstanceImpl made for it) on the host; `disabled` records it in
    // the configuration only, else it is also created in the kernel. Throws
    // for a key in use or not fit for an instance (1 to 64 letters, digits,
    // '-', '_' or '.').
    virtual void AddNetstackInstance(HostCtl::Network::NetstackInstance* instance, bool disabled);
    // Throws for the default instance, a key the host does not have, and an
    // instance that still has interfaces. `persistOnly` has no effect here.
    virtual void RemoveNetstackInstance(const std::string& key, bool persistOnly);
    // Null when there is none.
    virtual std::unique_ptr<HostCtl::Network::NetstackInstance> LookupNetstackInstanceByKey(const std::string& key);
    // In the host's order.
    virtual std::vector<std::unique_ptr<HostCtl::Network::NetstackInstance>> ListNetstackInstances();

    // The open endpoints of a netstack instance, per protocol, in the host's
    // order; `connections` is filled, not appended to. Throws for a netstack
    // the host does not have.
    virtual void GetCurrentTcpPalladConnections(std::vector<HostCtl::Network::TcpIpConnection>& connections,
                                                const std::string& netstack);
    virtual void GetCurrentUdpPalladConnections(std::vector<HostCtl::Network::TcpIpConnection>& connections,
                                                const std::string& netstack);
    virtual void GetCurrentIpPalladConnections(std::vector<HostCtl::Network::TcpIpConnection>& connections,
                                               const std::string& netstack);

    // Every port group of every standard switch, switch by switch.
    virtual std::vector<std::unique_ptr<HostCtl::Network::PortGroup>> GetAllPortGroups();
};

}  // namespace Network
}  // namespace PldCtl
