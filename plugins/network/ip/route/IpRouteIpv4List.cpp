#include "ip/route/IpRouteIpv4List.h"

#include "ip/IpOptions.h"
#include "ip/route/RouteRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpRouteIpv4List::IpRouteIpv4List() {
    SetDescription("List configured IPv4 routes");
    DescribeRouteListing(*this, RouteFamily::Ipv4);
}

ORVIX_COMMAND_NEW(IpRouteIpv4List)

boost::shared_ptr<CallSpec::InputSpec> IpRouteIpv4List::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareNetstackParameter(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpRouteIpv4List::GetOutputSpecInternal() {
    return RouteListOutputSpec(RouteFamily::Ipv4);
}

void IpRouteIpv4List::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    RunRouteListing(RouteFamily::Ipv4, *input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
