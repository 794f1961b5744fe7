#include "port/PortRecords.h"

#include <algorithm>

namespace OrvixCli {
namespace NetworkNamespace {

bool sortFilterStats(const HostCtl::Network::FilterStats& a, const HostCtl::Network::FilterStats& b) {
    if (a.transmit != b.transmit) return !a.transmit;
    // std::string compares its characters as unsigned bytes, the shorter
    // text first when one begins the other.
    return a.transmit ? b.orderingKey < a.orderingKey : a.orderingKey < b.orderingKey;
}

void SortFilterEntries(std::vector<std::unique_ptr<HostCtl::Network::FilterStats>>& entries) {
    std::sort(entries.begin(), entries.end(),
              [](const std::unique_ptr<HostCtl::Network::FilterStats>& a,
                 const std::unique_ptr<HostCtl::Network::FilterStats>& b) { return sortFilterStats(*a, *b); });
}

std::string FilterDirectionText(bool transmit, int portType) {
    const bool uplink = portType == HostCtl::Network::Port::TYPE_UPLINK;
    return transmit != uplink ? "Transmit" : "Receive";
}

std::int64_t UnicastPackets(std::uint64_t packets, std::uint64_t broadcast, std::uint64_t multicast) {
    // Unsigned arithmetic wraps instead of overflowing; read back as signed
    // it is the signed difference.
    return static_cast<std::int64_t>(packets - broadcast - multicast);
}

boost::shared_ptr<MetaObj::MetaStruct> PortStatsRecord(std::uint32_t portId, const HostCtl::Network::PortStats& stats,
                                                       const HostCtl::Network::PacketCounters& counters) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("Port");
    record->SetField("Port ID", portId);
    record->SetField("Packets received", counters.packetsReceived);
    record->SetField("Packets sent", counters.packetsSent);
    record->SetField("Bytes received", stats.bytesReceived);
    record->SetField("Bytes sent", stats.bytesSent);
    record->SetField("Broadcast packets received", counters.broadcastReceived);
    record->SetField("Broadcast packets sent", counters.broadcastSent);
    record->SetField("Multicast packets received", counters.multicastReceived);
    record->SetField("Multicast packets sent", counters.multicastSent);
    record->SetField("Unicast packets received",
                     UnicastPackets(counters.packetsReceived, counters.broadcastReceived, counters.multicastReceived));
    record->SetField("Unicast packets sent",
                     UnicastPackets(counters.packetsSent, counters.broadcastSent, counters.multicastSent));
    record->SetField("Receive packets dropped", counters.droppedReceived);
    record->SetField("Transmit packets dropped", counters.droppedSent);
    return record;
}

boost::shared_ptr<MetaObj::MetaStruct> FilterStatsRecord(const HostCtl::Network::FilterStats& entry, int portType) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New("Filter");
    record->SetField("Filter name", entry.name);
    record->SetField("Filter direction", FilterDirectionText(entry.transmit, portType));
    record->SetField("Packets in", entry.packetsIn);
    record->SetField("Packets out", entry.packetsOut);
    record->SetField("Packets dropped", entry.packetsDropped);
    if (entry.extended) {
        record->SetField("Packets filtered", entry.packetsFiltered);
        record->SetField("Packets faulted", entry.packetsFaulted);
        record->SetField("Packets queued", entry.packetsQueued);
        record->SetField("Packets injected", entry.packetsInjected);
        record->SetField("Packet errors", entry.packetErrors);
    }
    return record;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
