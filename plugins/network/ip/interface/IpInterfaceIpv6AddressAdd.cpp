#include "ip/interface/IpInterfaceIpv6AddressAdd.h"

#include "common/CommandSupport.h"
#include "ip/interface/InterfaceRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceIpv6AddressAdd::IpInterfaceIpv6AddressAdd() {
    SetDescription("Add a static IPv6 address to a given Pallad network interface.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpInterfaceIpv6AddressAdd)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceIpv6AddressAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to add a static IPv6 address to. This name must be an "
                     "interface listed in the interface list command.",
                     Required::Yes);
    DeclareParameter(declared, "ipv6", CallSpec::PARAM_STRING, "I",
                     "The IPv6 address to add to the given Pallad network interface. This must be in X:X:X::/X "
                     "format",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceIpv6AddressAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpInterfaceIpv6AddressAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                                boost::shared_ptr<CallSpec::Output> output) {
    ChangeIpv6Address(input, output, "Error adding IPv6 address for the interface",
                      [](HostCtl::Network::IpConfig& config, const HostCtl::Network::Ipv6Network& address) {
                          config.AddIpv6Network(address);
                      });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
