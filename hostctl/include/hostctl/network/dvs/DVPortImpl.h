// A port of a distributed switch as a connection point.
#pragma once

#include <cstdint>

#include "hostctl/Export.h"
#include "hostctl/network/ConnectionPoint.h"

namespace PldCtl {
namespace Network {

// Made from a DVPortParam it never throws. IsValid tells whether the host has
// a DV port with that id on the switch of that UUID.
class HOSTCTL_EXPORT DVPortImpl : public virtual HostCtl::Network::ConnectionPoint {
public:
    explicit DVPortImpl(const HostCtl::Network::DVPortParam& param);
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

private:
    HostCtl::Network::DVPortParam param_;
};

}  // namespace Network
}  // namespace PldCtl
