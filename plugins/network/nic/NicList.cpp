#include "nic/NicList.h"

#include <memory>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkFactory.h"
#include "nic/NicRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicList::NicList() {
    SetDescription("This command will list the Physical NICs currently installed and loaded on the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter(
        "fields:Nic", "Name,PCI Device,Driver,Admin Status,Link Status,Speed,Duplex,MAC Address,MTU,Description");
}

ORVIX_COMMAND_NEW(NicList)

boost::shared_ptr<CallSpec::InputSpec> NicList::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> NicList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> NicList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("Nic");
}

void NicList::ExecuteInternal(boost::shared_ptr<CallSpec::Input>, boost::shared_ptr<CallSpec::Output> output) {
    ReportingHostErrors(
        output,
        [&] {
            std::unique_ptr<HostCtl::Network::NetworkInfo> networkInfo =
                HostCtl::Network::NetworkFactory::GetNetworkInfo();
            boost::shared_ptr<MetaObj::MetaList> records =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            const std::vector<std::unique_ptr<HostCtl::Network::Pnic>> pnics = networkInfo->GetPnics();
            records->Reserve(pnics.size());
            for (const auto& pnic : pnics) {
                if (!pnic) continue;
                boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                FillInventoryRow(*record, *pnic, InventoryColumns::Nic);
                records->Append(std::move(record));
            }
            Finish(output, records);
        },
        "Unable to list NICs.  Error was ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
