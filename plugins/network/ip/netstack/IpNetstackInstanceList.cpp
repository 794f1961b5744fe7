#include "ip/netstack/IpNetstackInstanceList.h"

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "ip/netstack/NetstackRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpNetstackInstanceList::IpNetstackInstanceList() {
    SetDescription("This command will list the Pallad Netstack instances currently known to the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter(std::string("header:") + kNetstackRecord, "%Key%");
    SetDefaultOutputParameter(std::string("fields:") + kNetstackRecord, "Key,Name,State");
}

ORVIX_COMMAND_NEW(IpNetstackInstanceList)

boost::shared_ptr<CallSpec::InputSpec> IpNetstackInstanceList::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> IpNetstackInstanceList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpNetstackInstanceList::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kNetstackRecord);
}

void IpNetstackInstanceList::ExecuteInternal(boost::shared_ptr<CallSpec::Input>,
                                             boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(output, [&] {
        const std::vector<std::unique_ptr<HostCtl::Network::NetstackInstance>> instances =
            networkInfo.ListNetstackInstances();
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        for (const auto& instance : instances) {
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            FillNetstackSummary(*record, *instance);
            records->Append(std::move(record));
        }
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
