// How the VM commands find the ports the host's worlds use: every port of
// every switch of a kind they know, standard, distributed or opaque.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "hostctl/network/port/Port.h"
#include "hostctl/network/port/PortImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

enum class SwitchKind { Standard, Distributed, Opaque, Unknown };

// The kind of the switch of that name, asking whether it is a standard, a
// distributed and an opaque switch, in this order.
SwitchKind KindOfSwitch(PldCtl::Network::VirtualSwitchInfoImpl& switchInfo, const std::string& name);

// The network a port belongs to: the distributed port group of its DV port
// on a distributed switch, else its port group.
std::string PortNetworkName(SwitchKind kind, const HostCtl::Network::Port& port);

// The NIC a port's traffic leaves by and the id of that NIC's uplink port.
struct TeamUplink {
    std::string name;
    std::int64_t uplinkPortId = -1;
};
// The team uplink named `nic`: "" and -1 when the name is empty, names a
// NIC the host does not have, or a NIC without an uplink port. Throws
// HostCtlException as the library does.
TeamUplink TeamUplinkOf(const std::string& nic);

// Calls visit(switchName, kind, port) for each port in use by a world (a
// world id other than 0), switch by switch in the host's order and port by
// port in each switch's order. Switches of no known kind are passed over, as
// are ports that are not the library's own port objects. Throws
// HostCtlException as the library does.
template <typename Visit>
void ForEachWorldPort(PldCtl::Network::VirtualSwitchInfoImpl& switchInfo, Visit&& visit) {
    const std::vector<std::unique_ptr<HostCtl::Network::Portset>> switches = switchInfo.GetAllSwitches();
    for (const auto& portset : switches) {
        const std::string name = portset->GetName();
        const SwitchKind kind = KindOfSwitch(switchInfo, name);
        if (kind == SwitchKind::Unknown) continue;
        for (const auto& port : portset->GetPorts()) {
            if (!dynamic_cast<const PldCtl::Network::PortImpl*>(port.get())) continue;
            if (port->GetWorldId() == 0) continue;
            visit(name, kind, *port);
        }
    }
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
