// The connection tables of NetworkInfoImpl, the world names of
// ResourceInfoImpl and the library's tokenizer.
#include "hostctl/ip/IpHost.h"
#include "hostctl/resource/ResourceInfoImpl.h"
#include "hostctl/util/StringUtil.h"

namespace {

using HostCtl::Network::TcpIpConnection;
using PldCtl::Resource::ResourceInfoImpl;

class Connections : public IpHost {
protected:
    PldCtl::Network::NetworkInfoImpl network_;

    // The stored endpoints of a protocol on a netstack.
    std::vector<Json> StoredOf(const std::string& netstack, const std::string& proto) const {
        std::vector<Json> found;
        const Json dump = Dump();
        for (const Json& c : dump["connections"]) {
            if (c["netstack"] == netstack && c["proto"] == proto) found.push_back(c);
        }
        return found;
    }
};

TEST_F(Connections, EachProtocolListsItsOwnEndpointsInTheHostsOrder) {
    // The vector is filled, not appended to.
    std::vector<TcpIpConnection> tcp(3);
    network_.GetCurrentTcpPalladConnections(tcp, kDefault);
    const std::vector<Json> stored = StoredOf(kDefault, "tcp");
    ASSERT_EQ(tcp.size(), stored.size());
    ASSERT_FALSE(tcp.empty());
    const std::vector<std::string> words = {"CLOSED",      "LISTEN",     "SYN_SENT",   "RCVD",
                                            "ESTABLISHED", "CLOSE_WAIT", "FIN_WAIT_1", "CLOSING",
                                            "LAST_ACK",    "FIN_WAIT_2", "TIME_WAIT"};
    for (std::size_t i = 0; i < tcp.size(); ++i) {
        EXPECT_EQ(tcp[i].localAddress, stored[i]["localAddress"]);
        EXPECT_EQ(tcp[i].localPort, stored[i]["localPort"]);
        EXPECT_EQ(tcp[i].foreignAddress, stored[i]["foreignAddress"]);
        EXPECT_EQ(tcp[i].foreignPort, stored[i]["foreignPort"]);
        EXPECT_EQ(tcp[i].recvQueue, stored[i].value("recvQ", 0u));
        EXPECT_EQ(tcp[i].sendQueue, stored[i].value("sendQ", 0u));
        EXPECT_EQ(tcp[i].worldId, stored[i].value("worldId", 0u));
        EXPECT_EQ(tcp[i].ccAlgorithm, stored[i].value("ccAlgorithm", ""));
        ASSERT_LT(tcp[i].state, 11);
        EXPECT_EQ(words[static_cast<std::size_t>(tcp[i].state)], stored[i]["state"]);
    }
    for (const auto& [proto, list] :
         {std::make_pair("udp", &PldCtl::Network::NetworkInfoImpl::GetCurrentUdpPalladConnections),
          std::make_pair("ip", &PldCtl::Network::NetworkInfoImpl::GetCurrentIpPalladConnections)}) {
        std::vector<TcpIpConnection> found;
        (network_.*list)(found, kDefault);
        EXPECT_EQ(found.size(), StoredOf(kDefault, proto).size()) << proto;
        ASSERT_FALSE(found.empty()) << proto;
        for (const auto& c : found) {
            EXPECT_EQ(c.state, 0);
            EXPECT_EQ(c.ccAlgorithm, "");
        }
    }
    std::vector<TcpIpConnection> migrix;
    network_.GetCurrentTcpPalladConnections(migrix, "migrix");
    EXPECT_EQ(migrix.size(), StoredOf("migrix", "tcp").size());
    EXPECT_EQ(MessageOf([&] { network_.GetCurrentUdpPalladConnections(migrix, "nope"); }),
              "Netstack instance nope does not exist");
}

TEST_F(Connections, StateWordsTheLibraryDoesNotKnowHaveNoNumberOfTheTable) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1, "netstacks": [{"key": "defaultTcpipStack"}],
      "connections": [
        {"netstack": "defaultTcpipStack", "proto": "tcp", "localAddress": "192.0.2.1", "localPort": 1,
         "foreignAddress": "192.0.2.2", "foreignPort": 65535, "state": "RCVD", "recvQ": 4294967295},
        {"netstack": "defaultTcpipStack", "proto": "tcp", "localAddress": "192.0.2.1", "localPort": 2,
         "foreignAddress": "192.0.2.2", "foreignPort": 2, "state": "SYN_RCVD"},
        {"netstack": "defaultTcpipStack", "proto": "tcp", "localAddress": "192.0.2.1", "localPort": 3,
         "foreignAddress": "192.0.2.2", "foreignPort": 3},
        {"netstack": "defaultTcpipStack", "proto": "udp", "localAddress": "::", "localPort": 53,
         "foreignAddress": "::", "foreignPort": 0, "state": "LISTEN"}]})");
    std::vector<TcpIpConnection> tcp;
    network_.GetCurrentTcpPalladConnections(tcp, kDefault);
    ASSERT_EQ(tcp.size(), 3u);
    EXPECT_EQ(tcp[0].state, 3);
    EXPECT_EQ(tcp[0].foreignPort, 65535);
    EXPECT_EQ(tcp[0].recvQueue, 4294967295u);
    EXPECT_EQ(tcp[1].state, 11);
    EXPECT_EQ(tcp[2].state, 11);
    std::vector<TcpIpConnection> udp;
    network_.GetCurrentUdpPalladConnections(udp, kDefault);
    ASSERT_EQ(udp.size(), 1u);
    EXPECT_EQ(udp[0].state, 0);
}

TEST_F(Connections, WorldNamesAndFaults) {
    ResourceInfoImpl resources;
    const Json dump = Dump();
    for (const Json& world : dump["worlds"]) {
        EXPECT_EQ(resources.GetWorldName(world["id"].get<unsigned long long>()), world.value("name", ""));
    }
    EXPECT_EQ(resources.GetWorldName(0), "");
    EXPECT_EQ(resources.GetWorldName(4294967296ULL + 1000012), "");

    const unsigned long long id = dump["worlds"][0]["id"].get<unsigned long long>();
    ArmFault("ResourceInfoImpl::GetWorldName", std::to_string(id), "world table busy");
    ArmFault("NetworkInfoImpl::GetCurrentIpPalladConnections", "migrix", "raw sockets unreadable");
    EXPECT_EQ(MessageOf([&] { resources.GetWorldName(id); }), "world table busy");
    std::vector<TcpIpConnection> found;
    network_.GetCurrentIpPalladConnections(found, kDefault);
    EXPECT_EQ(MessageOf([&] { network_.GetCurrentIpPalladConnections(found, "migrix"); }), "raw sockets unreadable");
}

TEST(StringTokenize, AppendsTheNonEmptyPiecesBetweenAnyDelimiter) {
    std::vector<std::string> tokens = {"kept"};
    PldCtl::Util::StringTokenize("  a.example.test  b ,c,", tokens, " ,");
    EXPECT_EQ(tokens, (std::vector<std::string>{"kept", "a.example.test", "b", "c"}));
    std::vector<std::string> none;
    PldCtl::Util::StringTokenize("   ", none, " ");
    PldCtl::Util::StringTokenize("", none, " ");
    EXPECT_TRUE(none.empty());
    PldCtl::Util::StringTokenize("whole", none, "");
    EXPECT_EQ(none, (std::vector<std::string>{"whole"}));
}

}  // namespace
