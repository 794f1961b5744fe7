#include "nic/NicNegotiationRestart.h"

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicNegotiationRestart::NicNegotiationRestart() {
    SetDescription("Restart N-Way negotiation on a nic");
}

ORVIX_COMMAND_NEW(NicNegotiationRestart)

boost::shared_ptr<CallSpec::InputSpec> NicNegotiationRestart::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "hwnic", CallSpec::PARAM_STRING, "n", "Name of hwnic to restart negotiation",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicNegotiationRestart::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicNegotiationRestart::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                            boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    OnPnic(networkInfo, input, output, "hwnic", MissingNic::PnicNotFound, [&](HostCtl::Network::Pnic& pnic) {
        pnic.RestartNegotiation();
        Finish(output, MetaObj::MetaBool::New());
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
