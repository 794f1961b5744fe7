#include "ip/neighbor/IpNeighborList.h"

#include <memory>
#include <vector>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "hostctl/network/ip/RoutingInfoImpl.h"
#include "ip/IpOptions.h"
#include "ip/interface/InterfaceLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

IpNeighborList::IpNeighborList() {
    SetDescription("List ARP table entries");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:NetworkNeighbor", "Neighbor,Mac Address,Pldnic,Expiry,State,Type");
    SetDefaultOutputParameter("units:NetworkNeighbor.Expiry", "sec");
}

ORVIX_COMMAND_NEW(IpNeighborList)

boost::shared_ptr<CallSpec::InputSpec> IpNeighborList::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec = CallSpec::InputSpec::New();
    DeclareParameter(inputSpec, "version", CallSpec::PARAM_STRING, "v", "IP version : %ENUM%", Required::No,
                     StringEnum({{"4", ""}, {"6", ""}, {"all", ""}}));
    DeclareNetstackParameter(inputSpec);
    DeclareParameter(inputSpec, "interface-name", CallSpec::PARAM_STRING, "i",
                     "The name of the Pallad network interface to limit the output of this command to; if "
                     "unspecified, list neighbors on all interfaces.",
                     Required::No);
    return inputSpec;
}

boost::shared_ptr<CallSpec::OutputSpec> IpNeighborList::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> IpNeighborList::GetOutputStructure() {
    return MetaObj::MetaStruct::New("NetworkNeighbor");
}

void IpNeighborList::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                     boost::shared_ptr<CallSpec::Output> output) {
    const std::string interfaceName = input->GetString("interface-name");
    PldCtl::Network::RoutingInfoImpl routing;
    routing.SetNetstackInstanceKey(SelectedNetstack(*input));
    const std::string version = input->IsSet("version") ? input->GetString("version") : std::string("all");
    ReportingHostErrors(output, [&] {
        if (!interfaceName.empty()) {
            PldCtl::Network::PalladNicInfoImpl interfaces;
            if (!FindInterface(interfaces, interfaceName, MissingInterface::PalladInterface, *output)) return;
        }
        boost::shared_ptr<MetaObj::MetaList> records =
            MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
        if (version == "4" || version == "all") {
            std::vector<HostCtl::Network::Ipv4Neighbor> neighbors;
            routing.GetCurrentIpv4PalladNeighbors(neighbors, interfaceName);
            for (const HostCtl::Network::Ipv4Neighbor& neighbor : neighbors) {
                boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                record->SetField("Neighbor", neighbor.address.GetStringAddress());
                record->SetField("Mac Address", neighbor.macAddress);
                record->SetField("Pldnic", neighbor.interfaceName);
                record->SetField("Expiry", static_cast<long long>(neighbor.expiry));
                record->SetField("State", "");
                record->SetField("Type", routing.GetIpv4NeighborType(neighbor));
                records->Append(std::move(record));
            }
        }
        PldCtl::Network::NetworkInfoImpl networkInfo;
        if ((version == "6" || version == "all") && networkInfo.IsPldIpv6Enabled()) {
            std::vector<HostCtl::Network::Ipv6Neighbor> neighbors;
            routing.GetCurrentIpv6PalladNeighbors(neighbors, interfaceName);
            for (const HostCtl::Network::Ipv6Neighbor& neighbor : neighbors) {
                boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
                record->SetField("Neighbor", neighbor.address.GetStringAddress());
                record->SetField("Mac Address", neighbor.macAddress);
                record->SetField("Pldnic", neighbor.interfaceName);
                record->SetField("Expiry", static_cast<unsigned long long>(neighbor.expiry));
                record->SetField("State", routing.GetIpv6NeighborState(neighbor));
                record->SetField("Type", routing.GetIpv6NeighborType(neighbor));
                records->Append(std::move(record));
            }
        }
        Finish(output, records);
    });
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
