#include "vswitch/VirtualSwitchStandardSet.h"

#include "vswitch/VswitchLookup.h"
#include "vswitch/VswitchOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchStandardSet::VirtualSwitchStandardSet() {
    SetDescription("This command sets the MTU size and CDP status of a given virtual switch.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(VirtualSwitchStandardSet)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchStandardSet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "vswitch-name", CallSpec::PARAM_STRING, "v",
                     "The name of virtual switch to apply the configurations.", Required::Yes);
    DeclareParameter(declared, "mtu", CallSpec::PARAM_INT, "m", "The MTU size of the given virtual switch. ",
                     Required::No);
    DeclareParameter(declared, "cdp-status", CallSpec::PARAM_STRING, "c",
                     "The CDP status of the given virtual switch. It can be 'down', 'listen', 'advertise' or 'both'",
                     Required::No, CdpStatusConstraint());
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchStandardSet::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void VirtualSwitchStandardSet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                               boost::shared_ptr<CallSpec::Output> output) {
    OnSwitch(SwitchLookup::Settable, input, output, [&](HostCtl::Network::VirtualSwitch& vswitch) {
        if (input->IsSet("mtu")) {
            // The value goes to the switch as it was typed: only the sign is
            // ours to refuse, the range is the library's, and narrowing it
            // here would turn a huge MTU into an accepted small one.
            const long long mtu = input->GetInt("mtu");
            if (mtu < 0) {
                output->SetError("MTU size should be a positive value");
                return;
            }
            vswitch.SetMTU(mtu);
        }
        if (input->IsSet("cdp-status")) vswitch.SetCDPStatus(CdpStatusIndex(input->GetString("cdp-status")));
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
