#include "ip/netstack/IpNetstackInstanceRemove.h"

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "ip/netstack/NetstackOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpNetstackInstanceRemove::IpNetstackInstanceRemove() {
    SetDescription("Remove a new Netstack Instance.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpNetstackInstanceRemove)

boost::shared_ptr<CallSpec::InputSpec> IpNetstackInstanceRemove::GetInputSpecInternal() {
    return NetstackKeyInput("The network stack instance");
}

boost::shared_ptr<CallSpec::OutputSpec> IpNetstackInstanceRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpNetstackInstanceRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                               boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(
        output,
        [&] {
            networkInfo.RemoveNetstackInstance(input->GetString("netstack"), false);
            FinishTrue(output);
        },
        "Unable to Remove Netstack Instance. Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
