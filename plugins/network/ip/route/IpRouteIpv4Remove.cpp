#include "ip/route/IpRouteIpv4Remove.h"

#include "common/CommandSupport.h"
#include "ip/route/RouteOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpRouteIpv4Remove::IpRouteIpv4Remove() {
    SetDescription("Remove IPv4 route");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpRouteIpv4Remove)

boost::shared_ptr<CallSpec::InputSpec> IpRouteIpv4Remove::GetInputSpecInternal() {
    return RouteChangeInput(RouteFamily::Ipv4, RouteChange::Remove);
}

boost::shared_ptr<CallSpec::OutputSpec> IpRouteIpv4Remove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpRouteIpv4Remove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    RunRouteChange(RouteFamily::Ipv4, RouteChange::Remove, *input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
