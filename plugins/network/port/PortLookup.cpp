#include "port/PortLookup.h"

#include <cstdlib>
#include <limits>

#include "hostctl/network/port/PortImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

std::int64_t IdFromText(const std::string& text) {
    // strtoll keeps the whole range (saturating beyond it, where no id
    // lies) and reads text without digits as 0.
    return static_cast<std::int64_t>(std::strtoll(text.c_str(), nullptr, 10));
}

std::optional<std::uint32_t> PortIdFrom(std::int64_t id) {
    if (id < 0 || id > static_cast<std::int64_t>(std::numeric_limits<std::uint32_t>::max())) return std::nullopt;
    return static_cast<std::uint32_t>(id);
}

std::unique_ptr<HostCtl::Network::Port> FindPort(PldCtl::Network::VirtualSwitchInfoImpl& switchInfo,
                                                 const CallSpec::Input& input, CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::Port> port;
    if (const std::optional<std::uint32_t> id = PortIdFrom(IdFromText(input.GetString("portid")))) {
        port = switchInfo.GetPortById(*id);
    }
    // The commands read a port through the library's own port objects; any
    // other kind of port is passed over like a port that is not there.
    if (port && !dynamic_cast<const PldCtl::Network::PortImpl*>(port.get())) port.reset();
    if (!port) output.SetError("Couldn't find requested port");
    return port;
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
