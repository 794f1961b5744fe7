#include "nic/NicPauseParamsSet.h"

#include "hostctl/network/NetworkFactory.h"
#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicPauseParamsSet::NicPauseParamsSet() {
    SetDescription("Set pause parameters for a NIC");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(NicPauseParamsSet)

boost::shared_ptr<CallSpec::InputSpec> NicPauseParamsSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        NicNameInput("nic-name", "Name of NIC whose pause parameters should be set.", Required::Yes);
    DeclareParameter(declared, "auto", CallSpec::PARAM_BOOL, "a", "Enable/disable auto negotiation.", Required::No);
    DeclareParameter(declared, "rx", CallSpec::PARAM_BOOL, "r", "Enable/disable pause RX flow control.", Required::No);
    DeclareParameter(declared, "tx", CallSpec::PARAM_BOOL, "t", "Enable/disable pause TX flow control.", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicPauseParamsSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicPauseParamsSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    std::unique_ptr<HostCtl::Network::NetworkInfo> nics = HostCtl::Network::NetworkFactory::GetNetworkInfo();
    ChangeNic(*nics, input, output, "nic-name", MissingNic::NicNotFound,
              [&](HostCtl::Network::Pnic& pnic) { RewritePause(*input, pnic); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
