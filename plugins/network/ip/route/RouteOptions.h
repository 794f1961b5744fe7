// What the route commands of both families share: their options, how the
// network and gateway texts become values, and the add and remove steps.
//
// The steps work on a routing object the caller made for the chosen
// netstack, so that they run the same against the host and against a
// stand-in. They do no checks of their own: bad text and refused routes are
// the library's, reported by the HostCtlException it throws.
#pragma once

#include <string>

#include <boost/shared_ptr.hpp>

#include "framework/CallSpec.h"
#include "hostctl/Values.h"
#include "hostctl/network/ip/RoutingInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

enum class RouteFamily { Ipv4, Ipv6 };
enum class RouteChange { Add, Remove };

// network (-n), gateway (-g), both required, then netstack (-N); the
// descriptions name the family and the change.
boost::shared_ptr<CallSpec::InputSpec> RouteChangeInput(RouteFamily family, RouteChange change);

// The destination a route option names: exactly "default" is the family's
// default network, any other text is parsed (and refused by the parser).
HostCtl::Network::Ipv4Network Ipv4RouteNetwork(const std::string& text);
HostCtl::Network::Ipv6Network Ipv6RouteNetwork(const std::string& text);

// Adds the route to `networkText` via `gatewayText`. The gateway is read
// before the network, so a command with both wrong reports the gateway.
void AddRoute(RouteFamily family, PldCtl::Network::RoutingInfoImpl& routing, const std::string& networkText,
              const std::string& gatewayText);

// Removes the route to `networkText` via `gatewayText`. The default network
// is not removed as a route: when the gateway is the one in force, or else
// the configured one, the default gateway is cleared. Returns the message to
// report when the gateway is neither ("G is not a default route."), empty
// when something was removed.
std::string RemoveRoute(RouteFamily family, PldCtl::Network::RoutingInfoImpl& routing, const std::string& networkText,
                        const std::string& gatewayText);

// The run of an add or remove command on the netstack the options select.
// It ends with the result true unless the library threw, also when the
// default gateway did not match and that was reported.
void RunRouteChange(RouteFamily family, RouteChange change, const CallSpec::Input& input,
                    const boost::shared_ptr<CallSpec::Output>& output);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
