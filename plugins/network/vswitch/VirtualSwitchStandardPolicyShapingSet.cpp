#include "vswitch/VirtualSwitchStandardPolicyShapingSet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardPolicyShapingSet::VirtualSwitchStandardPolicyShapingSet() {
    SetDescription("Set the shaping policy settings for the given virtual switch");
    SetMetaDataField("type", "operator");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardPolicyShapingSet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardPolicyShapingSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        VswitchNameInput("The name of the virtual switch to use when setting the switch shaping policy.");
    AddShapingParameters(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardPolicyShapingSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchStandardPolicyShapingSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                            boost::shared_ptr<CallSpec::Output> output) {
    OnSwitch(SwitchLookup::Legacy, input, output, [&](HostCtl::Network::VirtualSwitch& vswitch) {
        HostCtl::Network::ShapingPolicy policy = vswitch.GetShapingPolicy();
        SetShapingPolicy(input, output, policy, false);
        WriteUnlessRefused(output, [&] { vswitch.SetShapingPolicy(policy); });
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
