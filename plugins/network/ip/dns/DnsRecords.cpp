#include "ip/dns/DnsRecords.h"

#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/util/StringUtil.h"
#include "ip/IpOptions.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

const char kServersField[] = "DNS Servers";
const char kSearchDomainsField[] = "DNS Search Domains";

boost::shared_ptr<MetaObj::MetaStruct> ListRecord(const char* type, const char* field,
                                                  const std::vector<std::string>& values) {
    boost::shared_ptr<MetaObj::MetaStruct> record = MetaObj::MetaStruct::New(type);
    boost::shared_ptr<MetaObj::MetaList> list = MetaObj::MetaList::New(MetaObj::META_STRING);
    for (const std::string& value : values) list->Append(value);
    record->SetField(field, list);
    return record;
}

}  // namespace

boost::shared_ptr<MetaObj::MetaStruct> NameServerListTemplate() {
    return ListRecord("NameServerList", kServersField, {});
}

boost::shared_ptr<MetaObj::MetaStruct> SearchListTemplate() {
    return ListRecord("DNSSearchList", kSearchDomainsField, {});
}

boost::shared_ptr<MetaObj::MetaStruct> NameServerListRecord(PldCtl::Network::DnsConfigImpl& config) {
    return ListRecord("NameServerList", kServersField, config.GetNameServers());
}

boost::shared_ptr<MetaObj::MetaStruct> SearchListRecord(PldCtl::Network::DnsConfigImpl& config) {
    std::vector<std::string> domains;
    PldCtl::Util::StringTokenize(config.GetSearchDomainsString(), domains, " ");
    return ListRecord("DNSSearchList", kSearchDomainsField, domains);
}

void RunDnsListing(const CallSpec::Input& input, const boost::shared_ptr<CallSpec::Output>& output,
                   const std::function<boost::shared_ptr<MetaObj::MetaStruct>(PldCtl::Network::DnsConfigImpl&)>& show) {
    ReportingHostErrors(output, [&] {
        PldCtl::Network::DnsConfigImpl config(SelectedNetstack(input));
        Finish(output, show(config));
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
