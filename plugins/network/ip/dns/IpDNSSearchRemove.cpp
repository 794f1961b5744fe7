#include "ip/dns/IpDNSSearchRemove.h"

#include "common/CommandSupport.h"
#include "ip/IpOptions.h"
#include "ip/dns/DnsOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpDNSSearchRemove::IpDNSSearchRemove() {
    SetDescription(
        "Remove a search domain from the list of domains to be searched when trying to resolve an host name on the "
        "Tovrin host.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpDNSSearchRemove)

boost::shared_ptr<CallSpec::InputSpec> IpDNSSearchRemove::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "domain", CallSpec::PARAM_STRING, "d",
                     "The string name of a domain to remove from the list of search domains.", Required::Yes);
    DeclareNetstackParameter(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpDNSSearchRemove::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpDNSSearchRemove::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                        boost::shared_ptr<CallSpec::Output> output) {
    const std::string domain = input->GetString("domain");
    RunDnsChange(*input, output, [&](PldCtl::Network::DnsConfigImpl& config) { config.RemoveSearchDomain(domain); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
