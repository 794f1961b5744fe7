// A netstack instance: one of the kernel's independent TCP/IP stacks.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"

namespace HostCtl {
namespace Network {

// Objects are snapshots. The setters change the instance on the host at
// once (one transaction each); `persist` is accepted for callers that pass it
// and has no effect here. They throw HostCtl::Lib::HostCtlException, writing
// nothing, when the host refuses.
class HOSTCTL_EXPORT NetstackInstance {
public:
    // The state of an instance that exists in the kernel; any other state
    // means it exists only in the configuration.
    static constexpr int STATE_IN_KERNEL = 0x1234;
    // The state of an instance recorded in the configuration only.
    static constexpr int STATE_CONFIGURED = 2;
    static constexpr std::int64_t DEFAULT_MAX_CONNECTIONS = 11000;
    static constexpr const char* DEFAULT_KEY = "defaultTcpipStack";

    virtual ~NetstackInstance();

    virtual std::string GetKey() const = 0;
    virtual std::string GetName() const = 0;
    virtual int GetState() const = 0;
    virtual std::int64_t GetMaxConnections() const = 0;
    virtual std::int64_t GetCurrentMaxConnections() const = 0;
    virtual std::string GetCongestionControlAlgorithm() const = 0;
    virtual bool GetIpv6Enabled() const = 0;
    virtual bool GetCurrentIpv6Enabled() const = 0;

    virtual void SetName(const std::string& name, bool persist) = 0;
    // Throws for a limit that does not fit the host's field (1 to 2^31-1).
    virtual void SetMaxConnections(std::int64_t maxConnections, bool persist) = 0;
    // Throws for an algorithm the host does not offer.
    virtual void SetCongestionControlAlgorithm(const std::string& algorithm, bool persist) = 0;
    virtual void SetIpv6Enabled(bool enabled, bool persist) = 0;
    // Creates the instance in the kernel, applying the configured limit and
    // IPv6 switch; nothing happens when it is there already.
    virtual void Enable() = 0;
    // Destroys the kernel instance and keeps its configuration. Throws for
    // the default instance.
    virtual void Disable() = 0;
};

}  // namespace Network
}  // namespace HostCtl
