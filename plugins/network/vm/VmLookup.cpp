#include "vm/VmLookup.h"

#include "hostctl/network/nic/PnicImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

SwitchKind KindOfSwitch(PldCtl::Network::VirtualSwitchInfoImpl& switchInfo, const std::string& name) {
    if (switchInfo.IsLegacySwitch(name)) return SwitchKind::Standard;
    if (switchInfo.IsDVSwitch(name)) return SwitchKind::Distributed;
    if (switchInfo.IsOpaqueSwitch(name)) return SwitchKind::Opaque;
    return SwitchKind::Unknown;
}

std::string PortNetworkName(SwitchKind kind, const HostCtl::Network::Port& port) {
    return kind == SwitchKind::Distributed ? port.GetDVPortgroupId() : port.GetPortgroupName();
}

TeamUplink TeamUplinkOf(const std::string& nic) {
    TeamUplink uplink;
    if (nic.empty() || !PldCtl::Network::PnicImpl::IsValidPnic(nic)) return uplink;
    const PldCtl::Network::PnicImpl pnic(nic);
    if (const std::unique_ptr<HostCtl::Network::Port> port = pnic.GetUplinkPort()) {
        uplink.name = pnic.GetName();
        uplink.uplinkPortId = port->GetPortId();
    }
    return uplink;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
