// Ports of standard and distributed switches over the host store.
#include "hostctl/network/port/PortImpl.h"

#include "Operation.h"
#include "hostctl/network/dvs/DVSwitchImpl.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/port/Pending.h"
#include "network/port/PortRecords.h"

HostCtl::Network::Port::~Port() = default;

namespace PldCtl {
namespace Network {

using HostCtl::Network::Port;

PortImpl::PortImpl(std::shared_ptr<const Detail::PortRecord> record, std::string dvPortgroupId)
    : record_(std::move(record)), dvPortgroupId_(std::move(dvPortgroupId)) {}
PortImpl::~PortImpl() = default;

int PortImpl::TypeNumber(const std::string&) {
    Detail::NotAvailableYet("PortImpl::TypeNumber");
}
std::uint32_t PortImpl::GetPortId() const {
    Detail::NotAvailableYet("PortImpl::GetPortId");
}
int PortImpl::GetType() const {
    Detail::NotAvailableYet("PortImpl::GetType");
}
std::string PortImpl::GetPortsetName() const {
    Detail::NotAvailableYet("PortImpl::GetPortsetName");
}
std::string PortImpl::GetClientName() const {
    Detail::NotAvailableYet("PortImpl::GetClientName");
}
HostCtl::Network::PortStats PortImpl::GetPortStats() const {
    Detail::NotAvailableYet("PortImpl::GetPortStats");
}
void PortImpl::GetPacketCounters(HostCtl::Network::PacketCounters&) const {
    Detail::NotAvailableYet("PortImpl::GetPacketCounters");
}
std::vector<std::unique_ptr<HostCtl::Network::FilterStats>> PortImpl::GetFilterStats() const {
    Detail::NotAvailableYet("PortImpl::GetFilterStats");
}
std::uint64_t PortImpl::GetWorldId() const {
    Detail::NotAvailableYet("PortImpl::GetWorldId");
}
std::string PortImpl::GetPortgroupName() const {
    Detail::NotAvailableYet("PortImpl::GetPortgroupName");
}
std::string PortImpl::GetDVPortId() const {
    Detail::NotAvailableYet("PortImpl::GetDVPortId");
}
std::string PortImpl::GetDVPortgroupId() const {
    Detail::NotAvailableYet("PortImpl::GetDVPortgroupId");
}
HostCtl::Network::MacAddress PortImpl::GetMacAddress() const {
    Detail::NotAvailableYet("PortImpl::GetMacAddress");
}
HostCtl::Network::Ipv4Address PortImpl::GetIpAddress() const {
    Detail::NotAvailableYet("PortImpl::GetIpAddress");
}
std::string PortImpl::GetTeamUplink() const {
    Detail::NotAvailableYet("PortImpl::GetTeamUplink");
}
std::string PortImpl::Key() const {
    return std::to_string(record_->id);
}

std::vector<std::unique_ptr<Port>> PortsetImpl::GetPorts() const {
    Detail::NotAvailableYet("PortsetImpl::GetPorts");
}
std::string PortsetImpl::GetSwitchUuid() const {
    return std::string();
}
std::unique_ptr<Port> VirtualSwitchInfoImpl::GetPortById(std::uint32_t) {
    Detail::NotAvailableYet("VirtualSwitchInfoImpl::GetPortById");
}
std::unique_ptr<Port> PnicImpl::GetUplinkPort() const {
    Detail::NotAvailableYet("PnicImpl::GetUplinkPort");
}

}  // namespace Network
}  // namespace PldCtl
