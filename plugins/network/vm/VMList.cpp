#include "vm/VMList.h"

#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/resource/WorldImpl.h"
#include "vm/VmLookup.h"
#include "vm/VmRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VMList::VMList() {
    SetDescription("List networking information for the VM's that have active ports.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:VM", "World ID,Name,Num Ports,Networks");
}

ORVIX_COMMAND_NEW(VMList)

boost::shared_ptr<CallSpec::InputSpec> VMList::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> VMList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> VMList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("VM");
}

void VMList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> /*input*/, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    ReportingHostErrors(
        output,
        [&] {
            // The networks of each world, one name per port (repeats kept),
            // by ascending world id.
            std::map<std::uint64_t, std::vector<std::string>> networks;
            ForEachWorldPort(switchInfo, [&](const std::string& /*switchName*/, SwitchKind kind,
                                             const HostCtl::Network::Port& port) {
                networks[port.GetWorldId()].push_back(PortNetworkName(kind, port));
            });

            boost::shared_ptr<MetaObj::MetaList> records =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            records->Reserve(networks.size());
            for (auto& world : networks) {
                boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                record->SetField("World ID", world.first);
                record->SetField("Name", VmDisplayName(PldCtl::Resource::WorldImpl(world.first).GetWorldName()));
                record->SetField("Num Ports", world.second.size());
                record->SetField("Networks", std::move(world.second));
                records->Append(std::move(record));
            }
            Finish(output, records);
        },
        "Unable to list VM's: ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
