#include "vm/VMPortList.h"

#include <cstdint>
#include <string>
#include <utility>

#include "common/CommandSupport.h"
#include "port/PortLookup.h"
#include "vm/VmLookup.h"
#include "vm/VmRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

VMPortList::VMPortList() {
    SetDescription("List of active ports for a given VM.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("fields:Port",
                              "Port ID,vSwitch,Portgroup,DVPort ID,MAC Address,IP Address,Team Uplink,Uplink Port "
                              "ID,Active Filters");
}

ORVIX_COMMAND_NEW(VMPortList)

boost::shared_ptr<CallSpec::InputSpec> VMPortList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "world-id", CallSpec::PARAM_INT, "w", "World ID of the VM for listing ports.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VMPortList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> VMPortList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("Port");
}

void VMPortList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    ReportingHostErrors(
        output,
        [&] {
            // Worlds are counted from 1; the walk passes over ports without
            // one, so 0 and negative ids find nothing.
            const std::int64_t worldId = IdFromText(input->GetString("world-id"));
            boost::shared_ptr<MetaObj::MetaList> records =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            ForEachWorldPort(
                switchInfo, [&](const std::string& switchName, SwitchKind kind, const HostCtl::Network::Port& port) {
                    if (worldId <= 0 || port.GetWorldId() != static_cast<std::uint64_t>(worldId)) return;
                    boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                    record->SetField("Port ID", port.GetPortId());
                    record->SetField("vSwitch", switchName);
                    record->SetField("Portgroup", PortNetworkName(kind, port));
                    record->SetField("DVPort ID", kind == SwitchKind::Distributed ? port.GetDVPortId() : std::string());
                    record->SetField("MAC Address", port.GetMacAddress().GetStringAddress());
                    record->SetField("IP Address", port.GetIpAddress().GetStringAddress());
                    const TeamUplink uplink = TeamUplinkOf(port.GetTeamUplink());
                    record->SetField("Team Uplink", uplink.name);
                    record->SetField("Uplink Port ID", uplink.uplinkPortId);
                    record->SetField("Active Filters", ActiveFilterNames(port.GetFilterStats()));
                    records->Append(std::move(record));
                });
            if (records->Size() == 0) {
                output->SetError("Couldn't find VM with given world ID");
                return;
            }
            Finish(output, records);
        },
        "Unable to list ports for VM: ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
