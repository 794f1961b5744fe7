#include "vswitch/VirtualSwitchPortGroupPolicySecuritySet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupPolicySecuritySet::VirtualSwitchPortGroupPolicySecuritySet() {
    SetDescription("Set the security policy for a given port group");
    SetMetaDataField("type", "operator");
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupPolicySecuritySet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupPolicySecuritySet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        PortGroupPolicySetInput("The name of the port group to set security policy for.", 3);
    AddSecurityParameters(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupPolicySecuritySet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchPortGroupPolicySecuritySet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                              boost::shared_ptr<CallSpec::Output> output) {
    OnPortGroup(input, output, [&](HostCtl::Network::PortGroup& portGroup) {
        HostCtl::Network::PortSecurityPolicy own = OwnPolicyToEdit(*input, portGroup.GetOwnSecurityPolicy());
        SetSecurityPolicy(input, output, own);
        WriteUnlessRefused(output, [&] { portGroup.SetOwnSecurityPolicy(own); });
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
