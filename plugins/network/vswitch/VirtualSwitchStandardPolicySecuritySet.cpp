#include "vswitch/VirtualSwitchStandardPolicySecuritySet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardPolicySecuritySet::VirtualSwitchStandardPolicySecuritySet() {
    SetDescription("Set the security policy for a given virtual switch");
    SetMetaDataField("type", "operator");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardPolicySecuritySet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardPolicySecuritySet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        VswitchNameInput("The name of the virtual switch to use when setting the switch security policy.");
    AddSecurityParameters(declared, "p");
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardPolicySecuritySet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchStandardPolicySecuritySet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                             boost::shared_ptr<CallSpec::Output> output) {
    OnSwitch(SwitchLookup::Legacy, input, output, [&](HostCtl::Network::VirtualSwitch& vswitch) {
        HostCtl::Network::PortSecurityPolicy policy = vswitch.GetSecurityPolicy();
        SetSecurityPolicy(input, output, policy);
        WriteUnlessRefused(output, [&] { vswitch.SetSecurityPolicy(policy); });
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
