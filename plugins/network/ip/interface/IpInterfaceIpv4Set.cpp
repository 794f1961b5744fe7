#include "ip/interface/IpInterfaceIpv4Set.h"

#include <string>

#include "common/CommandSupport.h"
#include "hostctl/Values.h"
#include "ip/interface/InterfaceRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

using HostCtl::Network::IpConfig;
using HostCtl::Network::Ipv4Address;

IpInterfaceIpv4Set::IpInterfaceIpv4Set() {
    SetDescription("Configure IPv4 setting for a given Pallad network interface.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceIpv4Set)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceIpv4Set::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to set IPv4 settings for. This name must be an "
                     "interface listed in the interface list command.",
                     Required::Yes);
    DeclareParameter(
        declared, "type", CallSpec::PARAM_STRING, "t", "IPv4 Address type : %FULLENUM%", Required::Yes,
        StringEnum(
            {{"static", "Set Static IPv4 information for this interface. Requires --ipv4 and --netmask options."},
             {"dhcp", "Use DHCP to aquire IPv4 setting for this interface."},
             {"none", "Remove IPv4 settings form this interface."}}));
    DeclareParameter(declared, "ipv4", CallSpec::PARAM_STRING, "I", "The static IPv4 address for this interface.",
                     Required::No);
    DeclareParameter(declared, "netmask", CallSpec::PARAM_STRING, "N", "The static IPv4 netmask for this interface.",
                     Required::No);
    DeclareParameter(declared, "peer-dns", CallSpec::PARAM_BOOL, "P",
                     "A boolean value to indicate if the system should use the DNS settings published via DHCP for "
                     "this interface.",
                     Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceIpv4Set::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpInterfaceIpv4Set::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                         boost::shared_ptr<CallSpec::Output> output) {
    const std::string type = input->GetString("type");
    ChangeNamedInterface(
        input, output, "Error changing IPv4 configuration for the interface", [&](HostCtl::Network::PldNic& nic) {
            const std::string ipv4 = input->GetString("ipv4");
            const std::string netmask = input->GetString("netmask");
            if (type == "static") {
                // Every check runs, so that one run names every fault of the
                // command line. The netmask need only be an address: its bits
                // are not required to be contiguous.
                bool valid = true;
                if (ipv4.empty() || netmask.empty()) {
                    output->SetError("The --type=static requires the --ipv4 and --netmask options.");
                    valid = false;
                }
                if (!Ipv4Address::IsValidAddress(ipv4)) {
                    output->SetError("Invalid --ipv4 option provided. This address is not a valid IPv4 address");
                    valid = false;
                }
                if (!Ipv4Address::IsValidAddress(netmask)) {
                    output->SetError("Invalid --netmask option provided. This address is not a valid IPv4 address");
                    valid = false;
                }
                if (!valid) return false;
            }
            RewriteIpConfig(nic, [&](IpConfig& config) {
                if (type == "static") {
                    config.SetIpv4Address(Ipv4Address(ipv4));
                    config.SetIpv4Netmask(Ipv4Address(netmask));
                } else if (type == "dhcp") {
                    config.SetUseDhcp(true);
                    if (input->IsSet("peer-dns")) config.SetDhcpDns(input->GetBool("peer-dns"));
                } else if (type == "none") {
                    config.SetIpv4UseNone();
                }
            });
            return true;
        });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
