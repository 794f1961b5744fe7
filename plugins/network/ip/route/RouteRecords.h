// How the route list commands of both families show the routes of a
// netstack: one record a route, the default route named "default".
#pragma once

#include <boost/shared_ptr.hpp>

#include "framework/AutoCli.h"
#include "framework/CallSpec.h"
#include "framework/MetaObj.h"
#include "hostctl/network/ip/RoutingInfoImpl.h"
#include "ip/route/RouteOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

// Makes `command` a fetcher shown as a table of the family's fields.
void DescribeRouteListing(AutoCli::Command& command, RouteFamily family);

// The family's record ("Ipv4Route" or "Ipv6Route") with its fields laid out
// in their order and no values.
boost::shared_ptr<MetaObj::MetaStruct> RouteRecordTemplate(RouteFamily family);
boost::shared_ptr<CallSpec::OutputSpec> RouteListOutputSpec(RouteFamily family);

// One record a route of `routing`'s netstack, in the library's order: the
// network address without its prefix ("default" for the default network),
// the netmask (dotted for IPv4, address form for IPv6), the gateway, the
// interface and, for IPv4 only, where the gateway came from.
boost::shared_ptr<MetaObj::MetaList> RouteRows(RouteFamily family, PldCtl::Network::RoutingInfoImpl& routing);

// The run of a list command on the netstack the options select.
void RunRouteListing(RouteFamily family, const CallSpec::Input& input,
                     const boost::shared_ptr<CallSpec::Output>& output);

}  // namespace NetworkNamespace
}  // namespace OrvixCli
