#include "ip/ipsec/IpIpsecSPList.h"

#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"
#include "ip/ipsec/IpsecRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

// The SA name the host gives a policy whose unique SA was removed.
const char* const kUnknownSa = "UNKNOWN";

std::string NetworkText(const HostCtl::Network::Ipv6Address& address, int prefixLength) {
    return address.GetStringAddress() + "/" + std::to_string(prefixLength);
}

}  // namespace

IpIpsecSPList::IpIpsecSPList() {
    SetDescription("List configured Security Policys");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:SecurityPolicy",
                              "Name,Source Address,Source Port,Destination Address,Destination Port,Protocol,Flow,"
                              "Action,Mode,SA Name");
}

ORVIX_COMMAND_NEW(IpIpsecSPList)

boost::shared_ptr<CallSpec::InputSpec> IpIpsecSPList::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> IpIpsecSPList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpIpsecSPList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("SecurityPolicy");
}

void IpIpsecSPList::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    using PldCtl::Network::IpSecConfigImpl;
    ReportingHostErrors(output, [&] {
        IpSecConfigImpl config;
        std::vector<HostCtl::Network::IpSecSpdParam> sps;
        config.GetSPDConfigList(sps);
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        bool orphaned = false;
        for (const HostCtl::Network::IpSecSpdParam& sp : sps) {
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            record->SetField("Name", sp.name);
            record->SetField("Source Address", NetworkText(sp.sourceAddress, sp.sourcePrefixLength));
            record->SetField("Source Port", sp.sourcePort);
            record->SetField("Destination Address", NetworkText(sp.destinationAddress, sp.destinationPrefixLength));
            record->SetField("Destination Port", sp.destinationPort);
            record->SetField("Protocol", DisplayWord(IpSecConfigImpl::SP_UL_PROTO_TYPE, sp.upperLayerProtocol));
            record->SetField("Flow", DisplayWord(IpSecConfigImpl::SP_DIRECTION, sp.direction));
            record->SetField("Action", DisplayWord(IpSecConfigImpl::SP_ACTION, sp.action));
            record->SetField("Mode", DisplayWord(IpSecConfigImpl::SA_MODE, sp.mode));
            if (sp.saName == kUnknownSa) {
                orphaned = true;
                record->SetField("SA Name", std::string(kUnknownSa) + "*");
            } else {
                record->SetField("SA Name", sp.saName);
            }
            records->Append(std::move(record));
        }
        // One note however many policies lost their SA; the list still
        // comes with it.
        if (orphaned) {
            output->SetError(
                "*Some SPs with unique but deleted SAs were found. Please remove these SPs as they cannot be used "
                "anymore.");
        }
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
