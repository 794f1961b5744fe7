#include "ip/IpGet.h"

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpGet::IpGet() {
    SetDescription("Get global IP settings");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

ORVIX_COMMAND_NEW(IpGet)

boost::shared_ptr<CallSpec::InputSpec> IpGet::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> IpGet::GetOutputSpecInternal() {
    return OutputSpecOf(GetOutputStructure());
}

boost::shared_ptr<MetaObj::MetaStruct> IpGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("IPInfo");
}

void IpGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(output, [&] {
        boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
        record->SetField("IPv6 Enabled", networkInfo.IsPldIpv6Enabled());
        Finish(output, record);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
