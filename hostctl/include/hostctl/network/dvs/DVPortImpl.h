// A port of a distributed switch: as a DV port, and as a connection point
// for kernel interfaces.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/network/ConnectionPoint.h"
#include "hostctl/network/dvs/DVSwitch.h"

namespace PldCtl {
namespace Detail {
struct DvPortRecord;
}  // namespace Detail

namespace Network {

// Made from a DVPortParam it never throws. IsValid tells whether the host has
// a DV port with that id on the switch of that UUID; the DV port operations
// read the port on first use and throw HostCtlException when the host has
// none.
class HOSTCTL_EXPORT DVPortImpl : public virtual HostCtl::Network::ConnectionPoint,
                                  public virtual HostCtl::Network::DVPort {
public:
    explicit DVPortImpl(const HostCtl::Network::DVPortParam& param);
    // A snapshot a listing made: the stored port and the clients of the
    // host's ports on it.
    DVPortImpl(const HostCtl::Network::DVPortParam& param, std::shared_ptr<const Detail::DvPortRecord> record,
               std::vector<std::string> clients);
    ~DVPortImpl() override;

    // The connection id set on this object, else the one the host stores
    // for the port (0 when no connection was made to it yet).
    std::uint32_t GetConnectionId() const;
    // Changes this object only; adding an interface on it records the id
    // on the port.
    void SetConnectionId(std::uint32_t connectionId);

    int GetType() const override;
    std::string GetPortsetName() const override;
    std::string GetPortGroupName() const override;
    HostCtl::Network::DVPortParam GetDVPortParam() const override;
    HostCtl::Network::OpaqueNetworkParam GetOpaqueNetworkParam() const override;
    bool IsValid() const override;

    std::string GetPortId() const override;
    std::string GetDVPortgroupId() const override;
    bool IsInUse(std::vector<std::string>& clients) const override;
    bool IsLacpEnabled() const override;
    int GetLacpMode() const override;

private:
    struct Snapshot {
        std::shared_ptr<const Detail::DvPortRecord> record;
        std::vector<std::string> clients;
    };
    // The stored port, read on first use.
    const Snapshot& Stored() const;
    HostCtl::Network::DVPortParam param_;
    mutable std::optional<Snapshot> snapshot_;
};

}  // namespace Network
}  // namespace PldCtl
