#include "vswitch/VirtualSwitchPortGroupAdd.h"

#include "common/CommandSupport.h"
#include "vswitch/VswitchLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupAdd::VirtualSwitchPortGroupAdd() {
    SetDescription("Allows the addition of a standard port group to a virtual switch.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupAdd)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "portgroup-name", CallSpec::PARAM_STRING, "p", "The name of the port group to add",
                     Required::Yes);
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v",
                     "The virtual switch to add the port group to.", Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchPortGroupAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                boost::shared_ptr<CallSpec::Output> output) {
    const std::string portGroup = input->GetString("portgroup-name");
    // The name's fitness and uniqueness on the host are the library's rules;
    // the new port group object it returns is released at once.
    ChangeStandardSwitch(output, input->GetString("vswitch-name"),
                         [&](HostCtl::Network::VirtualSwitch& vswitch) { vswitch.AddPortGroup(portGroup); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
