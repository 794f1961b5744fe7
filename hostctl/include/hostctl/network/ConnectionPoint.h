// Where a kernel interface or a virtual NIC connects: a port group of a
// standard switch, a port of a distributed switch, or an opaque network.
#pragma once

#include <cstdint>
#include <string>

#include "hostctl/Export.h"

namespace HostCtl {
namespace Network {

// A port of a distributed switch: the switch's UUID, the port's id on it and
// the id of the connection made to it.
struct DVPortParam {
    std::string switchUuid;
    std::string portId;
    std::uint32_t connectionId = 0;
};

// A network the host only reads, never creates.
struct OpaqueNetworkParam {
    std::string networkId;
    std::string networkType;
    std::string externalId;
};

class HOSTCTL_EXPORT ConnectionPoint {
public:
    enum Type : int {
        TYPE_PORT_GROUP = 1,
        TYPE_DV_PORT = 2,
        TYPE_OPAQUE_NETWORK = 3,
    };

    virtual ~ConnectionPoint();

    virtual int GetType() const = 0;
    // The port set (switch) the connection point belongs to; "" when the
    // host does not know it.
    virtual std::string GetPortsetName() const = 0;
    // The port group's name for TYPE_PORT_GROUP, else "".
    virtual std::string GetPortGroupName() const = 0;
    // The port for TYPE_DV_PORT, else an empty parameter.
    virtual DVPortParam GetDVPortParam() const = 0;
    // The network for TYPE_OPAQUE_NETWORK, else an empty parameter.
    virtual OpaqueNetworkParam GetOpaqueNetworkParam() const = 0;
    // Whether the host has what the connection point names. Never throws.
    virtual bool IsValid() const = 0;
};

}  // namespace Network
}  // namespace HostCtl
