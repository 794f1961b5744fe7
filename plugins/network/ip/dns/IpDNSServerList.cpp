#include "ip/dns/IpDNSServerList.h"

#include "common/CommandSupport.h"
#include "ip/IpOptions.h"
#include "ip/dns/DnsRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpDNSServerList::IpDNSServerList() {
    SetDescription(
        "Print a list of the DNS server currently configured on the system in the order in which they will be used.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

ORVIX_COMMAND_NEW(IpDNSServerList)

boost::shared_ptr<CallSpec::InputSpec> IpDNSServerList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareNetstackParameter(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpDNSServerList::GetOutputSpecInternal() {
    return OutputSpecOf(NameServerListTemplate());
}

void IpDNSServerList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    RunDnsListing(*input, output, NameServerListRecord);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
