#include "ip/netstack/IpNetstackInstanceGet.h"

#include <memory>
#include <string>
#include <utility>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "ip/netstack/NetstackLookup.h"
#include "ip/netstack/NetstackOptions.h"
#include "ip/netstack/NetstackRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpNetstackInstanceGet::IpNetstackInstanceGet() {
    SetDescription("Get runtime/configuration settings for a given Netstack Instance.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter(std::string("header:") + kNetstackRecord, "%Key%");
    SetDefaultOutputParameter(std::string("fields:") + kNetstackRecord,
                              "Key,Name,Enabled,Max Connections,Current Max Connections,Congestion Control "
                              "Algorithm,IPv6 Enabled,Current IPv6 Enabled,State");
}

ORVIX_COMMAND_NEW(IpNetstackInstanceGet)

boost::shared_ptr<CallSpec::InputSpec> IpNetstackInstanceGet::GetInputSpecInternal() {
    return NetstackKeyInput("The network stack instance");
}

boost::shared_ptr<CallSpec::OutputSpec> IpNetstackInstanceGet::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpNetstackInstanceGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New(kNetstackRecord);
}

void IpNetstackInstanceGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                            boost::shared_ptr<CallSpec::Output> output) {
    const std::string key = input->GetString("netstack");
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(
        output,
        [&] {
            std::unique_ptr<HostCtl::Network::NetstackInstance> instance = FindNetstack(networkInfo, key, *output);
            if (!instance) return;
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            FillNetstackDetail(*record, *instance);
            boost::shared_ptr<MetaObj::MetaList> records =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            records->Append(std::move(record));
            Finish(output, records);
        },
        "Error getting Netstack instance configuration. Unable to read netstack instance " + key + ". Error was : ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
