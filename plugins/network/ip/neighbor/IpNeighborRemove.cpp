#include "ip/neighbor/IpNeighborRemove.h"

#include <memory>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/ip/RoutingInfoImpl.h"
#include "ip/IpOptions.h"
#include "ip/interface/InterfaceLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpNeighborRemove::IpNeighborRemove() {
    SetDescription("Remove ARP table entries");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpNeighborRemove)

boost::shared_ptr<CallSpec::InputSpec> IpNeighborRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = CallSpec::InputSpec::New();
    DeclareParameter(inputSpec, "version", CallSpec::PARAM_STRING, "v", "IP version : %ENUM%", Required::Yes,
                     StringEnum({{"4", ""}, {"6", ""}}));
    DeclareNetstackParameter(inputSpec);
    DeclareParameter(inputSpec, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to remove the neighbor entry from. If not specified, "
                     "neighbor will be removed from all interfaces",
                     Required::No);
    DeclareParameter(inputSpec, "neighbor-addr", CallSpec::PARAM_STRING, "a", "The IPv4/IPv6 address of the neighbor.",
                     Required::Yes);
    return inputSpec;
}

boost::shared_ptr<CallSpec::OutputSpec> IpNeighborRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpNeighborRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                       boost::shared_ptr<CallSpec::Output> output) {
    const std::string interfaceName = input->GetString("interface-name");
    const std::string version = input->GetString("version");
    const std::string address = input->GetString("neighbor-addr");
    PldCtl::Network::RoutingInfoImpl routing;
    ReportingHostErrors(output, [&] {
        // An interface belongs to one netstack, which is the one its
        // neighbors live in, whatever `netstack` says.
        if (!interfaceName.empty()) {
            PldCtl::Network::PalladNicInfoImpl interfaces;
            std::unique_ptr<HostCtl::Network::PldNic> pldnic =
                FindInterface(interfaces, interfaceName, MissingInterface::PalladInterface, *output);
            if (!pldnic) return;
            routing.SetNetstackInstanceKey(pldnic->GetNetstackInstance());
        } else {
            routing.SetNetstackInstanceKey(SelectedNetstack(*input));
        }
        if (version == "4") {
            HostCtl::Network::Ipv4Neighbor neighbor;
            neighbor.address = HostCtl::Network::Ipv4Address(address);
            neighbor.interfaceName = interfaceName;
            routing.RemoveIpv4Neighbor(neighbor);
        } else if (version == "6") {
            // With IPv6 off there is no IPv6 neighbor to remove, which is not
            // a failure.
            PldCtl::Network::NetworkInfoImpl networkInfo;
            if (networkInfo.IsPldIpv6Enabled()) {
                HostCtl::Network::Ipv6Neighbor neighbor;
                neighbor.address = HostCtl::Network::Ipv6Address(address);
                neighbor.interfaceName = interfaceName;
                routing.RemoveIpv6Neighbor(neighbor);
            }
        }
        FinishTrue(output);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
