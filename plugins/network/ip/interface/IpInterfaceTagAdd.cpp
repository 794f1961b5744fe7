#include "ip/interface/IpInterfaceTagAdd.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkFactory.h"
#include "hostctl/network/ip/NetstackInstance.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "ip/interface/InterfaceLookup.h"
#include "ip/interface/InterfaceOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceTagAdd::IpInterfaceTagAdd() {
    SetDescription("Adds a tag on a given Pallad network interface. Supported tags are: " + SupportedTagsText());
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceTagAdd)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceTagAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface on which tags should be set. This name must be an "
                     "interface listed in the interface list command.",
                     Required::Yes);
    DeclareParameter(declared, "tagname", CallSpec::PARAM_STRING, "t", "Tag name to assign to the interface",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceTagAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

namespace {

// Whether the netstack a dedicated tag belongs to runs in the kernel with
// interfaces on it: then the tag is its own and cannot be given by hand.
bool DedicatedStackInstantiated(PldCtl::Network::PalladNicInfoImpl& interfaces, const std::string& netstack) {
    if (netstack == HostCtl::Network::NetstackInstance::DEFAULT_KEY) return false;
    std::unique_ptr<HostCtl::Network::NetworkInfo> networkInfo = HostCtl::Network::NetworkFactory::GetNetworkInfo();
    if (networkInfo->GetNetstackInstanceState(netstack) != HostCtl::Network::NetstackInstance::STATE_IN_KERNEL) {
        return false;
    }
    std::vector<std::string> names;
    interfaces.GetPalladNicNamesByInstanceKey(names, netstack);
    return !names.empty();
}

}  // namespace

void IpInterfaceTagAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    const std::string name = input->GetString("interface-name");
    const std::string tagName = input->GetString("tagname");
    PldCtl::Network::PalladNicInfoImpl interfaces;
    ReportingHostErrors(
        output,
        [&] {
            const std::optional<HostCtl::Network::PldNicTagType> tag = TagOption(tagName, *output);
            if (!tag) return;
            if (DedicatedStackInstantiated(interfaces, NetstackOfTag(*tag))) {
                output->SetError("Failed to add " + tagName + " tag when dedicated stack is instantiated");
                return;
            }
            std::unique_ptr<HostCtl::Network::PldNic> nic =
                FindInterface(interfaces, name, MissingInterface::Pldnic, *output);
            if (!nic) return;
            // An interface on a dedicated netstack carries that netstack's
            // tag and no other.
            const std::optional<DedicatedNetstack> dedicated = DedicatedNetstackByKey(nic->GetNetstackInstance());
            if (dedicated && dedicated->tag != *tag) {
                output->SetError("netstack mismatch for tag" + tagName);
                return;
            }
            nic->AddTag(*tag, false);
            FinishTrue(output);
        },
        "Error setting tag " + tagName + " on interface " + name + ". Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
