#include "ip/netstack/IpNetstackInstanceAdd.h"

#include <string>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/ip/NetstackInstanceImpl.h"
#include "ip/netstack/NetstackOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::NetstackInstance;

IpNetstackInstanceAdd::IpNetstackInstanceAdd() {
    SetDescription("Add a new Netstack Instance.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpNetstackInstanceAdd)

boost::shared_ptr<CallSpec::InputSpec> IpNetstackInstanceAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = NetstackKeyInput("The network stack instance");
    DeclareParameter(declared, "disabled", CallSpec::PARAM_FLAG, "d",
                     "Create the netstack instance only in config i.e. in disabled state. Does not create in kernel.",
                     Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpNetstackInstanceAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpNetstackInstanceAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                            boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(
        output,
        [&] {
            // A new instance starts from the host's defaults; the kernel
            // applies them when it creates the instance.
            PldCtl::Network::NetstackInstanceImpl instance(input->GetString("netstack"),
                                                           NetstackInstance::DEFAULT_MAX_CONNECTIONS, "newreno", true,
                                                           NetstackInstance::STATE_CONFIGURED);
            networkInfo.AddNetstackInstance(&instance, input->IsSet("disabled"));
            FinishTrue(output);
        },
        "Unable to add Netstack Instance. Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
