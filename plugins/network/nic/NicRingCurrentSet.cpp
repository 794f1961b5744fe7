#include "nic/NicRingCurrentSet.h"

#include "hostctl/network/NetworkFactory.h"
#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicRingCurrentSet::NicRingCurrentSet() {
    SetDescription("Set current RX/TX ring buffer parameters of a NIC");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(NicRingCurrentSet)

boost::shared_ptr<CallSpec::InputSpec> NicRingCurrentSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = NicNameInput(
        "nic-name", "The name of the NIC whose current RX/TX ring buffer parameters should be set.", Required::Yes);
    AddRingSizeParameters(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicRingCurrentSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicRingCurrentSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    std::unique_ptr<HostCtl::Network::NetworkInfo> nics = HostCtl::Network::NetworkFactory::GetNetworkInfo();
    const HostCtl::Network::RingParams sizes = RingSizesFromOptions(*input);
    // With no size given there is nothing to change, and nothing is sent.
    ChangeNic(*nics, input, output, "nic-name", MissingNic::NicNotFound, [&](HostCtl::Network::Pnic& pnic) {
        if (sizes.mask != 0) pnic.SetRingParams(sizes);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
