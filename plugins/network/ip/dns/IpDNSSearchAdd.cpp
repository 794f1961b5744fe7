#include "ip/dns/IpDNSSearchAdd.h"

#include "common/CommandSupport.h"
#include "ip/IpOptions.h"
#include "ip/dns/DnsOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpDNSSearchAdd::IpDNSSearchAdd() {
    SetDescription(
        "Add a search domain to the list of domains to be searched when trying to resolve an host name on the Tovrin "
        "host.");
    SetMetaDataField("type", "operation");
}

ORVIX_COMMAND_NEW(IpDNSSearchAdd)

boost::shared_ptr<CallSpec::InputSpec> IpDNSSearchAdd::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "domain", CallSpec::PARAM_STRING, "d",
                     "The string name of a domain to add to the list of search domains.", Required::Yes);
    DeclareNetstackParameter(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpDNSSearchAdd::GetOutputSpecInternal() {
    return OperationOutputSpec();
}

void IpDNSSearchAdd::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    const std::string domain = input->GetString("domain");
    RunDnsChange(*input, output, [&](PldCtl::Network::DnsConfigImpl& config) { config.AddSearchDomain(domain); });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
