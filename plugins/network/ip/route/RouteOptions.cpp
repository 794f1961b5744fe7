#include "ip/route/RouteOptions.h"

#include "common/CommandSupport.h"
#include "ip/IpOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using HostCtl::Network::Ipv4Address;
using HostCtl::Network::Ipv4Network;
using HostCtl::Network::Ipv6Address;
using HostCtl::Network::Ipv6Network;
using PldCtl::Network::RoutingInfoImpl;

// The library's operations of each family under one set of names, so that
// the add and remove steps are written once.
struct Ipv4Routes {
    using Network = Ipv4Network;
    using Address = Ipv4Address;
    static Network NetworkOf(const std::string& text) { return Ipv4RouteNetwork(text); }
    static const Network& DefaultNetwork() { return RoutingInfoImpl::DEFAULT_IPV4_ROUTE; }
    static void Add(RoutingInfoImpl& routing, const Network& network, const Address& gateway) {
        routing.AddPalladRoute(network, gateway);
    }
    static void Remove(RoutingInfoImpl& routing, const Network& network, const Address& gateway) {
        routing.RemovePalladRoute(network, gateway);
    }
    static Address CurrentGateway(RoutingInfoImpl& routing) { return routing.GetPalladDefaultGateway(); }
    static Address ConfiguredGateway(RoutingInfoImpl& routing) { return routing.GetPalladConfigDefaultGateway(); }
    // 0.0.0.0 clears the default gateway; the flag only asks for the
    // configuration to be written without applying it, which is not wanted.
    static void ClearDefaultGateway(RoutingInfoImpl& routing) {
        routing.SetPalladDefaultGateway(Ipv4Address("0.0.0.0"), false);
    }
};

struct Ipv6Routes {
    using Network = Ipv6Network;
    using Address = Ipv6Address;
    static Network NetworkOf(const std::string& text) { return Ipv6RouteNetwork(text); }
    static const Network& DefaultNetwork() { return RoutingInfoImpl::DEFAULT_IPV6_ROUTE; }
    static void Add(RoutingInfoImpl& routing, const Network& network, const Address& gateway) {
        routing.AddIpv6PalladRoute(network, gateway);
    }
    static void Remove(RoutingInfoImpl& routing, const Network& network, const Address& gateway) {
        routing.RemoveIpv6PalladRoute(network, gateway);
    }
    static Address CurrentGateway(RoutingInfoImpl& routing) { return routing.GetIpv6PalladDefaultGateway(); }
    static Address ConfiguredGateway(RoutingInfoImpl& routing) { return routing.GetIpv6PalladConfigDefaultGateway(); }
    // The unspecified address :: clears the default gateway.
    static void ClearDefaultGateway(RoutingInfoImpl& routing) { routing.SetIpv6PalladDefaultGateway(Ipv6Address()); }
};

template <typename Routes>
void AddRouteOf(RoutingInfoImpl& routing, const std::string& networkText, const std::string& gatewayText) {
    const typename Routes::Address gateway(gatewayText);
    const typename Routes::Network network = Routes::NetworkOf(networkText);
    Routes::Add(routing, network, gateway);
}

template <typename Routes>
std::string RemoveRouteOf(RoutingInfoImpl& routing, const std::string& networkText, const std::string& gatewayText) {
    const typename Routes::Address gateway(gatewayText);
    const typename Routes::Network network = Routes::NetworkOf(networkText);
    if (network != Routes::DefaultNetwork()) {
        Routes::Remove(routing, network, gateway);
        return std::string();
    }
    // The configured gateway is asked only when the one in force differs.
    if (gateway == Routes::CurrentGateway(routing) || gateway == Routes::ConfiguredGateway(routing)) {
        Routes::ClearDefaultGateway(routing);
        return std::string();
    }
    return gateway.GetStringAddress() + " is not a default route.";
}

std::string NetworkDescription(const char* family, RouteChange change) {
    const char* verb = change == RouteChange::Add ? "add the route to" : "remove the route from";
    return std::string("The ") + family + " address and prefix length of the network to " + verb +
           ". Specify 'default' to indicate the default network.";
}

// The add texts end with a period, the remove texts do not.
std::string GatewayDescription(const char* family, RouteChange change) {
    return std::string("The ") + family + " address of the gateway through which a route to be " +
           (change == RouteChange::Add ? "added." : "removed");
}

}  // namespace

boost::shared_ptr<CallSpec::InputSpec> RouteChangeInput(RouteFamily family, RouteChange change) {
    const char* familyWord = family == RouteFamily::Ipv4 ? "Ipv4" : "Ipv6";
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "network", CallSpec::PARAM_STRING, "n", NetworkDescription(familyWord, change),
                     Required::Yes);
    DeclareParameter(declared, "gateway", CallSpec::PARAM_STRING, "g", GatewayDescription(familyWord, change),
                     Required::Yes);
    DeclareNetstackParameter(declared);
    return declared;
}

Ipv4Network Ipv4RouteNetwork(const std::string& text) {
    return text == "default" ? RoutingInfoImpl::DEFAULT_IPV4_ROUTE : Ipv4Network(text);
}

Ipv6Network Ipv6RouteNetwork(const std::string& text) {
    return text == "default" ? RoutingInfoImpl::DEFAULT_IPV6_ROUTE : Ipv6Network(text);
}

void AddRoute(RouteFamily family, RoutingInfoImpl& routing, const std::string& networkText,
              const std::string& gatewayText) {
    if (family == RouteFamily::Ipv4) {
        AddRouteOf<Ipv4Routes>(routing, networkText, gatewayText);
    } else {
        AddRouteOf<Ipv6Routes>(routing, networkText, gatewayText);
    }
}

std::string RemoveRoute(RouteFamily family, RoutingInfoImpl& routing, const std::string& networkText,
                        const std::string& gatewayText) {
    return family == RouteFamily::Ipv4 ? RemoveRouteOf<Ipv4Routes>(routing, networkText, gatewayText)
                                       : RemoveRouteOf<Ipv6Routes>(routing, networkText, gatewayText);
}

void RunRouteChange(RouteFamily family, RouteChange change, const CallSpec::Input& input,
                    const boost::shared_ptr<CallSpec::Output>& output) {
    ReportingHostErrors(output, [&] {
        RoutingInfoImpl routing(SelectedNetstack(input));
        const std::string networkText = input.GetString("network");
        const std::string gatewayText = input.GetString("gateway");
        if (change == RouteChange::Add) {
            AddRoute(family, routing, networkText, gatewayText);
        } else {
            const std::string refusal = RemoveRoute(family, routing, networkText, gatewayText);
            if (!refusal.empty()) output->SetError(refusal);
        }
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
