// Routes, default gateways and neighbor caches as RoutingInfoImpl keeps them
// on the default host: order, interface choice, the configured gateway that
// follows the default route, refusals that write nothing, and faults.
#include "hostctl/ip/IpHost.h"
#include "hostctl/network/ip/RoutingInfoImpl.h"

namespace {

using HostCtl::Network::Ipv4Neighbor;
using HostCtl::Network::Ipv4Network;
using HostCtl::Network::Ipv6Address;
using HostCtl::Network::Ipv6Neighbor;
using PldCtl::Network::RoutingInfoImpl;

class Routing : public IpHost {
protected:
    RoutingInfoImpl routing_{kDefault};

    // "network via gateway on interface" per IPv4 route, in listed order.
    std::vector<std::string> Ipv4Routes() {
        std::vector<std::string> lines;
        for (const auto& route : routing_.GetCurrentPalladRoutes()) {
            lines.push_back(route.network.GetStringAddress() + " via " + route.gateway.GetStringAddress() + " on " +
                            route.interfaceName);
        }
        return lines;
    }
    std::vector<std::string> Ipv6Routes() {
        std::vector<std::string> lines;
        for (const auto& route : routing_.GetCurrentIpv6PalladRoutes()) {
            lines.push_back(route.network.GetStringAddress() + " via " + route.gateway.GetStringAddress() + " on " +
                            route.interfaceName);
        }
        return lines;
    }
    // What routes and gateways are stored, to see that a refusal wrote nothing.
    Json RoutingState() const {
        const Json dump = Dump();
        return Json{dump["routes"], dump["netstacks"]};
    }
    Json Netstack(const std::string& key) const { return Stored("netstacks", "key", key); }
};

TEST_F(Routing, ListsEachFamilyDefaultFirstThenByNetworkWithTheInterfaceThatReachesTheGateway) {
    routing_.AddPalladRoute(Ipv4Network("198.51.100.128/25"), Ipv4Address("192.0.2.254"));
    // Host bits are cleared; the gateway lies in pld1's network.
    routing_.AddPalladRoute(Ipv4Network("192.0.2.77/26"), Ipv4Address("198.51.100.1"));
    EXPECT_EQ(Ipv4Routes(), (std::vector<std::string>{
                                "0.0.0.0/0 via 192.0.2.1 on pld0",
                                "192.0.2.0/24 via 0.0.0.0 on pld0",
                                "192.0.2.64/26 via 198.51.100.1 on pld1",
                                "198.51.100.0/24 via 0.0.0.0 on pld1",
                                "198.51.100.128/25 via 192.0.2.254 on pld0",
                                "203.0.113.128/25 via 192.0.2.254 on pld0",
                            }));

    routing_.AddIpv6PalladRoute(Ipv6Network("2001:db8:1::/48"), Ipv6Address("2001:db8:10::fe"));
    // A link-local gateway is reached from the first interface with IPv6.
    routing_.AddIpv6PalladRoute(Ipv6Network("2001:db8:2::/48"), Ipv6Address("fe80::1"));
    EXPECT_EQ(Ipv6Routes(), (std::vector<std::string>{
                                "::/0 via 2001:db8:10::1 on pld0",
                                "2001:db8:1::/48 via 2001:db8:10::fe on pld0",
                                "2001:db8:2::/48 via fe80::1 on pld0",
                                "2001:db8:10::/64 via :: on pld0",
                                "2001:db8:20::/64 via :: on pld1",
                                "2001:db8:40::/48 via 2001:db8:10::fe on pld0",
                            }));

    // Each netstack has its own table.
    routing_.SetNetstackInstanceKey("migrix");
    routing_.AddPalladRoute(Ipv4Network("198.51.100.0/24"), Ipv4Address("203.0.113.254"));
    EXPECT_EQ(Ipv4Routes(), (std::vector<std::string>{"0.0.0.0/0 via 203.0.113.1 on pld2",
                                                      "198.51.100.0/24 via 203.0.113.254 on pld2",
                                                      "203.0.113.0/24 via 0.0.0.0 on pld2"}));
    EXPECT_EQ(Ipv6Routes(), (std::vector<std::string>{"2001:db8:30::/64 via :: on pld2"}));

    routing_.RemovePalladRoute(Ipv4Network("198.51.100.0/24"), Ipv4Address("203.0.113.254"));
    routing_.SetNetstackInstanceKey(kDefault);
    routing_.RemovePalladRoute(Ipv4Network("192.0.2.64/26"), Ipv4Address("198.51.100.1"));
    routing_.RemoveIpv6PalladRoute(Ipv6Network("2001:db8:2::/48"), Ipv6Address("fe80::1"));
    EXPECT_EQ(Ipv4Routes().size(), 5u);
    EXPECT_EQ(Ipv6Routes().size(), 5u);
    const Json stored = Stored("routes", "network", "198.51.100.128/25");
    EXPECT_EQ(stored.value("source", ""), "MANUAL");
    EXPECT_EQ(stored.value("interface", ""), "pld0");
}

TEST_F(Routing, RefusedRoutesWriteNothing) {
    const Json before = RoutingState();
    auto add = [&](const std::string& network, const std::string& gateway) {
        return MessageOf([&] { routing_.AddPalladRoute(Ipv4Network(network), Ipv4Address(gateway)); });
    };
    EXPECT_EQ(add("192.0.2.0/24", "0.0.0.0"),
              "Route to 192.0.2.0/24 via 0.0.0.0 already exists on netstack " + std::string(kDefault));
    EXPECT_EQ(add("0.0.0.0/0", "192.0.2.254"),
              "Route to 0.0.0.0/0 via 192.0.2.1 already exists on netstack defaultTcpipStack");
    EXPECT_EQ(add("10.0.0.0/8", "10.1.1.1"),
              "Gateway 10.1.1.1 is not reachable from any interface of netstack defaultTcpipStack");
    // A network reached directly needs an interface in it.
    EXPECT_EQ(add("10.0.0.0/8", "0.0.0.0"),
              "Gateway 0.0.0.0 is not reachable from any interface of netstack defaultTcpipStack");
    // pld2 reaches 203.0.113.1, but it belongs to another netstack.
    EXPECT_EQ(add("10.0.0.0/8", "203.0.113.1"),
              "Gateway 203.0.113.1 is not reachable from any interface of netstack defaultTcpipStack");
    EXPECT_EQ(MessageOf([&] { routing_.RemovePalladRoute(Ipv4Network("192.0.2.0/24"), Ipv4Address("192.0.2.1")); }),
              "Route to 192.0.2.0/24 via 192.0.2.1 does not exist on netstack defaultTcpipStack");
    EXPECT_EQ(
        MessageOf([&] { routing_.AddIpv6PalladRoute(Ipv6Network("2001:db8:99::/48"), Ipv6Address("2001:db8:77::1")); }),
        "Gateway 2001:db8:77::1 is not reachable from any interface of netstack defaultTcpipStack");
    // The key joins netstack, network and gateway: a netstack name with '|'
    // must not reach another netstack's routes.
    routing_.SetNetstackInstanceKey("defaultTcpipStack|192.0.2.0/24");
    EXPECT_EQ(MessageOf([&] { routing_.RemovePalladRoute(Ipv4Network("0.0.0.0/32"), Ipv4Address()); }),
              "Netstack instance defaultTcpipStack|192.0.2.0/24 does not exist");
    routing_.SetNetstackInstanceKey("nope");
    EXPECT_EQ(add("192.0.2.0/25", "0.0.0.0"), "Netstack instance nope does not exist");
    EXPECT_EQ(MessageOf([&] { routing_.GetCurrentIpv6PalladRoutes(); }), "Netstack instance nope does not exist");
    EXPECT_EQ(MessageOf([&] { routing_.GetPalladConfigDefaultGateway(); }), "Netstack instance nope does not exist");
    EXPECT_EQ(RoutingState(), before);
}

TEST_F(Routing, TheConfiguredGatewayFollowsTheDefaultRoute) {
    EXPECT_EQ(routing_.GetPalladDefaultGateway(), Ipv4Address("192.0.2.1"));
    EXPECT_EQ(routing_.GetPalladConfigDefaultGateway(), Ipv4Address("192.0.2.1"));

    routing_.SetPalladDefaultGateway(Ipv4Address("192.0.2.254"), false);
    EXPECT_EQ(routing_.GetPalladDefaultGateway(), Ipv4Address("192.0.2.254"));
    EXPECT_EQ(Netstack(kDefault).value("ipv4Gateway", ""), "192.0.2.254");
    EXPECT_EQ(Ipv4Routes().front(), "0.0.0.0/0 via 192.0.2.254 on pld0");
    EXPECT_EQ(Ipv4Routes().size(), 4u);

    // An unreachable gateway changes nothing.
    EXPECT_EQ(MessageOf([&] { routing_.SetPalladDefaultGateway(Ipv4Address("10.9.9.9"), false); }),
              "Gateway 10.9.9.9 is not reachable from any interface of netstack defaultTcpipStack");
    EXPECT_EQ(routing_.GetPalladDefaultGateway(), Ipv4Address("192.0.2.254"));

    routing_.SetPalladDefaultGateway(Ipv4Address("0.0.0.0"), false);
    EXPECT_FALSE(routing_.GetPalladDefaultGateway().IsSet());
    EXPECT_FALSE(routing_.GetPalladConfigDefaultGateway().IsSet());
    EXPECT_EQ(Netstack(kDefault).value("ipv4Gateway", "unset"), "");
    EXPECT_EQ(Ipv4Routes().front(), "192.0.2.0/24 via 0.0.0.0 on pld0");

    // Adding the default route configures its gateway; removing it clears it.
    routing_.AddPalladRoute(RoutingInfoImpl::DEFAULT_IPV4_ROUTE, Ipv4Address("192.0.2.1"));
    EXPECT_EQ(routing_.GetPalladConfigDefaultGateway(), Ipv4Address("192.0.2.1"));
    routing_.RemovePalladRoute(RoutingInfoImpl::DEFAULT_IPV4_ROUTE, Ipv4Address("192.0.2.1"));
    EXPECT_FALSE(routing_.GetPalladConfigDefaultGateway().IsSet());
    EXPECT_FALSE(routing_.GetPalladDefaultGateway().IsSet());

    // IPv6 likewise, on its own field; IPv4 stays as it is.
    routing_.SetIpv6PalladDefaultGateway(Ipv6Address("2001:db8:10::fe"));
    EXPECT_EQ(routing_.GetIpv6PalladDefaultGateway(), Ipv6Address("2001:db8:10::fe"));
    EXPECT_EQ(Netstack(kDefault).value("ipv6Gateway", ""), "2001:db8:10::fe");
    routing_.SetIpv6PalladDefaultGateway(Ipv6Address());
    EXPECT_TRUE(routing_.GetIpv6PalladDefaultGateway().IsUnspecified());
    EXPECT_TRUE(routing_.GetIpv6PalladConfigDefaultGateway().IsUnspecified());
    EXPECT_EQ(Ipv6Routes().front(), "2001:db8:10::/64 via :: on pld0");

    // migrix keeps its own gateways.
    routing_.SetNetstackInstanceKey("migrix");
    EXPECT_EQ(routing_.GetPalladDefaultGateway(), Ipv4Address("203.0.113.1"));
    EXPECT_TRUE(routing_.GetIpv6PalladConfigDefaultGateway().IsUnspecified());
}

TEST_F(Routing, GatewaySourcesAreThoseOfTheRoutesAsTheyAreNow) {
    const Ipv4Network dhcp("198.51.100.0/24");
    // Without a listing, and after one.
    EXPECT_EQ(routing_.GetDefaultGatewaySource(dhcp), "DHCP");
    routing_.GetCurrentPalladRoutes();
    EXPECT_EQ(routing_.GetDefaultGatewaySource(dhcp), "DHCP");
    EXPECT_EQ(routing_.GetDefaultGatewaySource(RoutingInfoImpl::DEFAULT_IPV4_ROUTE), "MANUAL");
    EXPECT_EQ(routing_.GetDefaultGatewaySource(Ipv4Network("10.0.0.0/8")), "MANUAL");

    // A route added again by hand is manual, whatever the last listing said.
    routing_.RemovePalladRoute(dhcp, Ipv4Address());
    routing_.AddPalladRoute(dhcp, Ipv4Address());
    EXPECT_EQ(routing_.GetDefaultGatewaySource(dhcp), "MANUAL");

    // Another netstack has its own routes.
    RoutingInfoImpl other(kDefault);
    other.GetCurrentPalladRoutes();
    other.SetNetstackInstanceKey("migrix");
    EXPECT_EQ(other.GetDefaultGatewaySource(Ipv4Network("198.51.100.0/24")), "MANUAL");
}

TEST_F(Routing, NeighborsPerFamilyAndInterfaceWithTheirWords) {
    std::vector<Ipv4Neighbor> ipv4 = {Ipv4Neighbor()};
    routing_.GetCurrentIpv4PalladNeighbors(ipv4, "");
    ASSERT_FALSE(ipv4.empty());
    std::vector<std::string> pld1;
    for (const auto& n : ipv4) {
        EXPECT_FALSE(n.address.GetStringAddress().empty());
        EXPECT_NE(routing_.GetIpv4NeighborType(n), "");
        if (n.interfaceName == "pld1") pld1.push_back(n.address.GetStringAddress());
    }
    const Json gateway = Stored("neighbors", "address", "192.0.2.254");
    const auto found =
        std::find_if(ipv4.begin(), ipv4.end(), [](const auto& n) { return n.address == Ipv4Address("192.0.2.254"); });
    ASSERT_NE(found, ipv4.end());
    EXPECT_EQ(routing_.GetIpv4NeighborType(*found), gateway.value("type", ""));
    EXPECT_EQ(found->macAddress, gateway.value("mac", ""));

    std::vector<Ipv4Neighbor> onPld1;
    routing_.GetCurrentIpv4PalladNeighbors(onPld1, "pld1");
    std::vector<std::string> onPld1Addresses;
    for (const auto& n : onPld1) onPld1Addresses.push_back(n.address.GetStringAddress());
    EXPECT_EQ(onPld1Addresses, pld1);

    std::vector<Ipv6Neighbor> ipv6;
    routing_.GetCurrentIpv6PalladNeighbors(ipv6, "");
    ASSERT_FALSE(ipv6.empty());
    for (const auto& n : ipv6) {
        const Json stored = Stored("neighbors", "address", n.address.GetStringAddress());
        EXPECT_EQ(routing_.GetIpv6NeighborType(n), stored.value("type", "")) << n.address.GetStringAddress();
        EXPECT_EQ(routing_.GetIpv6NeighborState(n), stored.value("state", "Reachable"));
        EXPECT_EQ(n.expiry, stored.value("expiry", 0u));
    }
    // Codes the library does not name show as nothing.
    Ipv6Neighbor odd;
    odd.type = 99;
    odd.state = -1;
    EXPECT_EQ(routing_.GetIpv6NeighborType(odd), "");
    EXPECT_EQ(routing_.GetIpv6NeighborState(odd), "");
}

TEST_F(Routing, NeighborsAreRemovedFromOneInterfaceOrFromAll) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1,
      "netstacks": [{"key": "defaultTcpipStack"}, {"key": "lab"}],
      "interfaces": [{"name": "pld0", "netstack": "defaultTcpipStack"}, {"name": "pld1", "netstack": "defaultTcpipStack"},
                     {"name": "pld2", "netstack": "lab"}],
      "neighbors": [
        {"netstack": "defaultTcpipStack", "interface": "pld0", "address": "192.0.2.9", "expiry": -1, "type": "Static"},
        {"netstack": "defaultTcpipStack", "interface": "pld1", "address": "192.0.2.9", "expiry": 30},
        {"netstack": "defaultTcpipStack", "interface": "pld1", "address": "192.0.2.10", "type": "Local"},
        {"netstack": "defaultTcpipStack", "interface": "pld0", "address": "2001:db8::9", "state": "Probe"},
        {"netstack": "defaultTcpipStack", "interface": "pld1", "address": "2001:db8::9", "expiry": 4294967295},
        {"netstack": "lab", "interface": "pld2", "address": "192.0.2.9"}]})");
    std::vector<Ipv4Neighbor> ipv4;
    routing_.GetCurrentIpv4PalladNeighbors(ipv4, "");
    ASSERT_EQ(ipv4.size(), 3u);
    EXPECT_EQ(ipv4[0].expiry, -1);
    EXPECT_EQ(routing_.GetIpv4NeighborType(ipv4[0]), "Static");
    EXPECT_EQ(routing_.GetIpv4NeighborType(ipv4[1]), "Dynamic");
    EXPECT_EQ(routing_.GetIpv4NeighborType(ipv4[2]), "Local");
    std::vector<Ipv6Neighbor> ipv6;
    routing_.GetCurrentIpv6PalladNeighbors(ipv6, "pld1");
    ASSERT_EQ(ipv6.size(), 1u);
    EXPECT_EQ(ipv6[0].expiry, 4294967295u);
    EXPECT_EQ(routing_.GetIpv6NeighborState(ipv6[0]), "Reachable");

    Ipv4Neighbor target;
    target.address = Ipv4Address("192.0.2.9");
    target.interfaceName = "pld1";
    routing_.RemoveIpv4Neighbor(target);
    routing_.GetCurrentIpv4PalladNeighbors(ipv4, "");
    ASSERT_EQ(ipv4.size(), 2u);
    EXPECT_EQ(ipv4[0].interfaceName, "pld0");
    EXPECT_EQ(MessageOf([&] { routing_.RemoveIpv4Neighbor(target); }),
              "No neighbor 192.0.2.9 on interface pld1 of netstack defaultTcpipStack");
    target.interfaceName = "pld1|192.0.2.10";
    EXPECT_EQ(MessageOf([&] { routing_.RemoveIpv4Neighbor(target); }),
              "No neighbor 192.0.2.9 on interface pld1|192.0.2.10 of netstack defaultTcpipStack");

    // Without an interface: every entry of the address on this netstack, of
    // this family only.
    Ipv6Neighbor all;
    all.address = Ipv6Address("2001:db8::9");
    routing_.RemoveIpv6Neighbor(all);
    routing_.GetCurrentIpv6PalladNeighbors(ipv6, "");
    EXPECT_TRUE(ipv6.empty());
    EXPECT_EQ(MessageOf([&] { routing_.RemoveIpv6Neighbor(all); }),
              "No neighbor 2001:db8::9 on netstack defaultTcpipStack");
    routing_.GetCurrentIpv4PalladNeighbors(ipv4, "");
    EXPECT_EQ(ipv4.size(), 2u);
    routing_.SetNetstackInstanceKey("lab");
    routing_.GetCurrentIpv4PalladNeighbors(ipv4, "");
    EXPECT_EQ(ipv4.size(), 1u);
}

TEST_F(Routing, InjectedFaultsFailTheirOperationOnTheirNetstackOnly) {
    ArmFault("RoutingInfoImpl::AddPalladRoute", kDefault, "routing table locked");
    ArmFault("RoutingInfoImpl::GetCurrentIpv4PalladNeighbors", "migrix", "arp cache unreadable");
    const Json before = RoutingState();
    EXPECT_EQ(MessageOf([&] { routing_.AddPalladRoute(Ipv4Network("198.51.100.128/25"), Ipv4Address("192.0.2.1")); }),
              "routing table locked");
    EXPECT_EQ(RoutingState(), before);
    std::vector<Ipv4Neighbor> neighbors;
    routing_.GetCurrentIpv4PalladNeighbors(neighbors, "");
    routing_.SetNetstackInstanceKey("migrix");
    routing_.AddPalladRoute(Ipv4Network("198.51.100.128/25"), Ipv4Address("203.0.113.1"));
    EXPECT_EQ(MessageOf([&] { routing_.GetCurrentIpv4PalladNeighbors(neighbors, ""); }), "arp cache unreadable");
}

}  // namespace
