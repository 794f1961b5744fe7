// Distributed switches over the host store.
#include "hostctl/network/dvs/DVSwitchImpl.h"

#include "Operation.h"
#include "network/dvs/DvsRecords.h"
#include "network/port/Pending.h"
#include "network/vswitch/VswitchRecords.h"

namespace HostCtl {
namespace Network {

DVSwitch::~DVSwitch() = default;
DVPort::~DVPort() = default;

std::string DVSwitchNotFoundMessage(const std::string& name) {
    return "Unable to find a DVSwitch with the name " + name;
}

}  // namespace Network
}  // namespace HostCtl

namespace PldCtl {
namespace Network {

namespace {

// The port-set part of a distributed switch, as the port-set base holds it.
std::shared_ptr<const Detail::VswitchRecord> PortsetPart(const Detail::DvSwitchRecord& dvswitch) {
    auto portset = std::make_shared<Detail::VswitchRecord>();
    portset->name = dvswitch.name;
    portset->className = dvswitch.className;
    portset->numPorts = dvswitch.numPorts;
    portset->mtu = dvswitch.mtu;
    portset->cdp = dvswitch.cdp;
    portset->uplinks = dvswitch.uplinks;
    return portset;
}

}  // namespace

DVSwitchImpl::DVSwitchImpl(std::shared_ptr<const Detail::DvSwitchRecord> record,
                           std::optional<std::pair<int, int>> portCounts,
                           std::shared_ptr<Detail::DvPortListing> listing)
    : PortsetImpl(PortsetPart(*record), portCounts), dvRecord_(std::move(record)), listing_(std::move(listing)) {}

DVSwitchImpl::~DVSwitchImpl() = default;

std::string DVSwitchImpl::GetSwitchUuid() const {
    return dvRecord_->uuid;
}
std::string DVSwitchImpl::GetUUID() const {
    return dvRecord_->uuid;
}
int DVSwitchImpl::GetMTU() const {
    return dvRecord_->mtu;
}
std::string DVSwitchImpl::GetCDPStatus() const {
    return dvRecord_->cdp;
}
int DVSwitchImpl::GetBeaconTimeout() const {
    return dvRecord_->beaconTimeout;
}
bool DVSwitchImpl::IsOrvixBranded() const {
    return dvRecord_->orvixBranded;
}
std::vector<std::unique_ptr<HostCtl::Network::Port>> DVSwitchImpl::GetPorts() const {
    Detail::NotAvailableYet("DVSwitchImpl::GetPorts");
}
std::vector<std::unique_ptr<HostCtl::Network::DVPort>> DVSwitchImpl::GetDVPorts() const {
    Detail::NotAvailableYet("DVSwitchImpl::GetDVPorts");
}
std::unique_ptr<HostCtl::Network::LacpConfig> DVSwitchImpl::GetLacpConfig() const {
    Detail::NotAvailableYet("DVSwitchImpl::GetLacpConfig");
}
void DVSwitchImpl::ReleaseLacpConfig(std::unique_ptr<HostCtl::Network::LacpConfig>) const {}
std::unique_ptr<HostCtl::Network::LacpInfo> DVSwitchImpl::GetLacpInfo() const {
    Detail::NotAvailableYet("DVSwitchImpl::GetLacpInfo");
}
void DVSwitchImpl::ReleaseLacpInfo(std::unique_ptr<HostCtl::Network::LacpInfo>) const {}
void DVSwitchImpl::SetLacpTimeout(std::int64_t, bool, const std::string&) {
    Detail::NotAvailableYet("DVSwitchImpl::SetLacpTimeout");
}

std::unique_ptr<HostCtl::Network::DVSwitch> VirtualSwitchInfoImpl::GetDVSwitchByName(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetDVSwitchByName", name);
    std::optional<Detail::DvSwitchRecord> dvswitch = Detail::Get<Detail::DvSwitchRecord>(store, name);
    if (!dvswitch) return nullptr;
    return std::make_unique<DVSwitchImpl>(std::make_shared<const Detail::DvSwitchRecord>(std::move(*dvswitch)));
}

std::vector<std::unique_ptr<HostCtl::Network::DVSwitch>> VirtualSwitchInfoImpl::GetDVSwitches() {
    Detail::NotAvailableYet("VirtualSwitchInfoImpl::GetDVSwitches");
}
bool VirtualSwitchInfoImpl::IsLegacySwitch(const std::string&) {
    Detail::NotAvailableYet("VirtualSwitchInfoImpl::IsLegacySwitch");
}
bool VirtualSwitchInfoImpl::IsDVSwitch(const std::string&) {
    Detail::NotAvailableYet("VirtualSwitchInfoImpl::IsDVSwitch");
}
bool VirtualSwitchInfoImpl::IsOpaqueSwitch(const std::string&) {
    return false;
}

}  // namespace Network
}  // namespace PldCtl
