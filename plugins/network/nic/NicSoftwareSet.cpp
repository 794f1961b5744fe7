#include "nic/NicSoftwareSet.h"

#include "hostctl/network/NetworkFactory.h"
#include "nic/NicOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicSoftwareSet::NicSoftwareSet() {
    SetDescription("Enable and disable software simulation settings on a NIC.");
}

ORVIX_COMMAND_NEW(NicSoftwareSet)

boost::shared_ptr<CallSpec::InputSpec> NicSoftwareSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        NicNameInput("hwnic", "Name of the hwnic whose software similation settings should be updated.", Required::Yes);
    AddSoftwareSimulationParameters(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicSoftwareSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicSoftwareSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    std::unique_ptr<HostCtl::Network::NetworkInfo> nics = HostCtl::Network::NetworkFactory::GetNetworkInfo();
    const HostCtl::Network::SoftwareSimulation simulation = SoftwareSimulationFromOptions(*input);
    // With no option given there is nothing to change, and nothing is sent.
    ChangeNic(*nics, input, output, "hwnic", MissingNic::PnicNotFound, [&](HostCtl::Network::Pnic& pnic) {
        if (simulation.mask != 0) pnic.SetSoftwareSimulation(simulation);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
