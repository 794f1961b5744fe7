// Tables of standard switching that both the library and its callers use:
// a command offers the words the library stores, so the two cannot drift.
#pragma once

#include <array>
#include <cstdint>

namespace HostCtl {
namespace Network {

// The CDP status words of a standard switch. A word's position is the index
// VirtualSwitch::SetCDPStatus takes.
inline constexpr std::array<const char*, 4> kCdpStatusWords = {"down", "listen", "advertise", "both"};

// The ports all switches of a host may have together, unless the host's
// system settings say otherwise ("maxPorts").
inline constexpr std::int64_t kMaxHostPorts = 4608;

}  // namespace Network
}  // namespace HostCtl
