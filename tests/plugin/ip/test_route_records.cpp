// The rows of the route listings against a stand-in routing object: the
// default route named "default" whichever way it is stored, the network
// shown without its prefix and with host bits as stored, the netmask forms
// of both families, the source asked per route, and the library's order.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "hostctl/Lib.h"
#include "ip/route/RouteRecords.h"

namespace {

using namespace OrvixCli::NetworkNamespace;
using HostCtl::Network::Ipv4Address;
using HostCtl::Network::Ipv4Network;
using HostCtl::Network::Ipv4Route;
using HostCtl::Network::Ipv6Address;
using HostCtl::Network::Ipv6Network;
using HostCtl::Network::Ipv6Route;

class ListedRouting : public PldCtl::Network::RoutingInfoImpl {
public:
    std::vector<Ipv4Route> routes4;
    std::vector<Ipv6Route> routes6;
    std::vector<std::string> sourcesAsked;
    bool failing = false;

    std::vector<Ipv4Route> GetCurrentPalladRoutes() override {
        if (failing) throw HostCtl::Lib::HostCtlException("Netstack instance nowhere does not exist");
        return routes4;
    }
    std::vector<Ipv6Route> GetCurrentIpv6PalladRoutes() override { return routes6; }
    // A different word for each route, so that a row showing another
    // route's source is seen.
    std::string GetDefaultGatewaySource(const Ipv4Network& network) override {
        sourcesAsked.push_back(network.GetStringAddress());
        return "FROM " + network.GetStringAddress();
    }
};

// The row's values in field order, "|"-joined; a field without a value
// shows as "-".
std::string Row(const MetaObj::MetaObjectPtr& element) {
    auto record = boost::dynamic_pointer_cast<MetaObj::MetaStruct>(element);
    std::string line;
    for (const auto& field : record->GetFields()) {
        auto value = boost::dynamic_pointer_cast<MetaObj::MetaString>(field.second);
        line += (line.empty() ? "" : "|") + (value && value->HasValue() ? value->GetValue() : std::string("-"));
    }
    return line;
}

std::vector<std::string> Rows(const MetaObj::MetaList& rows) {
    std::vector<std::string> lines;
    for (const auto& element : rows.GetElements()) lines.push_back(Row(element));
    return lines;
}

TEST(RouteRows, Ipv4RowsInTheLibrarysOrderEachWithItsOwnSource) {
    ListedRouting routing;
    routing.routes4 = {
        {Ipv4Network("203.0.113.130/25"), Ipv4Address("192.0.2.254"), "pld0"},
        {Ipv4Network("0.0.0.0/0"), Ipv4Address("192.0.2.1"), "pld0"},
        {Ipv4Network("198.51.100.0/24"), Ipv4Address(), "pld1"},
        {Ipv4Network("192.0.2.7/32"), Ipv4Address("192.0.2.1"), ""},
    };
    auto rows = RouteRows(RouteFamily::Ipv4, routing);
    EXPECT_EQ(Rows(*rows), (std::vector<std::string>{
                               "203.0.113.130|255.255.255.128|192.0.2.254|pld0|FROM 203.0.113.130/25",
                               "default|0.0.0.0|192.0.2.1|pld0|FROM 0.0.0.0/0",
                               "198.51.100.0|255.255.255.0|0.0.0.0|pld1|FROM 198.51.100.0/24",
                               "192.0.2.7|255.255.255.255|192.0.2.1||FROM 192.0.2.7/32",
                           }));
    EXPECT_EQ(routing.sourcesAsked.size(), 4u);
}

TEST(RouteRows, Ipv6RowsShowTheMaskInAddressFormAndNoSource) {
    ListedRouting routing;
    routing.routes6 = {
        {Ipv6Network("::/0"), Ipv6Address("2001:db8:10::1"), "pld0"},
        {Ipv6Network("2001:db8:10::/64"), Ipv6Address(), "pld0"},
        {Ipv6Network("2001:db8:40::/48"), Ipv6Address("2001:db8:10::fe"), "pld0"},
        {Ipv6Network("2001:db8:20::21/128"), Ipv6Address("fe80::1"), "pld1"},
        {Ipv6Network("2001:db8:50::/60"), Ipv6Address(), "pld1"},
    };
    auto rows = RouteRows(RouteFamily::Ipv6, routing);
    EXPECT_EQ(Rows(*rows), (std::vector<std::string>{
                               "default|::|2001:db8:10::1|pld0",
                               "2001:db8:10::|ffff:ffff:ffff:ffff::|::|pld0",
                               "2001:db8:40::|ffff:ffff:ffff::|2001:db8:10::fe|pld0",
                               "2001:db8:20::21|ffff:ffff:ffff:ffff:ffff:ffff:ffff:ffff|fe80::1|pld1",
                               "2001:db8:50::|ffff:ffff:ffff:fff0::|::|pld1",
                           }));
    EXPECT_TRUE(routing.sourcesAsked.empty());
}

TEST(RouteRows, NoRoutesGiveAnEmptyListThatStillNamesItsRecordAndAFailurePassesThrough) {
    ListedRouting routing;
    for (RouteFamily family : {RouteFamily::Ipv4, RouteFamily::Ipv6}) {
        auto rows = RouteRows(family, routing);
        EXPECT_EQ(rows->Size(), 0u);
        auto templ = boost::dynamic_pointer_cast<MetaObj::MetaStruct>(rows->GetElementTemplate());
        ASSERT_TRUE(templ);
        EXPECT_EQ(templ->GetTypeName(), family == RouteFamily::Ipv4 ? "Ipv4Route" : "Ipv6Route");
    }
    routing.failing = true;
    EXPECT_THROW(RouteRows(RouteFamily::Ipv4, routing), HostCtl::Lib::HostCtlException);
}

}  // namespace
