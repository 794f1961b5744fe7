#include "nic/NicVlanStatsGet.h"

#include <utility>

#include "common/CommandSupport.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

NicVlanStatsGet::NicVlanStatsGet() {
    SetDescription("List VLAN statistics for active VLAN's on the NIC.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:NIC", "VLAN %VLAN ID%");
    SetDefaultOutputParameter("fields:NIC", "Packets received,Packets sent");
}

ORVIX_COMMAND_NEW(NicVlanStatsGet)

boost::shared_ptr<CallSpec::InputSpec> NicVlanStatsGet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "nic-name", CallSpec::PARAM_STRING, "n", "Name of the NIC to get statistics from.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicVlanStatsGet::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> NicVlanStatsGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("NIC");
}

void NicVlanStatsGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    const std::string nic = input->GetString("nic-name");
    ReportingHostErrors(
        output,
        [&] {
            const auto switches = PldCtl::Network::VirtualSwitchInfoImpl().GetAllSwitches();
            HostCtl::Network::Portset* vswitch = FindUplinkSwitch(switches, nic, *output);
            if (!vswitch) return;
            const auto vlans = vswitch->GetUplinkVlanStats(nic);
            // Counting switched off and no VLAN seen yet look alike here.
            if (vlans.empty()) {
                output->SetError("VLAN stats are disabled for " + nic + " please enable them first.");
                return;
            }
            boost::shared_ptr<MetaObj::MetaList> list =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            for (const auto& vlan : vlans) {
                boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                record->SetField("VLAN ID", static_cast<int>(vlan->vlanId));
                record->SetField("Packets received", vlan->rxPackets);
                record->SetField("Packets sent", vlan->txPackets);
                list->Append(std::move(record));
            }
            Finish(output, list);
        },
        "Unable to get VLAN stats: ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
