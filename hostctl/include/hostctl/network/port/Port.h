// The host-control library's view of the ports of standard and distributed
// switches: their counters, their traffic filters and what uses them. Every
// object and vector the library hands out is new and belongs to the caller.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/Values.h"

namespace HostCtl {
namespace Network {

// The counters a port keeps of its traffic, seen from the port's client.
struct PortStats {
    std::uint64_t packetsSent = 0;
    std::uint64_t packetsReceived = 0;
    std::uint64_t bytesSent = 0;
    std::uint64_t bytesReceived = 0;
    std::uint64_t broadcastSent = 0;
    std::uint64_t broadcastReceived = 0;
    std::uint64_t multicastSent = 0;
    std::uint64_t multicastReceived = 0;
    std::uint64_t droppedSent = 0;
    std::uint64_t droppedReceived = 0;
};

// A port's packet counters in the order the packet-statistics view reads
// them.
struct PacketCounters {
    std::uint64_t packetsSent = 0;
    std::uint64_t multicastSent = 0;
    std::uint64_t broadcastSent = 0;
    std::uint64_t packetsReceived = 0;
    std::uint64_t multicastReceived = 0;
    std::uint64_t broadcastReceived = 0;
    std::uint64_t droppedSent = 0;
    std::uint64_t droppedReceived = 0;
};

// The counters of one traffic filter attached to a port.
struct HOSTCTL_EXPORT FilterStats {
    std::string name;
    // Orders the filters of one direction; it is never shown.
    std::string orderingKey;
    // Whether the filter is attached; a detached filter still has an entry.
    bool present = true;
    // Set: the filter sees the traffic the port's client transmits; clear:
    // what it receives.
    bool transmit = false;
    // Whether the filter keeps the extended counters (filtered and on).
    bool extended = false;
    std::uint64_t packetsIn = 0;
    std::uint64_t packetsOut = 0;
    std::uint64_t packetsDropped = 0;
    std::uint64_t packetsFiltered = 0;
    std::uint64_t packetsFaulted = 0;
    std::uint64_t packetsQueued = 0;
    std::uint64_t packetsInjected = 0;
    std::uint64_t packetErrors = 0;
};

// A port of a standard or distributed switch. Objects are snapshots of the
// port as it was read; the counter operations may fail with
// HostCtl::Lib::HostCtlException.
class HOSTCTL_EXPORT Port {
public:
    // Port type numbers (GetType).
    static constexpr int TYPE_VM = 1;        // a virtual machine's virtual NIC, or a free port
    static constexpr int TYPE_KERNEL = 2;    // a kernel interface
    static constexpr int TYPE_INTERNAL = 3;  // the switch itself
    static constexpr int TYPE_UPLINK = 4;    // a physical NIC; traffic enters it from the wire

    virtual ~Port();

    // Unique on the host.
    virtual std::uint32_t GetPortId() const = 0;
    virtual int GetType() const = 0;
    // The name of its switch.
    virtual std::string GetPortsetName() const = 0;
    // What uses the port (a virtual NIC, a kernel interface, a NIC); "" when free.
    virtual std::string GetClientName() const = 0;
    virtual PortStats GetPortStats() const = 0;
    // Fills `counters` from the port's counters.
    virtual void GetPacketCounters(PacketCounters& counters) const = 0;
    // Every filter entry of the port, present or not, in the order stored.
    virtual std::vector<std::unique_ptr<FilterStats>> GetFilterStats() const = 0;
    // The world using the port; 0 for none.
    virtual std::uint64_t GetWorldId() const = 0;
    // The port group of a port on a standard switch; "" otherwise.
    virtual std::string GetPortgroupName() const = 0;
    // The DV port of a port on a distributed switch; "" otherwise.
    virtual std::string GetDVPortId() const = 0;
    // The distributed port group of that DV port ("" when it has none),
    // read with the port: a listing needs no query per port.
    virtual std::string GetDVPortgroupId() const = 0;
    virtual MacAddress GetMacAddress() const = 0;
    // 0.0.0.0 while the client's address is not known.
    virtual Ipv4Address GetIpAddress() const = 0;
    // The NIC the port's traffic leaves by now; "" when none.
    virtual std::string GetTeamUplink() const = 0;
};

}  // namespace Network
}  // namespace HostCtl
