// Distributed switches over the host store. A switch object is a snapshot
// of its stored record, LAGs included; the LACP timeout is changed in one
// transaction on the switch as it is stored then.
#include "hostctl/network/dvs/DVSwitchImpl.h"

#include <algorithm>

#include "Operation.h"
#include "hostctl/network/dvs/DVPortImpl.h"
#include "network/dvs/DvsLookup.h"
#include "network/dvs/DvsRecords.h"
#include "network/port/PortLookup.h"
#include "network/port/PortRecords.h"
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
namespace Detail {

std::optional<DvPortFound> FindDvPort(Store::Transaction& t, const HostCtl::Network::DVPortParam& param) {
    if (param.switchUuid.empty() || !FitsJoinedKey(param.portId)) return std::nullopt;
    for (DvSwitchRecord& dvswitch : List<DvSwitchRecord>(t)) {
        if (dvswitch.uuid != param.switchUuid) continue;
        std::optional<DvPortRecord> port = Get<DvPortRecord>(t, DvPortKey(dvswitch.name, param.portId));
        if (!port) return std::nullopt;
        DvPortFound found{std::move(dvswitch.name), {std::make_shared<const DvPortRecord>(std::move(*port)), {}}};
        for (const PortRecord& hostPort : ListChildren<PortRecord>(t, found.dvswitch)) {
            if (hostPort.dvPortId == param.portId && !hostPort.client.empty()) {
                found.port.clients.push_back(hostPort.client);
            }
        }
        return found;
    }
    return std::nullopt;
}

const std::vector<DvPortState>& DvPortListing::PortsOf(Store::HostStore& store, const std::string& dvswitch) {
    if (std::find(switches_.begin(), switches_.end(), dvswitch) == switches_.end()) switches_.push_back(dvswitch);
    if (!ports_ || ports_->find(dvswitch) == ports_->end()) {
        store.Read([&](Store::Transaction& t) { Load(t); });
    }
    return (*ports_)[dvswitch];
}

void DvPortListing::Load(Store::Transaction& t) {
    std::unordered_map<std::string, std::vector<DvPortState>> ports;
    for (const std::string& dvswitch : switches_) ports[dvswitch];
    // Where each DV port sits in its switch's list, to hand it its clients.
    std::unordered_map<std::string, std::size_t> places;
    for (auto& record : DecodeShared<DvPortRecord>(t.ListText(DvPortRecord::kSection))) {
        auto own = ports.find(record->dvswitch);
        if (own == ports.end()) continue;
        places.emplace(DvPortKey(record->dvswitch, record->id), own->second.size());
        own->second.push_back(DvPortState{std::move(record), {}});
    }
    for (const std::string& dvswitch : switches_) {
        std::vector<DvPortState>& own = ports[dvswitch];
        for (const PortRecord& port : ListChildren<PortRecord>(t, dvswitch)) {
            if (port.client.empty()) continue;
            auto place = places.find(DvPortKey(dvswitch, port.dvPortId));
            if (place != places.end()) own[place->second].clients.push_back(port.client);
        }
    }
    ports_ = std::move(ports);
}

}  // namespace Detail

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

// "S" or "F" for slow or fast LACPDUs, then "A" or "P" for an active or a
// passive actor, from an actor state byte.
std::string LocalFlags(std::uint8_t state) {
    std::string flags = (state & HostCtl::Network::LACP_STATE_SHORT_TIMEOUT) ? "F" : "S";
    flags += (state & HostCtl::Network::LACP_STATE_ACTIVITY) ? "A" : "P";
    return flags;
}

