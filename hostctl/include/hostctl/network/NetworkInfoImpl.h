// Host-wide networking information and settings.
#pragma once

namespace PldCtl {
namespace Network {

class NetworkInfoImpl {
public:
    // Never throws: the host is reached by the operations.
    NetworkInfoImpl();
    virtual ~NetworkInfoImpl();

    // Whether the kernel's IPv6 support is on.
    virtual bool IsPldIpv6Enabled();
    virtual void SetPldIpv6Enabled(bool enabled);
};

}  // namespace Network
}  // namespace PldCtl
