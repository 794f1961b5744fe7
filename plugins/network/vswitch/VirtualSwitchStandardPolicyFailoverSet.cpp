#include "vswitch/VirtualSwitchStandardPolicyFailoverSet.h"

#include <string>
#include <vector>

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardPolicyFailoverSet::VirtualSwitchStandardPolicyFailoverSet() {
    SetDescription("Configure the Failover policy for a virtual switch.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardPolicyFailoverSet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardPolicyFailoverSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        VswitchNameInput("The name of the virtual switch to use when configuring the switch failover policy.");
    AddFailoverParameters(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardPolicyFailoverSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchStandardPolicyFailoverSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                             boost::shared_ptr<CallSpec::Output> output) {
    OnSwitch(SwitchLookup::Legacy, input, output, [&](HostCtl::Network::VirtualSwitch& vswitch) {
        // The policy shown is the reference for the adapters the options
        // leave out; the configured one is what is written back.
        HostCtl::Network::NicTeamingPolicy shown = vswitch.GetTeamingPolicy();
        HostCtl::Network::NicTeamingPolicy configured = vswitch.GetConfiguredTeamingPolicy();
        std::vector<std::string> uplinks = vswitch.GetUplinks();
        SetFailoverPolicy(input, output, configured, shown, uplinks);
        WriteUnlessRefused(output, [&] { vswitch.SetTeamingPolicy(configured); });
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