HostCtl::Network::LacpNicInfo NicInfo(const Detail::LagMemberRecord& member) {
    HostCtl::Network::LacpNicInfo nic;
    nic.name = member.nic;
    nic.state = member.state;
    nic.local.flags = LocalFlags(member.local.state);
    nic.local.adminKey = member.local.adminKey;
    nic.local.operKey = member.local.operKey;
    nic.local.portPriority = member.local.portPriority;
    nic.local.portNumber = member.local.portNumber;
    nic.local.state = member.local.state;
    nic.partner.deviceId = member.partner.deviceId;
    nic.partner.flags = member.partner.flags;
    nic.partner.age = member.partner.age;
    nic.partner.operKey = member.partner.operKey;
    nic.partner.portPriority = member.partner.portPriority;
    nic.partner.portNumber = member.partner.portNumber;
    nic.partner.state = member.partner.state;
    nic.txLacpdus = member.stats.txLacpdus;
    nic.rxLacpdus = member.stats.rxLacpdus;
    nic.txErrors = member.stats.txErrors;
    nic.rxErrors = member.stats.rxErrors;
    return nic;
}

}  // namespace

DVSwitchImpl::DVSwitchImpl(std::shared_ptr<const Detail::DvSwitchRecord> record,
                           std::optional<std::pair<int, int>> portCounts,
                           std::shared_ptr<Detail::DvPortListing> listing)
    : PortsetImpl(PortsetPart(*record), portCounts), dvRecord_(std::move(record)), listing_(std::move(listing)) {
    if (!listing_) listing_ = std::make_shared<Detail::DvPortListing>(std::vector<std::string>{dvRecord_->name});
}

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
    Store::HostStore& store = Detail::EnterOperation("DVSwitchImpl::GetPorts", GetName());
    std::vector<std::unique_ptr<HostCtl::Network::Port>> ports;
    store.Read([&](Store::Transaction& t) { ports = Detail::ListPorts(t, GetName(), true); });
    return ports;
}

std::vector<std::unique_ptr<HostCtl::Network::DVPort>> DVSwitchImpl::GetDVPorts() const {
    Store::HostStore& store = Detail::EnterOperation("DVSwitchImpl::GetDVPorts", GetName());
    std::vector<std::unique_ptr<HostCtl::Network::DVPort>> ports;
    for (const Detail::DvPortState& port : listing_->PortsOf(store, GetName())) {
        HostCtl::Network::DVPortParam param{dvRecord_->uuid, port.record->id, port.record->connectionId};
        ports.push_back(std::make_unique<DVPortImpl>(param, port.record, port.clients));
    }
    return ports;
}

std::unique_ptr<HostCtl::Network::LacpConfig> DVSwitchImpl::GetLacpConfig() const {
    Detail::EnterOperation("DVSwitchImpl::GetLacpConfig", GetName());
    auto config = std::make_unique<HostCtl::Network::LacpConfig>();
    for (const Detail::LagRecord& stored : dvRecord_->lags) {
        HostCtl::Network::LacpLagConfig lag;
        lag.id = stored.id;
        lag.name = stored.name;
        lag.mode = Detail::LacpModeNumber(stored.mode);
        lag.loadBalance = stored.loadBalance;
        for (const Detail::LagMemberRecord& member : stored.members) lag.nics.push_back(member.nic);
        config->lags.push_back(std::move(lag));
    }
    return config;
}

void DVSwitchImpl::ReleaseLacpConfig(std::unique_ptr<HostCtl::Network::LacpConfig>) const {}

std::unique_ptr<HostCtl::Network::LacpInfo> DVSwitchImpl::GetLacpInfo() const {
    Detail::EnterOperation("DVSwitchImpl::GetLacpInfo", GetName());
    auto info = std::make_unique<HostCtl::Network::LacpInfo>();
    for (const Detail::LagRecord& stored : dvRecord_->lags) {
        HostCtl::Network::LacpLagInfo lag;
        lag.id = stored.id;
        lag.name = stored.name;
        lag.mode = Detail::LacpModeNumber(stored.mode);
        lag.loadBalance = stored.loadBalance;
        for (const Detail::LagMemberRecord& member : stored.members) lag.nics.push_back(NicInfo(member));
        info->lags.push_back(std::move(lag));
    }
    return info;
}

