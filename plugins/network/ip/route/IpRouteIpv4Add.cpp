#include "ip/route/IpRouteIpv4Add.h"

#include "common/CommandSupport.h"
#include "ip/route/RouteOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpRouteIpv4Add::IpRouteIpv4Add() {
    SetDescription("Add IPv4 route to the Pallad.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpRouteIpv4Add)

boost::shared_ptr<CallSpec::InputSpec> IpRouteIpv4Add::GetInputSpecInternal() {
    return RouteChangeInput(RouteFamily::Ipv4, RouteChange::Add);
}

boost::shared_ptr<CallSpec::OutputSpec> IpRouteIpv4Add::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpRouteIpv4Add::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    RunRouteChange(RouteFamily::Ipv4, RouteChange::Add, *input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
