#include "nic/NicCoalesceSet.h"

#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicCoalesceSet::NicCoalesceSet() {
    SetDescription("Set coalesce parameters on a nic");
}

ORVIX_COMMAND_NEW(NicCoalesceSet)

boost::shared_ptr<CallSpec::InputSpec> NicCoalesceSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        NicNameInput("hwnic", "Name of hwnic to set coalesce parameters.", Required::Yes);
    AddCoalesceParameters(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicCoalesceSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicCoalesceSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl nics;
    ChangeNic(nics, input, output, "hwnic", MissingNic::PnicNotFound,
              [&](HostCtl::Network::Pnic& pnic) { RewriteCoalesce(*input, pnic); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
