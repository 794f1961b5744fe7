// The records of the port commands: a port's packet counters and its
// filters' counters, and the order and direction words of the filters.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "framework/MetaObj.h"
#include "hostctl/network/port/Port.h"

namespace OrvixCli {
namespace NetworkNamespace {

// Whether filter entry `a` is listed before `b`: receive filters (direction
// flag clear) before transmit filters, receive filters by ascending ordering
// key and transmit filters by descending key, keys compared byte by byte
// with a shorter key before a longer one it begins. The shown name plays no
// part.
bool sortFilterStats(const HostCtl::Network::FilterStats& a, const HostCtl::Network::FilterStats& b);

// Puts a port's filter entries into their listing order.
void SortFilterEntries(std::vector<std::unique_ptr<HostCtl::Network::FilterStats>>& entries);

// "Transmit" or "Receive" for a filter's direction flag. An uplink port
// (type 4) takes its traffic from the wire, so there the words are swapped.
std::string FilterDirectionText(bool transmit, int portType);

// Received or sent packets that were neither broadcast nor multicast, in
// 64-bit arithmetic: a count below the other two gives a negative number
// rather than a clamped one.
std::int64_t UnicastPackets(std::uint64_t packets, std::uint64_t broadcast, std::uint64_t multicast);

// The "Port" record of `portId` from its byte counters and packet counters.
boost::shared_ptr<MetaObj::MetaStruct> PortStatsRecord(std::uint32_t portId, const HostCtl::Network::PortStats& stats,
                                                       const HostCtl::Network::PacketCounters& counters);

// The "Filter" record of one present filter entry on a port of `portType`;
// the extended counters only when the entry keeps them.
boost::shared_ptr<MetaObj::MetaStruct> FilterStatsRecord(const HostCtl::Network::FilterStats& entry, int portType);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
