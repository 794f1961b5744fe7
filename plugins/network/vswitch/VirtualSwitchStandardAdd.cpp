#include "vswitch/VirtualSwitchStandardAdd.h"

#include "common/CommandSupport.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "hostctl/network/vswitch/VswitchTables.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::Portset;

VirtualSwitchStandardAdd::VirtualSwitchStandardAdd() {
    SetDescription("Add a new virtual switch to the Tovrin networking system.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardAdd)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v", "The name of the virtual switch to create.",
                     Required::Yes);
    // Only the per-switch bound is checked here; the host-wide limit depends
    // on the other switches and is the library's to enforce. The numbers in
    // the help are the library's own, so the text cannot drift from them.
    DeclareParameter(declared, "ports", CallSpec::PARAM_INT, "P",
                     "The number of ports to to give this newly created virtual switch. Maximum ports per virtual "
                     "switch is " +
                         std::to_string(Portset::MAX_NUM_PORTS) + ". If no value is given the default value(" +
                         std::to_string(Portset::DEF_NUM_PORTS) +
                         ") is used. The number of ports is limited by the number of already allocated ports on the "
                         "host. The system wide port count cannot be greater than " +
                         std::to_string(HostCtl::Network::kMaxHostPorts) + ".",
                     Required::No, IntRange(1, Portset::MAX_NUM_PORTS));
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchStandardAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                               boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    ReportingHostErrors(output, [&] {
        const std::string name = input->GetString("vswitch-name");
        const long long ports = input->IsSet("ports") ? input->GetInt("ports") : Portset::DEF_NUM_PORTS;
        const HostCtl::Network::NicCapabilities capabilities = HostCtl::Network::NicCapabilities::GetDefaultPolicy();
        const HostCtl::Network::ShapingPolicy shaping = HostCtl::Network::ShapingPolicy::GetDefaultPolicy();
        const HostCtl::Network::PortSecurityPolicy security = HostCtl::Network::PortSecurityPolicy::GetDefaultPolicy();
        const HostCtl::Network::NicTeamingPolicy teaming = HostCtl::Network::NicTeamingPolicy::GetDefaultPolicy();
        // The new switch object is of no further use; it is released at once.
        switchInfo.AddVirtualSwitchWithPolicy(teaming, security, shaping, capabilities, name, ports);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
