#include "vswitch/VirtualSwitchPortGroupPolicyFailoverGet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"
#include "vswitch/VswitchRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupPolicyFailoverGet::VirtualSwitchPortGroupPolicyFailoverGet() {
    SetDescription("Get the network failover policy settings governing the given port group");
    DescribePolicyFetcher(*this, PolicyKind::Failover, "PortGroupFailoverPolicy", true);
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupPolicyFailoverGet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupPolicyFailoverGet::GetInputSpecInternal() {
    return PortGroupNameInput("The name of the port group to use when fetching the port group failover policy.");
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupPolicyFailoverGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchPortGroupPolicyFailoverGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("PortGroupFailoverPolicy");
}

void VirtualSwitchPortGroupPolicyFailoverGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                              boost::shared_ptr<CallSpec::Output> output) {
    OnPortGroup(input, output, [&](HostCtl::Network::PortGroup& portGroup) {
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        FillPolicyFields(*record, portGroup.GetTeamingPolicy(), portGroup.GetVirtualSwitch()->GetUplinks());
        FillOverrideFields(*record, portGroup.GetOwnTeamingPolicy());
        Finish(output, record);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
