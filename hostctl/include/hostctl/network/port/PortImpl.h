// The library's ports, over the host's `ports` collection.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/port/Port.h"

namespace PldCtl {
namespace Detail {
// The stored record of a port, private to the library.
struct PortRecord;
}  // namespace Detail

namespace Network {

// A snapshot of a stored port. Fault names: "PortImpl::GetPortStats",
// "PortImpl::GetPacketCounters" and "PortImpl::GetFilterStats", keyed by
// the decimal port id.
class HOSTCTL_EXPORT PortImpl : public virtual HostCtl::Network::Port {
public:
    // `dvPortgroupId` is the port group of the port's DV port, when the
    // port is on a distributed switch.
    explicit PortImpl(std::shared_ptr<const Detail::PortRecord> record, std::string dvPortgroupId = std::string());
    ~PortImpl() override;

    // The type number of a stored type word (Port::TYPE_*); TYPE_VM for a
    // word the library does not know.
    static int TypeNumber(const std::string& word);

    std::uint32_t GetPortId() const override;
    int GetType() const override;
    std::string GetPortsetName() const override;
    std::string GetClientName() const override;
    HostCtl::Network::PortStats GetPortStats() const override;
    void GetPacketCounters(HostCtl::Network::PacketCounters& counters) const override;
    std::vector<std::unique_ptr<HostCtl::Network::FilterStats>> GetFilterStats() const override;
    std::uint64_t GetWorldId() const override;
    std::string GetPortgroupName() const override;
    std::string GetDVPortId() const override;
    std::string GetDVPortgroupId() const override;
    HostCtl::Network::MacAddress GetMacAddress() const override;
    HostCtl::Network::Ipv4Address GetIpAddress() const override;
    std::string GetTeamUplink() const override;

private:
    std::string Key() const;
    std::shared_ptr<const Detail::PortRecord> record_;
    std::string dvPortgroupId_;
};

}  // namespace Network
}  // namespace PldCtl
