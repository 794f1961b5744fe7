#include "vswitch/VirtualSwitchPortGroupPolicySecurityGet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"
#include "vswitch/VswitchRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupPolicySecurityGet::VirtualSwitchPortGroupPolicySecurityGet() {
    SetDescription("Get the Security Policy governing the given port group. ");
    DescribePolicyFetcher(*this, PolicyKind::Security, "PortGroupSecurityPolicy", true);
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupPolicySecurityGet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupPolicySecurityGet::GetInputSpecInternal() {
    return PortGroupNameInput("The name of the port group to use when fetching the network security policy.");
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupPolicySecurityGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchPortGroupPolicySecurityGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("PortGroupSecurityPolicy");
}

void VirtualSwitchPortGroupPolicySecurityGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                              boost::shared_ptr<CallSpec::Output> output) {
    OnPortGroup(input, output, [&](HostCtl::Network::PortGroup& portGroup) {
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        FillPolicyFields(*record, portGroup.GetSecurityPolicy());
        FillOverrideFields(*record, portGroup.GetOwnSecurityPolicy());
        Finish(output, record);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
