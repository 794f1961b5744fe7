#include "vswitch/VirtualSwitchStandardUplinkAdd.h"

#include "common/CommandSupport.h"
#include "vswitch/VswitchLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardUplinkAdd::VirtualSwitchStandardUplinkAdd() {
    SetDescription(
        "Add an uplink to the given virtual switch. Note if this virtual switch has a NIC teaming policy assigned to "
        "it then the policy must also be modified to enable use of this uplink on this virtual switch");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardUplinkAdd)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardUplinkAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v",
                     "The name of the virtual switch to add an uplink to.", Required::Yes);
    DeclareParameter(declared, "uplink-name", CallSpec::PARAM_STRING, "u",
                     "The name of the uplink to add to the virtual switch.", Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardUplinkAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchStandardUplinkAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                     boost::shared_ptr<CallSpec::Output> output) {
    const std::string uplink = input->GetString("uplink-name");
    // The teaming policy is left alone: the new uplink stays unused until the
    // failover policy names it, as the description tells the user.
    ChangeStandardSwitch(output, input->GetString("vswitch-name"),
                         [&](HostCtl::Network::VirtualSwitch& vswitch) { vswitch.AddUplink(uplink); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
