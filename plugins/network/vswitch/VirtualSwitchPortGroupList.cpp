#include "vswitch/VirtualSwitchPortGroupList.h"

#include <utility>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupList::VirtualSwitchPortGroupList() {
    SetDescription("List all of the port groups currently on the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:PortGroup", "Name,Virtual Switch,Active Clients,VLAN ID");
}

ORVIX_COMMAND_NEW(VirtualSwitchPortGroupList)

boost::shared_ptr<CallSpec::InputSpec> VirtualSwitchPortGroupList::GetInputSpecInternal() {
    return CallSpec::InputSpec::New();
}

boost::shared_ptr<CallSpec::OutputSpec> VirtualSwitchPortGroupList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> VirtualSwitchPortGroupList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("PortGroup");
}

void VirtualSwitchPortGroupList::ExecuteInternal(boost::shared_ptr<CallSpec::Input>,
                                                 boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(output, [&] {
        boost::shared_ptr<MetaObj::MetaList> portGroups =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        const auto all = networkInfo.GetAllPortGroups();
        portGroups->Reserve(all.size());
        for (const auto& portGroup : all) {
            // Active clients are only known to the implementation; a port
            // group of another kind is looked up again by name.
            const auto* impl = dynamic_cast<const PldCtl::Network::PortGroupImpl*>(portGroup.get());
            const int activeClients = impl ? impl->GetActiveClients()
                                           : PldCtl::Network::PortGroupImpl(portGroup->GetName()).GetActiveClients();
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            record->SetField("Name", portGroup->GetName());
            record->SetField("Virtual Switch", portGroup->GetVirtualSwitchName());
            record->SetField("Active Clients", activeClients);
            record->SetField("VLAN ID", portGroup->GetVlanId());
            portGroups->Append(std::move(record));
        }
        Finish(output, portGroups);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
