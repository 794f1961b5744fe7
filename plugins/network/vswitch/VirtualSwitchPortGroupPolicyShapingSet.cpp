#include "vswitch/VirtualSwitchPortGroupPolicyShapingSet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupPolicyShapingSet::VirtualSwitchPortGroupPolicyShapingSet() {
    SetDescription("Set the shaping policy settings for the given port group");
    SetMetaDataField("type", "operator");
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupPolicyShapingSet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupPolicyShapingSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared =
        PortGroupPolicySetInput("The name of the port group to set shaping policy for.", 1);
    AddShapingParameters(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupPolicyShapingSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void ReportUnsetShapingValues(CallSpec::Output& output, const HostCtl::Network::ShapingPolicy& own,
                              const HostCtl::Network::ShapingPolicy& inForce) {
    if (!own.IsPeakBpsSet() && !inForce.IsPeakBpsSet()) {
        output.SetError(
            "Unable to set shaping policy. A Peak BPS value must be set on either this port group or on "
            "the parent virtual switch.");
    }
    if (!own.IsAverageBpsSet() && !inForce.IsAverageBpsSet()) {
        output.SetError(
            "Unable to set shaping policy. An Average BPS value must be set on either this port group or "
            "on the parent virtual switch.");
    }
    if (!own.IsBurstSizeSet() && !inForce.IsBurstSizeSet()) {
        output.SetError(
            "Unable to set shaping policy. A Burst Size value must be set on either this port group or "
            "on the parent virtual switch.");
    }
}

void VirtualSwitchPortGroupPolicyShapingSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                             boost::shared_ptr<CallSpec::Output> output) {
    OnPortGroup(input, output, [&](HostCtl::Network::PortGroup& portGroup) {
        HostCtl::Network::ShapingPolicy own = OwnPolicyToEdit(*input, portGroup.GetOwnShapingPolicy());
        SetShapingPolicy(input, output, own, false);
        // Only a port group that switches shaping on itself must be sure that
        // the values it shapes with exist somewhere.
        if (own.IsEnabledSet() && own.GetEnabled())
            ReportUnsetShapingValues(*output, own, portGroup.GetShapingPolicy());
        WriteUnlessRefused(output, [&] { portGroup.SetOwnShapingPolicy(own); });
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
