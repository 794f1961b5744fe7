#include "ip/interface/IpInterfaceList.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/ip/PalladNicInfoImpl.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "ip/interface/InterfaceLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpInterfaceList::IpInterfaceList() {
    SetDescription("This command will list the Pallad network interfaces currently known to the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:NetworkInterface", "%Name%");
    SetDefaultOutputParameter("fields:NetworkInterface",
                              "Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS "
                              "Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port "
                              "ID");
}

ORVIX_COMMAND_NEW(IpInterfaceList)

boost::shared_ptr<CallSpec::InputSpec> IpInterfaceList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "netstack", CallSpec::PARAM_STRING, "N",
                     "The network stack instance; if unspecified, consider all netstack instances", Required::No);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> IpInterfaceList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpInterfaceList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("NetworkInterface");
}

namespace {

const char kNotApplicable[] = "N/A";
const std::int64_t kNoConnection = -1;

// The distributed switch fields of a record whose point is no DV port.
void SetNoDVPort(MetaObj::MetaStruct& record) {
    record.SetField("VDS Name", kNotApplicable);
    record.SetField("VDS UUID", kNotApplicable);
    record.SetField("VDS Port", kNotApplicable);
    record.SetField("VDS Connection", kNoConnection);
}

// The opaque network fields of a record whose point is no opaque network.
void SetNoOpaqueNetwork(MetaObj::MetaStruct& record) {
    record.SetField("Opaque Network ID", kNotApplicable);
    record.SetField("Opaque Network Type", kNotApplicable);
    record.SetField("External ID", kNotApplicable);
}

// The connection fields of one interface's record, from its connection
// point. A DV port whose switch the host cannot find and a point of a kind
// this command does not know are reported; the listing goes on.
void SetConnectionFields(MetaObj::MetaStruct& record, const HostCtl::Network::PldNic& nic,
                         PldCtl::Network::VirtualSwitchInfoImpl& switches, CallSpec::Output& output) {
    std::unique_ptr<HostCtl::Network::ConnectionPoint> point = nic.GetConnectionPoint();
    if (!point) {
        record.SetField("Portset", kNotApplicable);
        record.SetField("Portgroup", kNotApplicable);
        record.SetField("Netstack Instance", kNotApplicable);
        SetNoDVPort(record);
        SetNoOpaqueNetwork(record);
        return;
    }
    const std::string portset = point->GetPortsetName();
    record.SetField("Portset", portset.empty() ? std::string(kNotApplicable) : portset);
    switch (point->GetType()) {
        case HostCtl::Network::ConnectionPoint::TYPE_PORT_GROUP:
            record.SetField("Portgroup", point->GetPortGroupName());
            record.SetField("Netstack Instance", nic.GetNetstackInstance());
            SetNoDVPort(record);
            SetNoOpaqueNetwork(record);
            break;
        case HostCtl::Network::ConnectionPoint::TYPE_DV_PORT: {
            const HostCtl::Network::DVPortParam param = point->GetDVPortParam();
            record.SetField("Portgroup", kNotApplicable);
            record.SetField("Netstack Instance", nic.GetNetstackInstance());
            std::unique_ptr<HostCtl::Network::DVSwitch> dvSwitch = switches.GetDVSwitchByName(portset);
            if (dvSwitch) {
                record.SetField("VDS Name", dvSwitch->GetName());
            } else {
                output.SetError("Unable to access the associated VDS");
                record.SetField("VDS Name", kNotApplicable);
            }
            record.SetField("VDS UUID", param.switchUuid);
            record.SetField("VDS Port", param.portId);
            record.SetField("VDS Connection", static_cast<std::int64_t>(param.connectionId));
            SetNoOpaqueNetwork(record);
            break;
        }
        case HostCtl::Network::ConnectionPoint::TYPE_OPAQUE_NETWORK: {
            const HostCtl::Network::OpaqueNetworkParam param = point->GetOpaqueNetworkParam();
            record.SetField("Portgroup", kNotApplicable);
            record.SetField("Netstack Instance", nic.GetNetstackInstance());
            SetNoDVPort(record);
            record.SetField("Opaque Network ID", param.networkId);
            record.SetField("Opaque Network Type", param.networkType);
            record.SetField("External ID", param.externalId);
            break;
        }
        default:
            output.SetError("Unknown ConnectionPoint type found in list of Pallad network interfaces.");
            break;
    }
}

}  // namespace

void IpInterfaceList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                      boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::PalladNicInfoImpl interfaces;
    PldCtl::Network::VirtualSwitchInfoImpl switches;
    ReportingHostErrors(output, [&] {
        const std::string netstack = input->GetString("netstack");
        const PldNicList nics =
            netstack.empty() ? interfaces.GetPalladNics() : interfaces.GetPalladNicsByInstanceKey(netstack);
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        records->Reserve(nics.size());
        for (const auto& nic : nics) {
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            record->SetField("Name", nic->GetName());
            record->SetField("MAC Address", nic->GetMacAddress().GetStringAddress());
            SetConnectionFields(*record, *nic, switches, *output);
            record->SetField("MTU", nic->GetMtu());
            record->SetField("TSO MSS", nic->GetTsoMss());
            record->SetField("Enabled", nic->IsEnabled());
            record->SetField("Port ID", static_cast<std::int64_t>(nic->GetPortId()));
            records->Append(std::move(record));
        }
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
