#include "nic/NicVlanStatsSet.h"

#include "common/CommandSupport.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicVlanStatsSet::NicVlanStatsSet() {
    SetDescription("Enable/disable VLAN statistics collection on the NIC.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(NicVlanStatsSet)

boost::shared_ptr<CallSpec::InputSpec> NicVlanStatsSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "nic-name", CallSpec::PARAM_STRING, "n", "Name of the NIC to get statistics from.",
                     Required::Yes);
    DeclareParameter(declared, "enabled", CallSpec::PARAM_BOOL, "e", "Whether to enable or disable VLAN statistics",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicVlanStatsSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void NicVlanStatsSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    const std::string nic = input->GetString("nic-name");
    const bool enabled = input->GetBool("enabled");
    ReportingHostErrors(
        output,
        [&] {
            const auto switches = PldCtl::Network::VirtualSwitchInfoImpl().GetAllSwitches();
            if (HostCtl::Network::Portset* vswitch = FindUplinkSwitch(switches, nic, *output)) {
                vswitch->SetUplinkVlanStatsEnabled(nic, enabled);
                FinishTrue(output);
            }
        },
        "Unable to set VLAN stats: ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
