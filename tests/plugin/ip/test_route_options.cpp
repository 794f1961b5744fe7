// The add and remove steps of both route families against a stand-in for
// the routing object that records what it was asked: which texts select the
// default network, when the default gateway is cleared rather than a route
// removed, what is reported when the gateway does not match, and that the
// library's refusals pass through untouched.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "hostctl/Lib.h"
#include "ip/route/RouteOptions.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Lib::HostCtlException;
using HostCtl::Network::Ipv4Address;
using HostCtl::Network::Ipv4Network;
using HostCtl::Network::Ipv6Address;
using HostCtl::Network::Ipv6Network;

// Answers with the gateways it is given and writes each call it receives as
// one line, with the values in canonical text.
class RecordingRouting : public PldCtl::Network::RoutingInfoImpl {
public:
    Ipv4Address current4, configured4;
    Ipv6Address current6, configured6;
    std::string refusal;  // thrown by the changing calls when not empty
    std::vector<std::string> calls;

    void AddPalladRoute(const Ipv4Network& network, const Ipv4Address& gateway) override {
        Change("add " + network.GetStringAddress() + " via " + gateway.GetStringAddress());
    }
    void RemovePalladRoute(const Ipv4Network& network, const Ipv4Address& gateway) override {
        Change("remove " + network.GetStringAddress() + " via " + gateway.GetStringAddress());
    }
    Ipv4Address GetPalladDefaultGateway() override {
        calls.push_back("current");
        return current4;
    }
    Ipv4Address GetPalladConfigDefaultGateway() override {
        calls.push_back("configured");
        return configured4;
    }
    void SetPalladDefaultGateway(const Ipv4Address& gateway, bool persistOnly) override {
        Change("set " + gateway.GetStringAddress() + (persistOnly ? " persist-only" : ""));
    }
    void AddIpv6PalladRoute(const Ipv6Network& network, const Ipv6Address& gateway) override {
        Change("add " + network.GetStringAddress() + " via " + gateway.GetStringAddress());
    }
    void RemoveIpv6PalladRoute(const Ipv6Network& network, const Ipv6Address& gateway) override {
        Change("remove " + network.GetStringAddress() + " via " + gateway.GetStringAddress());
    }
    Ipv6Address GetIpv6PalladDefaultGateway() override {
        calls.push_back("current");
        return current6;
    }
    Ipv6Address GetIpv6PalladConfigDefaultGateway() override {
        calls.push_back("configured");
        return configured6;
    }
    void SetIpv6PalladDefaultGateway(const Ipv6Address& gateway) override {
        Change("set " + gateway.GetStringAddress());
    }

private:
    void Change(const std::string& call) {
        calls.push_back(call);
        if (!refusal.empty()) throw HostCtlException(refusal);
    }
};

using Calls = std::vector<std::string>;

TEST(RouteNetwork, OnlyTheExactWordDefaultNamesTheDefaultNetwork) {
    EXPECT_EQ(Ipv4RouteNetwork("default"), PldCtl::Network::RoutingInfoImpl::DEFAULT_IPV4_ROUTE);
    EXPECT_EQ(Ipv6RouteNetwork("default"), PldCtl::Network::RoutingInfoImpl::DEFAULT_IPV6_ROUTE);
    EXPECT_EQ(Ipv4RouteNetwork("192.0.2.0/24"), Ipv4Network("192.0.2.0/24"));
    for (const char* text : {"Default", "DEFAULT", " default", "default ", ""}) {
        EXPECT_THROW(Ipv4RouteNetwork(text), HostCtlException) << text;
        EXPECT_THROW(Ipv6RouteNetwork(text), HostCtlException) << text;
    }
}

TEST(AddRoute, HandsTheParsedValuesToTheFamilysOperation) {
    RecordingRouting routing;
    AddRoute(RouteFamily::Ipv4, routing, "default", "192.0.2.1");
    AddRoute(RouteFamily::Ipv4, routing, "203.0.113.128/25", "192.0.2.254");
    AddRoute(RouteFamily::Ipv6, routing, "default", "2001:DB8:10::0001");
    AddRoute(RouteFamily::Ipv6, routing, "2001:db8:40::/48", "fe80::1");
    EXPECT_EQ(routing.calls, (Calls{"add 0.0.0.0/0 via 192.0.2.1", "add 203.0.113.128/25 via 192.0.2.254",
                                    "add ::/0 via 2001:db8:10::1", "add 2001:db8:40::/48 via fe80::1"}));
}

