// How `ip connection list` shows an endpoint and a TCP state.
#pragma once

#include <cstdint>
#include <string>

namespace OrvixCli {
namespace NetworkNamespace {

// "CLOSED", "LISTEN", ... "TIME_WAIT" for the states 0 to 10 (state 3 is
// "RCVD"); "" for any other number.
std::string TcpStateWord(int state);

// "ADDRESS:PORT", whole however long the address is: an IPv6 address with a
// five-digit port is never cut.
std::string EndpointText(const std::string& address, std::uint16_t port);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
