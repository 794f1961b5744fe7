#include "ip/connection/ConnectionRecords.h"

#include <array>

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

const std::array<const char*, 11> kTcpStates = {"CLOSED",      "LISTEN",     "SYN_SENT",   "RCVD",
                                                "ESTABLISHED", "CLOSE_WAIT", "FIN_WAIT_1", "CLOSING",
                                                "LAST_ACK",    "FIN_WAIT_2", "TIME_WAIT"};

}  // namespace

std::string TcpStateWord(int state) {
    if (state < 0 || static_cast<std::size_t>(state) >= kTcpStates.size()) return std::string();
    return kTcpStates[static_cast<std::size_t>(state)];
}

std::string EndpointText(const std::string& address, std::uint16_t port) {
    return address + ":" + std::to_string(port);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
