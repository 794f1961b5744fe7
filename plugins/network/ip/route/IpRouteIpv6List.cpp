#include "ip/route/IpRouteIpv6List.h"

#include "ip/IpOptions.h"
#include "ip/route/RouteRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpRouteIpv6List::IpRouteIpv6List() {
    SetDescription("List configured IPv6 routes");
    DescribeRouteListing(*this, RouteFamily::Ipv6);
}

ORVIX_COMMAND_NEW(IpRouteIpv6List)

boost::shared_ptr<CallSpec::InputSpec> IpRouteIpv6List::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareNetstackParameter(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpRouteIpv6List::GetOutputSpecInternal() {
    return RouteListOutputSpec(RouteFamily::Ipv6);
}

void IpRouteIpv6List::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    RunRouteListing(RouteFamily::Ipv6, *input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
