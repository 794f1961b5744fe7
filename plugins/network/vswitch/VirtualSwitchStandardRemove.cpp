#include "vswitch/VirtualSwitchStandardRemove.h"

#include "common/CommandSupport.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardRemove::VirtualSwitchStandardRemove() {
    SetDescription("Remove a virtual switch from the Tovrin networking system.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardRemove)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v", "The name of the virtual switch to remove.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchStandardRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                  boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    ReportingHostErrors(output, [&] {
        const std::string name = input->GetString("vswitch-name");
        if (!PldCtl::Network::PortsetImpl::IsValidVirtualSwitch(name)) {
            output->SetError(HostCtl::Network::UnknownVirtualSwitchMessage(name));
            return;
        }
        switchInfo.RemoveVirtualSwitch(name);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
