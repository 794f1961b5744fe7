#include "port/PortStatsGet.h"

#include <memory>

#include "common/CommandSupport.h"
#include "hostctl/network/vswitch/SwitchImpl.h"
#include "port/PortLookup.h"
#include "port/PortRecords.h"

namespace OrvixCli {
namespace NetworkNamespace {

PortStatsGet::PortStatsGet() {
    SetDescription("Packet statistics for a given port.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:Port", "Packet statistics for port %Port ID%");
    SetDefaultOutputParameter("fields:Port",
                              "Packets received,Packets sent,Bytes received,Bytes sent,Broadcast packets "
                              "received,Broadcast packets sent,Multicast packets received,Multicast packets "
                              "sent,Unicast packets received,Unicast packets sent,Receive packets dropped,Transmit "
                              "packets dropped");
}

ORVIX_COMMAND_NEW(PortStatsGet)

boost::shared_ptr<CallSpec::InputSpec> PortStatsGet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "portid", CallSpec::PARAM_INT, "p", "Port ID for the port to get statistics.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> PortStatsGet::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> PortStatsGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("Port");
}

void PortStatsGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                   boost::shared_ptr<CallSpec::Output> output) {
    boost::shared_ptr<MetaObj::MetaList> records = MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
    PldCtl::Network::VirtualSwitchInfoImpl switchInfo;
    ReportingHostErrors(
        output,
        [&] {
            const std::unique_ptr<HostCtl::Network::Port> port = FindPort(switchInfo, *input, *output);
            if (!port) return;
            const HostCtl::Network::PortStats stats = port->GetPortStats();
            HostCtl::Network::PacketCounters counters;
            port->GetPacketCounters(counters);
            records->Append(PortStatsRecord(port->GetPortId(), stats, counters));
            Finish(output, records);
        },
        "Unable to get stats for port: ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
