#include "vswitch/VirtualSwitchStandardUplinkRemove.h"

#include "common/CommandSupport.h"
#include "vswitch/VswitchLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardUplinkRemove::VirtualSwitchStandardUplinkRemove() {
    SetDescription(
        "Remove an uplink from the given virtual switch. Note if this virtual switch has a NIC teaming policy assigned "
        "to it then the policy must also be modified to disable use of this uplink on this virtual switch");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardUplinkRemove)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardUplinkRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v",
                     "The name of the virtual switch to remove an uplink from.", Required::Yes);
    DeclareParameter(declared, "uplink-name", CallSpec::PARAM_STRING, "u",
                     "The name of the uplink to remove from the virtual switch.", Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardUplinkRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchStandardUplinkRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                        boost::shared_ptr<CallSpec::Output> output) {
    const std::string uplink = input->GetString("uplink-name");
    ChangeStandardSwitch(output, input->GetString("vswitch-name"),
                         [&](HostCtl::Network::VirtualSwitch& vswitch) { vswitch.RemoveUplink(uplink); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
