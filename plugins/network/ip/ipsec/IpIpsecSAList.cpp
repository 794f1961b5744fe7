#include "ip/ipsec/IpIpsecSAList.h"

#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"
#include "ip/ipsec/IpsecRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpIpsecSAList::IpIpsecSAList() {
    SetDescription("List configured Security Associations");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:SecurityAssociation",
                              "Name,Source Address,Destination Address,State,SPI,Mode,Encryption Algorithm,Integrity "
                              "Algorithm,Lifetime");
}

ORVIX_COMMAND_NEW(IpIpsecSAList)

boost::shared_ptr<CallSpec::InputSpec> IpIpsecSAList::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> IpIpsecSAList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpIpsecSAList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("SecurityAssociation");
}

void IpIpsecSAList::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    using PldCtl::Network::IpSecConfigImpl;
    ReportingHostErrors(output, [&] {
        IpSecConfigImpl config;
        std::vector<HostCtl::Network::IpSecSadParam> sas;
        config.GetSADConfigList(sas);
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        for (const HostCtl::Network::IpSecSadParam& sa : sas) {
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            record->SetField("Name", sa.name);
            record->SetField("Source Address", sa.source.GetStringAddress());
            record->SetField("Destination Address", sa.destination.GetStringAddress());
            record->SetField("State", DisplayWord(IpSecConfigImpl::SA_STATE, sa.state));
            record->SetField("SPI", SpiText(sa.spi));
            record->SetField("Mode", DisplayWord(IpSecConfigImpl::SA_MODE, sa.mode));
            record->SetField("Encryption Algorithm",
                             DisplayWord(IpSecConfigImpl::SA_ENCPT_ALG, sa.encryptionAlgorithm));
            record->SetField("Integrity Algorithm", DisplayWord(IpSecConfigImpl::SA_AUTH_ALG, sa.integrityAlgorithm));
            record->SetField("Lifetime", ConvertToHrsMinsAndSecs(sa.lifetime));
            records->Append(std::move(record));
        }
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
