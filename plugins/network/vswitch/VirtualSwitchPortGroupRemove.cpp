#include "vswitch/VirtualSwitchPortGroupRemove.h"

#include "common/CommandSupport.h"
#include "vswitch/VswitchLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupRemove::VirtualSwitchPortGroupRemove() {
    SetDescription("Remove a port group from the given virtual switch");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupRemove)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "portgroup-name", CallSpec::PARAM_STRING, "p", " ", Required::Yes);
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v", " ", Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchPortGroupRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                   boost::shared_ptr<CallSpec::Output> output) {
    const std::string portGroup = input->GetString("portgroup-name");
    // Whether the port group is on this switch and free is the library's
    // judgment; its message reaches the user as it stands.
    ChangeStandardSwitch(output, input->GetString("vswitch-name"),
                         [&](HostCtl::Network::VirtualSwitch& vswitch) { vswitch.RemovePortGroup(portGroup); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
