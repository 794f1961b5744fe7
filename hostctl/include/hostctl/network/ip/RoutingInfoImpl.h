// The routes, default gateways and neighbor caches of one netstack instance.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "hostctl/Export.h"
#include "hostctl/Values.h"

namespace HostCtl {
namespace Network {

struct Ipv4Route {
    Ipv4Network network;
    Ipv4Address gateway;
    // The outgoing interface.
    std::string interfaceName;
};

struct Ipv6Route {
    Ipv6Network network;
    Ipv6Address gateway;
    std::string interfaceName;
};

// One entry of the IPv4 neighbor cache (ARP). `type` is the library's own
// code, shown by RoutingInfoImpl::GetIpv4NeighborType.
struct Ipv4Neighbor {
    Ipv4Address address;
    std::string macAddress;
    std::string interfaceName;
    // Seconds left; negative for an entry that never expires.
    std::int32_t expiry = 0;
    int type = 0;
};

// One entry of the IPv6 neighbor cache. `type` and `state` are the library's
// codes, shown by GetIpv6NeighborType and GetIpv6NeighborState.
struct Ipv6Neighbor {
    Ipv6Address address;
    std::string macAddress;
    std::string interfaceName;
    std::uint32_t expiry = 0;
    int type = 0;
    int state = 0;
};

}  // namespace Network
}  // namespace HostCtl

namespace PldCtl {
namespace Detail {
struct RouteSources;
}  // namespace Detail

namespace Network {

// Made for a netstack instance it never throws; the operations throw
// HostCtl::Lib::HostCtlException (a netstack the host does not have, a route
// it refuses) and change nothing when they do. Each operation is one store
// read or one transaction.
class HOSTCTL_EXPORT RoutingInfoImpl {
public:
    // 0.0.0.0/0 and ::/0.
    static const HostCtl::Network::Ipv4Network DEFAULT_IPV4_ROUTE;
    static const HostCtl::Network::Ipv6Network DEFAULT_IPV6_ROUTE;

    explicit RoutingInfoImpl(const std::string& netstack = "defaultTcpipStack");
    virtual ~RoutingInfoImpl();

    void SetNetstackInstanceKey(const std::string& netstack);
    const std::string& GetNetstackInstanceKey() const { return netstack_; }

    // IPv4 routes. Adding DEFAULT_IPV4_ROUTE sets the default gateway.
    // Throws for a route that exists, a gateway no interface of the netstack
    // can reach, or a route that does not exist (remove).
    virtual void AddPalladRoute(const HostCtl::Network::Ipv4Network& network,
                                const HostCtl::Network::Ipv4Address& gateway);
    virtual void RemovePalladRoute(const HostCtl::Network::Ipv4Network& network,
                                   const HostCtl::Network::Ipv4Address& gateway);
    // In the host's order, the default route first when there is one.
    virtual std::vector<HostCtl::Network::Ipv4Route> GetCurrentPalladRoutes();
    // The gateway of the default route in force; 0.0.0.0 for none.
    virtual HostCtl::Network::Ipv4Address GetPalladDefaultGateway();
    // The configured default gateway; 0.0.0.0 for none.
    virtual HostCtl::Network::Ipv4Address GetPalladConfigDefaultGateway();
    // Sets the default gateway, or clears it (and its route) for 0.0.0.0.
    // `persistOnly` has no effect here.
    virtual void SetPalladDefaultGateway(const HostCtl::Network::Ipv4Address& gateway, bool persistOnly);
    // Where the gateway of the route to `network` came from, as a word for
    // users ("MANUAL", "DHCP", ...).
    virtual std::string GetDefaultGatewaySource(const HostCtl::Network::Ipv4Network& network);

    // IPv6 routes, likewise.
    virtual void AddIpv6PalladRoute(const HostCtl::Network::Ipv6Network& network,
                                    const HostCtl::Network::Ipv6Address& gateway);
    virtual void RemoveIpv6PalladRoute(const HostCtl::Network::Ipv6Network& network,
                                       const HostCtl::Network::Ipv6Address& gateway);
    virtual std::vector<HostCtl::Network::Ipv6Route> GetCurrentIpv6PalladRoutes();
    virtual HostCtl::Network::Ipv6Address GetIpv6PalladDefaultGateway();
    virtual HostCtl::Network::Ipv6Address GetIpv6PalladConfigDefaultGateway();
    // Clears the default gateway (and its route) for the unspecified address ::.
    virtual void SetIpv6PalladDefaultGateway(const HostCtl::Network::Ipv6Address& gateway);

    // Neighbor caches; an empty interface name means every interface of the
    // netstack. In the host's order.
    virtual void GetCurrentIpv4PalladNeighbors(std::vector<HostCtl::Network::Ipv4Neighbor>& neighbors,
                                               const std::string& interfaceName);
    virtual void GetCurrentIpv6PalladNeighbors(std::vector<HostCtl::Network::Ipv6Neighbor>& neighbors,
                                               const std::string& interfaceName);
    // Display words of an entry's codes; "" for a code the library does not
    // name. Never throw.
    virtual std::string GetIpv4NeighborType(const HostCtl::Network::Ipv4Neighbor& neighbor);
    virtual std::string GetIpv6NeighborType(const HostCtl::Network::Ipv6Neighbor& neighbor);
    virtual std::string GetIpv6NeighborState(const HostCtl::Network::Ipv6Neighbor& neighbor);
    // Removes the entries for that address on the entry's interface (every
    // interface of the netstack when it is ""). Throws when there is none.
    virtual void RemoveIpv4Neighbor(const HostCtl::Network::Ipv4Neighbor& neighbor);
    virtual void RemoveIpv6Neighbor(const HostCtl::Network::Ipv6Neighbor& neighbor);

private:
    std::string netstack_;
    // The sources of the routes the last IPv4 listing returned, which
    // GetDefaultGatewaySource answers from while this object changes nothing:
    // a listing asks for the source of each of its routes.
    std::shared_ptr<Detail::RouteSources> sources_;
};

}  // namespace Network
}  // namespace PldCtl
