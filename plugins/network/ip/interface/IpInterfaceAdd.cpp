#include "ip/interface/IpInterfaceAdd.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

#include "common/CommandSupport.h"
#include "hostctl/Lib.h"
#include "hostctl/Values.h"
#include "hostctl/network/ip/IpConfig.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "hostctl/util/Exec.h"
#include "ip/interface/InterfaceOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceAdd::IpInterfaceAdd() {
    SetDescription("Add a new Pallad network interface.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceAdd)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareNetstackParameter(declared);
    DeclareConnectionPointParameters(declared,
                                     "The name of the vswitch port group to add this Pallad network interface to.");
    DeclareParameter(declared, "mtu", CallSpec::PARAM_INT, "m",
                     "Set the MTU setting for a given Pallad network interface on creation", Required::No,
                     IntRange(HostCtl::Network::PldNic::MIN_MTU, HostCtl::Network::PldNic::MAX_MTU));
    DeclareParameter(declared, "mac-address", CallSpec::PARAM_STRING, "M",
                     "Set the MAC address for the newly created Pallad network interface.", Required::No);
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to create. This name must be in the form pldX, where X "
                     "is a number 0-255",
                     Required::No, InterfaceNameConstraint());
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

namespace {

// The address the user gave, unset when none was given; nothing after
// reporting a text that is no MAC address.
std::optional<HostCtl::Network::MacAddress> MacAddressOption(const CallSpec::Input& input, CallSpec::Output& output) {
    if (!input.IsSet("mac-address")) return HostCtl::Network::MacAddress();
    const std::string text = input.GetString("mac-address");
    if (!HostCtl::Network::MacAddress::IsValid(text)) {
        output.SetError("Invalid unicast MAC address specified.");
        return std::nullopt;
    }
    return HostCtl::Network::MacAddress(text);
}

// Tags an interface just made on a dedicated netstack. When that fails the
// interface is removed again, so that a failure reported for the command
// leaves no interface behind; the failure itself is passed on.
void TagOrUndo(PldCtl::Network::PalladNicInfoImpl& interfaces, HostCtl::Network::PldNic& nic,
               HostCtl::Network::PldNicTagType tag) {
    try {
        AutoTagInterfaceOnDedicatedStack(interfaces, nic, tag);
    } catch (const HostCtl::Lib::HostCtlException&) {
        try {
            nic.Remove();
        } catch (const HostCtl::Lib::HostCtlException&) {
        }
        throw;
    }
}

}  // namespace

void IpInterfaceAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    if (!CheckConnectionPointChoice(*input, *output)) return;
    const std::optional<HostCtl::Network::MacAddress> mac = MacAddressOption(*input, *output);
    if (!mac) return;
    const std::int64_t mtu = input->IsSet("mtu") ? input->GetInt("mtu") : 0;
    const std::string name = input->IsSet("interface-name") ? input->GetString("interface-name") : std::string();
    ReportingHostErrors(
        output,
        [&] {
            std::unique_ptr<HostCtl::Network::ConnectionPoint> point = MakeConnectionPoint(*input, *output);
            if (!point) return;
            const std::string netstack = SelectedNetstack(*input);
            PldCtl::Network::PalladNicInfoImpl interfaces;
            std::unique_ptr<HostCtl::Network::PldNic> nic =
                interfaces.AddPalladNic(point.get(), netstack, HostCtl::Network::IpConfig(), *mac, 0, mtu, name);
            const std::optional<DedicatedNetstack> dedicated = DedicatedNetstackByKey(netstack);
            if (nic && dedicated) {
                TagOrUndo(interfaces, *nic, dedicated->tag);
                // The interface stays even when the daemon does not come
                // back: the failure is the daemon's, reported beside success.
                if (dedicated->restartsRfxDaemon &&
                    PldCtl::Util::PldCtl_Exec("/etc/init.d/rfxd restart", false, true, false) != 0) {
                    output->SetError(
                        "Unable to start the RFX daemon. Take a look at /var/log/rfxd.log for more information.");
                }
            }
            FinishTrue(output);
        },
        "Unable to add Pallad network interface. Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
