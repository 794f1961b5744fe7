#include "ip/interface/IpInterfaceTagRemove.h"

#include <memory>
#include <optional>
#include <string>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "ip/interface/InterfaceLookup.h"
#include "ip/interface/InterfaceOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceTagRemove::IpInterfaceTagRemove() {
    SetDescription("Removes a tag on a given Pallad network interface.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceTagRemove)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceTagRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface from which tags should be removed. This name must be "
                     "an interface listed  in the interface list command.",
                     Required::Yes);
    DeclareParameter(declared, "tagname", CallSpec::PARAM_STRING, "t", "Tag name to assign to the interface",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceTagRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpInterfaceTagRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                           boost::shared_ptr<CallSpec::Output> output) {
    const std::string name = input->GetString("interface-name");
    const std::string tagName = input->GetString("tagname");
    PldCtl::Network::PalladNicInfoImpl interfaces;
    ReportingHostErrors(
        output,
        [&] {
            const std::optional<HostCtl::Network::PldNicTagType> tag = TagOption(tagName, *output);
            if (!tag) return;
            std::unique_ptr<HostCtl::Network::PldNic> nic =
                FindInterface(interfaces, name, MissingInterface::Pldnic, *output);
            if (!nic) return;
            // A dedicated tag may leave an interface on its own netstack too.
            nic->RemoveTag(*tag);
            FinishTrue(output);
        },
        "Error removing tag " + tagName + " from interface " + name + ". Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
