#include "ip/route/IpRouteIpv6Add.h"

#include "common/CommandSupport.h"
#include "ip/route/RouteOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpRouteIpv6Add::IpRouteIpv6Add() {
    SetDescription("Add IPv6 route to the Pallad.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpRouteIpv6Add)

boost::shared_ptr<CallSpec::InputSpec> IpRouteIpv6Add::GetInputSpecInternal() {
    return RouteChangeInput(RouteFamily::Ipv6, RouteChange::Add);
}

boost::shared_ptr<CallSpec::OutputSpec> IpRouteIpv6Add::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpRouteIpv6Add::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    RunRouteChange(RouteFamily::Ipv6, RouteChange::Add, *input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