TEST(AddRoute, ReportsTheGatewayBeforeTheNetworkAndAsksNothingOfBadText) {
    RecordingRouting routing;
    try {
        AddRoute(RouteFamily::Ipv4, routing, "bad-network", "bad-gateway");
        FAIL() << "bad text was taken";
    } catch (const HostCtlException& e) {
        EXPECT_NE(e.GetMessage(0).find("bad-gateway"), std::string::npos) << e.GetMessage(0);
    }
    // A gateway of the other family is bad text too.
    EXPECT_THROW(AddRoute(RouteFamily::Ipv6, routing, "default", "192.0.2.1"), HostCtlException);
    EXPECT_THROW(AddRoute(RouteFamily::Ipv4, routing, "2001:db8::/32", "192.0.2.1"), HostCtlException);
    EXPECT_TRUE(routing.calls.empty());
}

TEST(AddRoute, LetsTheLibrarysRefusalThrough) {
    RecordingRouting routing;
    routing.refusal = "Gateway 198.18.0.1 is not reachable from any interface of netstack defaultTcpipStack";
    try {
        AddRoute(RouteFamily::Ipv4, routing, "198.18.0.0/15", "198.18.0.1");
        FAIL() << "the refusal was swallowed";
    } catch (const HostCtlException& e) {
        EXPECT_EQ(e.GetMessage(0), routing.refusal);
    }
}

TEST(RemoveRoute, AnyOtherNetworkIsRemovedAsARouteWithoutReadingTheGateways) {
    RecordingRouting routing;
    EXPECT_EQ(RemoveRoute(RouteFamily::Ipv4, routing, "203.0.113.128/25", "192.0.2.254"), "");
    EXPECT_EQ(RemoveRoute(RouteFamily::Ipv6, routing, "2001:db8:40::/48", "2001:db8:10::fe"), "");
    EXPECT_EQ(routing.calls,
              (Calls{"remove 203.0.113.128/25 via 192.0.2.254", "remove 2001:db8:40::/48 via 2001:db8:10::fe"}));

    routing.calls.clear();
    routing.refusal = "Route to 192.0.2.128/25 via 192.0.2.9 does not exist on netstack defaultTcpipStack";
    EXPECT_THROW(RemoveRoute(RouteFamily::Ipv4, routing, "192.0.2.128/25", "192.0.2.9"), HostCtlException);
}

TEST(RemoveRoute, TheDefaultNetworkClearsTheGatewayInForceOrElseTheConfiguredOne) {
    for (const char* network : {"default", "0.0.0.0/0", "0.0.0.0/0.0.0.0"}) {
        RecordingRouting inForce;
        inForce.current4 = Ipv4Address("192.0.2.1");
        EXPECT_EQ(RemoveRoute(RouteFamily::Ipv4, inForce, network, "192.0.2.1"), "") << network;
        EXPECT_EQ(inForce.calls, (Calls{"current", "set 0.0.0.0"})) << network;

        RecordingRouting configured;
        configured.current4 = Ipv4Address("192.0.2.1");
        configured.configured4 = Ipv4Address("192.0.2.2");
        EXPECT_EQ(RemoveRoute(RouteFamily::Ipv4, configured, network, "192.0.2.2"), "") << network;
        EXPECT_EQ(configured.calls, (Calls{"current", "configured", "set 0.0.0.0"})) << network;
    }

    RecordingRouting ipv6;
    ipv6.configured6 = Ipv6Address("2001:db8:10::1");
    EXPECT_EQ(RemoveRoute(RouteFamily::Ipv6, ipv6, "::/0", "2001:db8:10:0::1"), "");
    EXPECT_EQ(ipv6.calls, (Calls{"current", "configured", "set ::"}));
}

TEST(RemoveRoute, AGatewayThatIsNeitherIsReportedInCanonicalTextAndNothingChanges) {
    RecordingRouting routing;
    routing.current4 = Ipv4Address("192.0.2.1");
    routing.configured4 = Ipv4Address("192.0.2.1");
    routing.current6 = Ipv6Address("2001:db8:10::1");
    EXPECT_EQ(RemoveRoute(RouteFamily::Ipv4, routing, "default", "192.0.2.9"), "192.0.2.9 is not a default route.");
    EXPECT_EQ(RemoveRoute(RouteFamily::Ipv6, routing, "default", "2001:DB8:10:0:0:0:0:9"),
              "2001:db8:10::9 is not a default route.");
    // With no default gateway at all, the unset address does not match
    // either: clearing what is already clear is still refused.
    RecordingRouting none;
    EXPECT_EQ(RemoveRoute(RouteFamily::Ipv4, none, "default", "192.0.2.1"), "192.0.2.1 is not a default route.");
    for (const Calls& calls : {routing.calls, none.calls}) {
        for (const std::string& call : calls) EXPECT_TRUE(call == "current" || call == "configured") << call;
    }
}

}  // namespace
