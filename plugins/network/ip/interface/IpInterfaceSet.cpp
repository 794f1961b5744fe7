#include "ip/interface/IpInterfaceSet.h"

#include <cstdint>
#include <memory>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "ip/interface/InterfaceLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceSet::IpInterfaceSet() {
    SetDescription("This command sets the enabled status and MTU size of a given IP interface ");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceSet)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the interface to apply the configurations.", Required::Yes);
    DeclareParameter(declared, "enabled", CallSpec::PARAM_BOOL, "e",
                     "Set to true to enable the interface, set to false to disable it.", Required::No);
    DeclareParameter(declared, "mtu", CallSpec::PARAM_INT, "m", "The MTU size of the IP interface. ", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpInterfaceSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::PalladNicInfoImpl interfaces;
    ReportingHostErrors(output, [&] {
        std::unique_ptr<HostCtl::Network::PldNic> nic =
            FindListedInterface(interfaces, input->GetString("interface-name"), *output);
        if (!nic) return;
        // A negative MTU is refused before the enabled state is touched, so
        // a refused run changes nothing. Any other value, 0 included, goes to
        // the library whole, which knows the range an MTU may take.
        const bool setMtu = input->IsSet("mtu");
        const std::int64_t mtu = setMtu ? input->GetInt("mtu") : 0;
        if (mtu < 0) {
            output->SetError("MTU size should be a positive value");
            return;
        }
        if (input->IsSet("enabled")) {
            if (input->GetBool("enabled")) {
                nic->Enable();
            } else {
                nic->Disable();
            }
        }
        if (setMtu) nic->SetMtu(mtu);
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
