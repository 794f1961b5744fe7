#include "vswitch/VirtualSwitchPortGroupPolicyShapingGet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"
#include "vswitch/VswitchRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupPolicyShapingGet::VirtualSwitchPortGroupPolicyShapingGet() {
    SetDescription("Get the network shaping policy settings governing the given port group");
    DescribePolicyFetcher(*this, PolicyKind::Shaping, "PortGroupTrafficShapingPolicy", true);
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupPolicyShapingGet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupPolicyShapingGet::GetInputSpecInternal() {
    return PortGroupNameInput("The name of the port group to use when fetching the port group shaping policy.");
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupPolicyShapingGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchPortGroupPolicyShapingGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("PortGroupTrafficShapingPolicy");
}

void VirtualSwitchPortGroupPolicyShapingGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                             boost::shared_ptr<CallSpec::Output> output) {
    OnPortGroup(input, output, [&](HostCtl::Network::PortGroup& portGroup) {
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        FillPolicyFields(*record, portGroup.GetShapingPolicy());
        FillOverrideFields(*record, portGroup.GetOwnShapingPolicy());
        Finish(output, record);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
