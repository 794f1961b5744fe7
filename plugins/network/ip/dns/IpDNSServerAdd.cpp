#include "ip/dns/IpDNSServerAdd.h"

#include "common/CommandSupport.h"
#include "ip/IpOptions.h"
#include "ip/dns/DnsOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpDNSServerAdd::IpDNSServerAdd() {
    SetDescription("Add a new DNS server to the end of the list of DNS servers to use for this Tovrin host.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpDNSServerAdd)

boost::shared_ptr<CallSpec::InputSpec> IpDNSServerAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "server", CallSpec::PARAM_STRING, "s",
                     "The IP address (v4 or v6) of the DNS server to add to the DNS server list.", Required::Yes);
    DeclareNetstackParameter(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpDNSServerAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpDNSServerAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    const std::string server = input->GetString("server");
    RunDnsChange(*input, output,
                 [&](PldCtl::Network::DnsConfigImpl& config) { config.AddNameServer(*DnsServerAddress(server)); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
