#include "ip/interface/IpInterfaceIpv6AddressRemove.h"

#include "common/CommandSupport.h"
#include "ip/interface/InterfaceRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceIpv6AddressRemove::IpInterfaceIpv6AddressRemove() {
    SetDescription("Remove an IPv6 address from a given Pallad network interface.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceIpv6AddressRemove)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceIpv6AddressRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to remove an IPv6 address from. This name must be an "
                     "interface listed in the interface list command.",
                     Required::Yes);
    DeclareParameter(declared, "ipv6", CallSpec::PARAM_STRING, "I",
                     "The IPv6 address to remove from the given Pallad network interface. This must be in "
                     "X:X:X::/X format",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceIpv6AddressRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpInterfaceIpv6AddressRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                   boost::shared_ptr<CallSpec::Output> output) {
    ChangeIpv6Address(input, output, "Error removing IPv6 address from the interface",
                      [](HostCtl::Network::IpConfig& config, const HostCtl::Network::Ipv6Network& address) {
                          config.RemoveIpv6Network(address);
                      });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
