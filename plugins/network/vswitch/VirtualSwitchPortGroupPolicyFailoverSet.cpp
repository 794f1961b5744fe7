#include "vswitch/VirtualSwitchPortGroupPolicyFailoverSet.h"

#include <string>
#include <vector>

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupPolicyFailoverSet::VirtualSwitchPortGroupPolicyFailoverSet() {
    SetDescription(
        "Configure the Failover policy for a port group. These setting may potentially override virtual switch "
        "settings.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupPolicyFailoverSet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupPolicyFailoverSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        PortGroupPolicySetInput("The name of the port group to set failover policy for.", 1);
    AddFailoverParameters(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupPolicyFailoverSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchPortGroupPolicyFailoverSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                              boost::shared_ptr<CallSpec::Output> output) {
    OnPortGroup(input, output, [&](HostCtl::Network::PortGroup& portGroup) {
        HostCtl::Network::NicTeamingPolicy inForce = portGroup.GetTeamingPolicy();
        HostCtl::Network::NicTeamingPolicy own = OwnPolicyToEdit(*input, portGroup.GetOwnTeamingPolicy());
        std::vector<std::string> uplinks = portGroup.GetVirtualSwitch()->GetUplinks();
        SetFailoverPolicy(input, output, own, inForce, uplinks);
        WriteUnlessRefused(output, [&] { portGroup.SetOwnTeamingPolicy(own); });
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
