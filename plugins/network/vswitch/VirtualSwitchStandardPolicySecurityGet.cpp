#include "vswitch/VirtualSwitchStandardPolicySecurityGet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"
#include "vswitch/VswitchRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardPolicySecurityGet::VirtualSwitchStandardPolicySecurityGet() {
    SetDescription("Get the Security Policy governing the given virtual switch.");
    DescribePolicyFetcher(*this, PolicyKind::Security, "VirtualSwitchSecurityPolicy", false);
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardPolicySecurityGet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardPolicySecurityGet::GetInputSpecInternal() {
    return VswitchNameInput("The name of the virtual switch to use when fetching the network security policy.");
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardPolicySecurityGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchStandardPolicySecurityGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("VirtualSwitchSecurityPolicy");
}

void VirtualSwitchStandardPolicySecurityGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                             boost::shared_ptr<CallSpec::Output> output) {
    OnSwitch(SwitchLookup::Legacy, input, output, [&](HostCtl::Network::VirtualSwitch& vswitch) {
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        FillPolicyFields(*record, vswitch.GetSecurityPolicy());
        Finish(output, record);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
