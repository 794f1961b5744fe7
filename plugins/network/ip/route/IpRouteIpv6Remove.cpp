#include "ip/route/IpRouteIpv6Remove.h"

#include "common/CommandSupport.h"
#include "ip/route/RouteOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpRouteIpv6Remove::IpRouteIpv6Remove() {
    SetDescription("Remove IPv6 route from the Pallad");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpRouteIpv6Remove)

boost::shared_ptr<CallSpec::InputSpec> IpRouteIpv6Remove::GetInputSpecInternal() {
    return RouteChangeInput(RouteFamily::Ipv6, RouteChange::Remove);
}

boost::shared_ptr<CallSpec::OutputSpec> IpRouteIpv6Remove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpRouteIpv6Remove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    RunRouteChange(RouteFamily::Ipv6, RouteChange::Remove, *input, output);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
