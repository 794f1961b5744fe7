#include "nic/SriovNicList.h"

#include <memory>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

SriovNicList::SriovNicList() {
    SetDescription("This command will list the SRIOV Enabled NICs (PFs) currently installed and loaded on the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:SriovNic",
                              "Name,PCI Device,Driver,Link,Speed,Duplex,MAC Address,MTU,Description");
}

ORVIX_COMMAND_NEW(SriovNicList)

boost::shared_ptr<CallSpec::InputSpec> SriovNicList::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> SriovNicList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> SriovNicList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("SriovNic");
}

void SriovNicList::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(
        output,
        [&] {
            boost::shared_ptr<MetaObj::MetaList> records =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            const std::vector<std::unique_ptr<HostCtl::Network::Pnic>> pnics = networkInfo.GetSriovNics();
            records->Reserve(pnics.size());
            for (const auto& pnic : pnics) {
                if (!pnic) continue;
                boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                FillInventoryRow(*record, *pnic, InventoryColumns::SriovNic);
                records->Append(std::move(record));
            }
            Finish(output, records);
        },
        "Unable to list NICs.  Error was ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
