// The connection tables of a netstack instance over the host store: each
// protocol's endpoints, read with one listing of the netstack's children.
#include <array>

#include "hostctl/network/NetworkInfoImpl.h"
#include "network/ip/IpLookup.h"

namespace PldCtl {
namespace Network {

using Detail::ConnectionRecord;
using HostCtl::Network::TcpIpConnection;

namespace {

// TCP state words by number; a stored word the table lacks reads as the
// number after the last, which has no word.
constexpr std::array<const char*, 11> kTcpStates = {
    "CLOSED",     "LISTEN",  "SYN_SENT", "RCVD",       "ESTABLISHED", "CLOSE_WAIT",
    "FIN_WAIT_1", "CLOSING", "LAST_ACK", "FIN_WAIT_2", "TIME_WAIT",
};
constexpr int kUnknownTcpState = static_cast<int>(kTcpStates.size());

int TcpStateNumber(const std::string& word) {
    for (std::size_t i = 0; i < kTcpStates.size(); ++i) {
        if (word == kTcpStates[i]) return static_cast<int>(i);
    }
    return kUnknownTcpState;
}

void ListConnections(const char* operation, const char* proto, std::vector<TcpIpConnection>& connections,
                     const std::string& netstack) {
    Store::HostStore& store = Detail::EnterOperation(operation, netstack);
    std::vector<std::string> texts;
    store.Read([&](Store::Transaction& t) {
        if (!t.Exists(Detail::NetstackRecord::kSection, netstack)) {
            throw HostCtl::Lib::HostCtlException(Detail::MissingNetstackMessage(netstack));
        }
        texts = t.ListChildrenText(ConnectionRecord::kSection, netstack);
    });
    connections.clear();
    const bool tcp = std::string(proto) == "tcp";
    for (const std::string& text : texts) {
        ConnectionRecord record = Detail::Decode<ConnectionRecord>(text);
        if (record.proto != proto) continue;
        TcpIpConnection connection;
        connection.recvQueue = record.recvQ;
        connection.sendQueue = record.sendQ;
        connection.localAddress = std::move(record.localAddress);
        connection.localPort = static_cast<std::uint16_t>(record.localPort);
        connection.foreignAddress = std::move(record.foreignAddress);
        connection.foreignPort = static_cast<std::uint16_t>(record.foreignPort);
        connection.state = tcp ? TcpStateNumber(record.state) : 0;
        connection.worldId = record.worldId;
        if (tcp) connection.ccAlgorithm = std::move(record.ccAlgorithm);
        connections.push_back(std::move(connection));
    }
}

}  // namespace

void NetworkInfoImpl::GetCurrentTcpPalladConnections(std::vector<TcpIpConnection>& connections,
                                                     const std::string& netstack) {
    ListConnections("NetworkInfoImpl::GetCurrentTcpPalladConnections", "tcp", connections, netstack);
}

void NetworkInfoImpl::GetCurrentUdpPalladConnections(std::vector<TcpIpConnection>& connections,
                                                     const std::string& netstack) {
    ListConnections("NetworkInfoImpl::GetCurrentUdpPalladConnections", "udp", connections, netstack);
}

void NetworkInfoImpl::GetCurrentIpPalladConnections(std::vector<TcpIpConnection>& connections,
                                                    const std::string& netstack) {
    ListConnections("NetworkInfoImpl::GetCurrentIpPalladConnections", "ip", connections, netstack);
}

}  // namespace Network
}  // namespace PldCtl
