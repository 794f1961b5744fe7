#include "ip/interface/IpInterfaceIpv6Set.h"

#include "common/CommandSupport.h"
#include "ip/interface/InterfaceRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::IpConfig;

IpInterfaceIpv6Set::IpInterfaceIpv6Set() {
    SetDescription("Configure IPv6 settings for a given Pallad network interface.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceIpv6Set)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceIpv6Set::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to set IPv6 settings for. This name must be an "
                     "interface listed in the interface list command.",
                     Required::Yes);
    DeclareParameter(declared, "enable-dhcpv6", CallSpec::PARAM_BOOL, "d",
                     "Setting this value to true will enable DHCPv6 on this interface and attempt to aquire an IPv6 "
                     "address from the network ",
                     Required::No);
    DeclareParameter(declared, "enable-router-adv", CallSpec::PARAM_BOOL, "r",
                     "Setting this value to true will enable IPv6 Router Advertised IPv6 addresses to be added to "
                     "this interface from any routers broadcasting on the local network.",
                     Required::No);
    DeclareParameter(declared, "peer-dns", CallSpec::PARAM_BOOL, "P",
                     "A boolean value to indicate if the system should use the DNS settings published via DHCPv6 for "
                     "this interface.",
                     Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceIpv6Set::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpInterfaceIpv6Set::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                         boost::shared_ptr<CallSpec::Output> output) {
    ChangeNamedInterface(input, output, "Error changing IPv6 configuration for the interface",
                         [&](HostCtl::Network::PldNic& nic) {
                             RewriteIpConfig(nic, [&](IpConfig& config) {
                                 if (input->IsSet("enable-dhcpv6"))
                                     config.SetUseIpv6Dhcp(input->GetBool("enable-dhcpv6"));
                                 if (input->IsSet("peer-dns")) config.SetDhcpDns(input->GetBool("peer-dns"));
                                 if (input->IsSet("enable-router-adv")) {
                                     config.SetUseIpv6RouterAdvertised(input->GetBool("enable-router-adv"));
                                 }
                             });
                             return true;
                         });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