void DVSwitchImpl::ReleaseLacpInfo(std::unique_ptr<HostCtl::Network::LacpInfo>) const {}

void DVSwitchImpl::SetLacpTimeout(std::int64_t lagId, bool shortTimeout, const std::string& nic) {
    const std::string name = GetName();
    Store::HostStore& store = Detail::EnterOperation("DVSwitchImpl::SetLacpTimeout", name);
    std::shared_ptr<const Detail::DvSwitchRecord> written;
    store.Change([&](Store::Transaction& t) {
        std::optional<Detail::StoredObject<Detail::DvSwitchRecord>> stored =
            Detail::Find<Detail::DvSwitchRecord>(t, name);
        if (!stored) throw HostCtl::Lib::HostCtlException(HostCtl::Network::DVSwitchNotFoundMessage(name));
        Detail::DvSwitchRecord edited = stored->record;
        auto lag = std::find_if(edited.lags.begin(), edited.lags.end(),
                                [&](const Detail::LagRecord& candidate) { return candidate.id == lagId; });
        if (lag == edited.lags.end()) {
            throw HostCtl::Lib::HostCtlException("LAG " + std::to_string(lagId) + " does not exist on DVSwitch " +
                                                 name);
        }
        bool found = nic.empty();
        for (Detail::LagMemberRecord& member : lag->members) {
            if (!nic.empty() && member.nic != nic) continue;
            found = true;
            member.shortTimeout = shortTimeout;
            if (shortTimeout) {
                member.local.state |= HostCtl::Network::LACP_STATE_SHORT_TIMEOUT;
            } else {
                member.local.state &= static_cast<std::uint8_t>(~HostCtl::Network::LACP_STATE_SHORT_TIMEOUT);
            }
        }
        if (!found) {
            throw HostCtl::Lib::HostCtlException("NIC " + nic + " is not in LAG " + std::to_string(lagId) +
                                                 " of DVSwitch " + name);
        }
        Detail::Write(t, *stored, edited);
        written = std::make_shared<const Detail::DvSwitchRecord>(std::move(edited));
    });
    dvRecord_ = written;
    Refresh(PortsetPart(*written));
}

// ----------------------------------------------------- VirtualSwitchInfoImpl

std::unique_ptr<HostCtl::Network::DVSwitch> VirtualSwitchInfoImpl::GetDVSwitchByName(const std::string& name) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetDVSwitchByName", name);
    std::optional<Detail::DvSwitchRecord> dvswitch = Detail::Get<Detail::DvSwitchRecord>(store, name);
    if (!dvswitch) return nullptr;
    return std::make_unique<DVSwitchImpl>(std::make_shared<const Detail::DvSwitchRecord>(std::move(*dvswitch)));
}

bool VirtualSwitchInfoImpl::IsLegacySwitch(const std::string& name) {
    return KindOf(name) == SwitchKind::Standard;
}

bool VirtualSwitchInfoImpl::IsDVSwitch(const std::string& name) {
    return KindOf(name) == SwitchKind::Distributed;
}

bool VirtualSwitchInfoImpl::IsOpaqueSwitch(const std::string&) {
    return false;
}

std::optional<VirtualSwitchInfoImpl::SwitchKind> VirtualSwitchInfoImpl::KindOf(const std::string& name) {
    auto listed = listedKinds_.find(name);
    if (listed != listedKinds_.end()) return listed->second;
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetSwitchKind", name);
    std::optional<SwitchKind> kind;
    store.Read([&](Store::Transaction& t) {
        if (t.Exists(Detail::VswitchRecord::kSection, name)) {
            kind = SwitchKind::Standard;
        } else if (t.Exists(Detail::DvSwitchRecord::kSection, name)) {
            kind = SwitchKind::Distributed;
        }
    });
    return kind;
}

}  // namespace Network
}  // namespace PldCtl
