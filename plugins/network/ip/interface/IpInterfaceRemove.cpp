#include "ip/interface/IpInterfaceRemove.h"

#include <memory>
#include <string>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "ip/interface/InterfaceOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceRemove::IpInterfaceRemove() {
    SetDescription(
        "Remove a Pallad network interface from the Tovrin host. A Pallad network interface can be uniquely specified "
        "by --interface-name or --portgroup-name or --dvs-name/--dvport-id. i.e. Providing its name or its connection "
        "point are two ways to uniquely specify a Pallad network interface.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceRemove)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareNetstackParameter(declared);
    DeclareConnectionPointParameters(
        declared, "The name of the vswitch port group to delete this Pallad network interface from.");
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to remove. This name must be in the form pldX, where X "
                     "is a number 0-255",
                     Required::No, InterfaceNameConstraint());
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

namespace {

// Removes the first interface of that name. A name the host does not have
// is reported with a false result beside it.
void RemoveByName(PldCtl::Network::PalladNicInfoImpl& interfaces, const std::string& name,
                  const boost::shared_ptr<CallSpec::Output>& output) {
    for (const auto& nic : interfaces.GetPalladNics()) {
        if (nic->GetName() == name) {
            nic->Remove();
            FinishTrue(output);
            return;
        }
    }
    output->SetError("Unable to find Pallad network interface with the name " + name);
    Finish(output, MetaObj::MetaBool::New(false));
}

// Removes the interface at the connection point the options name, on the
// netstack given (the default one when the option is absent or empty).
void RemoveByConnectionPoint(PldCtl::Network::PalladNicInfoImpl& interfaces, const CallSpec::Input& input,
                             const boost::shared_ptr<CallSpec::Output>& output) {
    if (!CheckConnectionPointChoice(input, *output)) return;
    std::unique_ptr<HostCtl::Network::ConnectionPoint> point = MakeConnectionPoint(input, *output);
    if (!point) return;
    interfaces.RemovePalladNic(point.get(), SelectedNetstack(input));
    FinishTrue(output);
}

}  // namespace

void IpInterfaceRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    const bool byName = input->IsSet("interface-name");
    const bool byPoint = input->IsSet("portgroup-name") || input->IsSet("dvs-name") || input->IsSet("dvport-id");
    if (byName && byPoint) {
        output->SetError(
            "Please correctly and uniquely specify a way to remove it. A Pallad network interface can be uniquely "
            "specified by --interface-name or --portgroup-name or --dvs-name/--dvport-id. i.e. Providing its name or "
            "its connection point are two ways to uniquely specify a Pallad network interface.");
        return;
    }
    PldCtl::Network::PalladNicInfoImpl interfaces;
    ReportingHostErrors(
        output,
        [&] {
            if (byName) {
                RemoveByName(interfaces, input->GetString("interface-name"), output);
            } else {
                RemoveByConnectionPoint(interfaces, *input, output);
            }
        },
        "Unable to remove Pallad network interface. Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
