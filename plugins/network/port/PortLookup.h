// How the port and VM commands read the id they are given, and how the port
// commands find the one port it names.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

#include "framework/CallSpec.h"
#include "hostctl/network/port/Port.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

// An id as the user typed it, read like strtol in base 10 but over the
// whole signed 64-bit range: text that is no number reads as 0, and nothing
// is cut to 32 bits, so 4294967296 plus an id never names that id.
std::int64_t IdFromText(const std::string& text);

// The 32-bit port id `id` stands for; nothing for a negative id or one
// past the largest port id, which name no port.
std::optional<std::uint32_t> PortIdFrom(std::int64_t id);

// The port whose id the portid option gives, found directly by its id
// whatever the number of ports on the host; null after reporting "Couldn't
// find requested port" when no port has it. Throws HostCtlException as the
// library does.
std::unique_ptr<HostCtl::Network::Port> FindPort(PldCtl::Network::VirtualSwitchInfoImpl& switchInfo,
                                                 const CallSpec::Input& input, CallSpec::Output& output);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
