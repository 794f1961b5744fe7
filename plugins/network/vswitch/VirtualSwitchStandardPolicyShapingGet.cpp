#include "vswitch/VirtualSwitchStandardPolicyShapingGet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"
#include "vswitch/VswitchRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardPolicyShapingGet::VirtualSwitchStandardPolicyShapingGet() {
    SetDescription("Get the shaping policy settings for the given virtual switch");
    DescribePolicyFetcher(*this, PolicyKind::Shaping, "VirtualSwitchTrafficShapingPolicy", false);
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardPolicyShapingGet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardPolicyShapingGet::GetInputSpecInternal() {
    return VswitchNameInput("The name of the virtual switch to use when fetching the switch shaping policy.");
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardPolicyShapingGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchStandardPolicyShapingGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("VirtualSwitchTrafficShapingPolicy");
}

void VirtualSwitchStandardPolicyShapingGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                            boost::shared_ptr<CallSpec::Output> output) {
    OnSwitch(SwitchLookup::Legacy, input, output, [&](HostCtl::Network::VirtualSwitch& vswitch) {
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        FillPolicyFields(*record, vswitch.GetShapingPolicy());
        Finish(output, record);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
