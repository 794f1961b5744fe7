#include "vswitch/VirtualSwitchPortGroupSet.h"

#include "common/CommandSupport.h"
#include "vswitch/VswitchLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupSet::VirtualSwitchPortGroupSet() {
    SetDescription("Set the vlan id for the given port group");
    SetMetaDataField("type", "operator");
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupSet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "portgroup-name", CallSpec::PARAM_STRING, "p",
                     "The name of the port group to set vlan id for.", Required::Yes);
    // The help text and the check are made from the same two library
    // constants, so they cannot disagree.
    const unsigned minVlan = HostCtl::Network::PortGroup::MIN_VLAN_ID;
    const unsigned maxVlan = HostCtl::Network::PortGroup::MAX_VLAN_ID;
    DeclareParameter(declared, "vlan-id", CallSpec::PARAM_INT, "v",
                     "The vlan id for this port group. This value is in the range (" + std::to_string(minVlan) + " - " +
                         std::to_string(maxVlan) + ")",
                     Required::No, IntRange(minVlan, maxVlan));
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchPortGroupSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                boost::shared_ptr<CallSpec::Output> output) {
    OnPortGroup(input, output, [&](HostCtl::Network::PortGroup& portGroup) {
        // Without --vlan-id the framework's 0 for a missing integer would
        // silently untag the port group; only a given value is written.
        if (input->IsSet("vlan-id")) portGroup.SetVlanId(input->GetInt("vlan-id"));
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
