// One open TCP, UDP or raw IP endpoint of a netstack instance.
#pragma once

#include <cstdint>
#include <string>

namespace HostCtl {
namespace Network {

struct TcpIpConnection {
    // Bytes waiting in the receive and the send queue.
    std::uint32_t recvQueue = 0;
    std::uint32_t sendQueue = 0;
    // Address text (IPv4 dotted, IPv6 canonical, "0.0.0.0" / "::" for any).
    std::string localAddress;
    std::uint16_t localPort = 0;
    std::string foreignAddress;
    std::uint16_t foreignPort = 0;
    // TCP state number (0 CLOSED ... 10 TIME_WAIT); 0 for UDP and raw IP.
    int state = 0;
    // The world that owns the endpoint.
    std::uint32_t worldId = 0;
    // The congestion-control algorithm; "" for UDP and raw IP.
    std::string ccAlgorithm;
};

}  // namespace Network
}  // namespace HostCtl
