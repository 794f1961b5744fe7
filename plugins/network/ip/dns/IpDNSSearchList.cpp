#include "ip/dns/IpDNSSearchList.h"

#include "common/CommandSupport.h"
#include "ip/IpOptions.h"
#include "ip/dns/DnsRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpDNSSearchList::IpDNSSearchList() {
    SetDescription(
        "List the search domains currently configured on the Tovrin host in the order in which they will be used when "
        "searching.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

ORVIX_COMMAND_NEW(IpDNSSearchList)

boost::shared_ptr<CallSpec::InputSpec> IpDNSSearchList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareNetstackParameter(declared);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpDNSSearchList::GetOutputSpecInternal() {
    return OutputSpecOf(SearchListTemplate());
}

void IpDNSSearchList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    RunDnsListing(*input, output, SearchListRecord);
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
