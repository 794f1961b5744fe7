// Ports of standard and distributed switches over the host store. A port
// object is a snapshot of its stored record; its counters are read from the
// snapshot, so a listing reads every port once.
#include "hostctl/network/port/PortImpl.h"

#include <algorithm>
#include <unordered_map>

#include "Operation.h"
#include "hostctl/network/nic/PnicImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "network/dvs/DvsRecords.h"
#include "network/nic/NicRecords.h"
#include "network/port/PortLookup.h"
#include "network/port/PortRecords.h"
#include "network/vswitch/VswitchRecords.h"

HostCtl::Network::Port::~Port() = default;

namespace PldCtl {
namespace Detail {

namespace {

// The port group of each DV port of a distributed switch, by DV port id.
std::unordered_map<std::string, std::string> PortgroupsOfDvPorts(Store::Transaction& t, const std::string& dvswitch) {
    std::unordered_map<std::string, std::string> portgroups;
    for (DvPortRecord& port : ListChildren<DvPortRecord>(t, dvswitch)) {
        portgroups.emplace(std::move(port.id), std::move(port.portgroupId));
    }
    return portgroups;
}

}  // namespace

std::unique_ptr<Network::PortImpl> FindPort(Store::Transaction& t, std::int64_t id) {
    std::optional<PortRecord> port = Get<PortRecord>(t, std::to_string(id));
    if (!port) return nullptr;
    std::string dvPortgroupId;
    if (!t.Exists(VswitchRecord::kSection, port->portset)) {
        if (!t.Exists(DvSwitchRecord::kSection, port->portset)) return nullptr;
        if (FitsJoinedKey(port->dvPortId)) {
            std::optional<DvPortRecord> dvport = Get<DvPortRecord>(t, DvPortKey(port->portset, port->dvPortId));
            if (dvport) dvPortgroupId = std::move(dvport->portgroupId);
        }
    }
    return std::make_unique<Network::PortImpl>(std::make_shared<const PortRecord>(std::move(*port)),
                                               std::move(dvPortgroupId));
}

std::vector<std::unique_ptr<HostCtl::Network::Port>> ListPorts(Store::Transaction& t, const std::string& portset,
                                                               bool distributed) {
    std::vector<std::shared_ptr<const PortRecord>> records =
        DecodeShared<PortRecord>(t.ListChildrenText(PortRecord::kSection, portset));
    std::sort(records.begin(), records.end(), [](const auto& a, const auto& b) { return a->id < b->id; });
    std::unordered_map<std::string, std::string> portgroups;
    if (distributed) portgroups = PortgroupsOfDvPorts(t, portset);
    std::vector<std::unique_ptr<HostCtl::Network::Port>> ports;
    ports.reserve(records.size());
    for (auto& record : records) {
        auto portgroup = portgroups.find(record->dvPortId);
        ports.push_back(std::make_unique<Network::PortImpl>(
            std::move(record), portgroup == portgroups.end() ? std::string() : portgroup->second));
    }
    return ports;
}

}  // namespace Detail

namespace Network {

using HostCtl::Network::Port;

PortImpl::PortImpl(std::shared_ptr<const Detail::PortRecord> record, std::string dvPortgroupId)
    : record_(std::move(record)), dvPortgroupId_(std::move(dvPortgroupId)) {}

PortImpl::~PortImpl() = default;

int PortImpl::TypeNumber(const std::string& word) {
    if (word == "kernel") return Port::TYPE_KERNEL;
    if (word == "internal") return Port::TYPE_INTERNAL;
    if (word == "uplink") return Port::TYPE_UPLINK;
    return Port::TYPE_VM;
}

std::uint32_t PortImpl::GetPortId() const {
    return static_cast<std::uint32_t>(record_->id);
}

int PortImpl::GetType() const {
    return TypeNumber(record_->type);
}

std::string PortImpl::GetPortsetName() const {
    return record_->portset;
}

std::string PortImpl::GetClientName() const {
    return record_->client;
}

HostCtl::Network::PortStats PortImpl::GetPortStats() const {
    Detail::EnterOperation("PortImpl::GetPortStats", Key());
    const Detail::PortStatsRecord& stored = record_->stats;
    HostCtl::Network::PortStats stats;
    stats.packetsSent = stored.txPackets;
    stats.packetsReceived = stored.rxPackets;
    stats.bytesSent = stored.txBytes;
    stats.bytesReceived = stored.rxBytes;
    stats.broadcastSent = stored.txBroadcast;
    stats.broadcastReceived = stored.rxBroadcast;
    stats.multicastSent = stored.txMulticast;
    stats.multicastReceived = stored.rxMulticast;
    stats.droppedSent = stored.txDropped;
    stats.droppedReceived = stored.rxDropped;
    return stats;
}

void PortImpl::GetPacketCounters(HostCtl::Network::PacketCounters& counters) const {
    Detail::EnterOperation("PortImpl::GetPacketCounters", Key());
    const Detail::PortStatsRecord& stored = record_->stats;
    counters.packetsSent = stored.txPackets;
    counters.multicastSent = stored.txMulticast;
    counters.broadcastSent = stored.txBroadcast;
    counters.packetsReceived = stored.rxPackets;
    counters.multicastReceived = stored.rxMulticast;
    counters.broadcastReceived = stored.rxBroadcast;
    counters.droppedSent = stored.txDropped;
    counters.droppedReceived = stored.rxDropped;
}

std::vector<std::unique_ptr<HostCtl::Network::FilterStats>> PortImpl::GetFilterStats() const {
    Detail::EnterOperation("PortImpl::GetFilterStats", Key());
    std::vector<std::unique_ptr<HostCtl::Network::FilterStats>> filters;
    filters.reserve(record_->filters.size());
    for (const Detail::FilterRecord& stored : record_->filters) {
        auto filter = std::make_unique<HostCtl::Network::FilterStats>();
        filter->name = stored.name;
        filter->orderingKey = stored.key;
        filter->present = stored.present;
        filter->transmit = stored.direction == Detail::FilterRecord::kTransmit;
        filter->extended = stored.extended;
        filter->packetsIn = stored.packetsIn;
        filter->packetsOut = stored.packetsOut;
        filter->packetsDropped = stored.packetsDropped;
        filter->packetsFiltered = stored.packetsFiltered;
        filter->packetsFaulted = stored.packetsFaulted;
        filter->packetsQueued = stored.packetsQueued;
        filter->packetsInjected = stored.packetsInjected;
        filter->packetErrors = stored.packetErrors;
        filters.push_back(std::move(filter));
    }
    return filters;
}

std::uint64_t PortImpl::GetWorldId() const {
    return record_->worldId;
}

std::string PortImpl::GetPortgroupName() const {
    return record_->portgroup;
}

std::string PortImpl::GetDVPortId() const {
    return record_->dvPortId;
}

std::string PortImpl::GetDVPortgroupId() const {
    return dvPortgroupId_;
}

HostCtl::Network::MacAddress PortImpl::GetMacAddress() const {
    return HostCtl::Network::MacAddress(record_->mac);
}

HostCtl::Network::Ipv4Address PortImpl::GetIpAddress() const {
    return HostCtl::Network::Ipv4Address(record_->ip);
}

std::string PortImpl::GetTeamUplink() const {
    return record_->teamUplink;
}

std::string PortImpl::Key() const {
    return std::to_string(record_->id);
}

// ------------------------------------------- ports as the other objects find them

std::vector<std::unique_ptr<Port>> PortsetImpl::GetPorts() const {
    Store::HostStore& store = Detail::EnterOperation("PortsetImpl::GetPorts", GetName());
    std::vector<std::unique_ptr<Port>> ports;
    store.Read([&](Store::Transaction& t) { ports = Detail::ListPorts(t, GetName(), false); });
    return ports;
}

std::string PortsetImpl::GetSwitchUuid() const {
    return std::string();
}

std::unique_ptr<Port> VirtualSwitchInfoImpl::GetPortById(std::uint32_t id) {
    Store::HostStore& store = Detail::EnterOperation("VirtualSwitchInfoImpl::GetPortById", std::to_string(id));
    std::unique_ptr<Port> port;
    store.Read([&](Store::Transaction& t) { port = Detail::FindPort(t, id); });
    return port;
}

std::unique_ptr<Port> PnicImpl::GetUplinkPort() const {
    const std::string name = GetName();
    Store::HostStore& store = Detail::EnterOperation("PnicImpl::GetUplinkPort", name);
    std::unique_ptr<Port> port;
    store.Read([&](Store::Transaction& t) {
        const Detail::NicRecord nic = Detail::RequireNic(t, name);
        if (nic.uplinkPortId != 0) port = Detail::FindPort(t, nic.uplinkPortId);
    });
    return port;
}

}  // namespace Network
}  // namespace PldCtl
