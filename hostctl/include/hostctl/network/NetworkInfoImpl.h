// Host-wide networking information and settings.
#pragma once

#include <memory>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/nic/Pnic.h"
#include "hostctl/network/vswitch/VirtualSwitch.h"

namespace PldCtl {
namespace Network {

class HOSTCTL_EXPORT NetworkInfoImpl {
public:
    // Never throws: the host is reached by the operations.
    NetworkInfoImpl();
    virtual ~NetworkInfoImpl();

    // Whether the kernel's IPv6 support is on.
    virtual bool IsPldIpv6Enabled();
    virtual void SetPldIpv6Enabled(bool enabled);

    // The host's physical NICs, in the host's order.
    virtual std::vector<std::unique_ptr<HostCtl::Network::Pnic>> GetPnics();
    // Every port group of every standard switch, switch by switch.
    virtual std::vector<std::unique_ptr<HostCtl::Network::PortGroup>> GetAllPortGroups();
};

}  // namespace Network
}  // namespace PldCtl
