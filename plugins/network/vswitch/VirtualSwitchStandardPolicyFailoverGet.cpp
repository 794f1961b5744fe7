#include "vswitch/VirtualSwitchStandardPolicyFailoverGet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"
#include "vswitch/VswitchRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardPolicyFailoverGet::VirtualSwitchStandardPolicyFailoverGet() {
    SetDescription("Get the failover policy settings governing the given virtual switch");
    DescribePolicyFetcher(*this, PolicyKind::Failover, "VirtualSwitchFailoverPolicy", false);
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardPolicyFailoverGet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardPolicyFailoverGet::GetInputSpecInternal() {
    return VswitchNameInput("The name of the virtual switch to use when fetching the switch failover policy.");
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardPolicyFailoverGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchStandardPolicyFailoverGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("VirtualSwitchFailoverPolicy");
}

void VirtualSwitchStandardPolicyFailoverGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                             boost::shared_ptr<CallSpec::Output> output) {
    OnSwitch(SwitchLookup::Legacy, input, output, [&](HostCtl::Network::VirtualSwitch& vswitch) {
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        FillPolicyFields(*record, vswitch.GetTeamingPolicy(), vswitch.GetUplinks());
        Finish(output, record);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
