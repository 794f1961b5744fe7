#include "nic/NicStatsGet.h"

#include <cstdint>
#include <utility>

#include "common/CommandSupport.h"
#include "hostctl/network/nic/PnicImpl.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

using HostCtl::Network::PnicStats;

// The counters in the order they are shown, each with its field.
struct Counter {
    const char* field;
    std::uint64_t PnicStats::*member;
};

// clang-format off
const Counter kCounters[] = {
    {"Packets received", &PnicStats::rxPackets},
    {"Packets sent", &PnicStats::txPackets},
    {"Bytes received", &PnicStats::rxBytes},
    {"Bytes sent", &PnicStats::txBytes},
    {"Receive packets dropped", &PnicStats::rxDropped},
    {"Transmit packets dropped", &PnicStats::txDropped},
    {"Multicast packets received", &PnicStats::rxMulticast},
    {"Broadcast packets received", &PnicStats::rxBroadcast},
    {"Multicast packets sent", &PnicStats::txMulticast},
    {"Broadcast packets sent", &PnicStats::txBroadcast},
    {"Total receive errors", &PnicStats::rxErrors},
    {"Receive length errors", &PnicStats::rxLengthErrors},
    {"Receive over errors", &PnicStats::rxOverErrors},
    {"Receive CRC errors", &PnicStats::rxCrcErrors},
    {"Receive frame errors", &PnicStats::rxFrameErrors},
    {"Receive FIFO errors", &PnicStats::rxFifoErrors},
    {"Receive missed errors", &PnicStats::rxMissedErrors},
    {"Total transmit errors", &PnicStats::txErrors},
    {"Transmit aborted errors", &PnicStats::txAbortedErrors},
    {"Transmit carrier errors", &PnicStats::txCarrierErrors},
    {"Transmit FIFO errors", &PnicStats::txFifoErrors},
    {"Transmit heartbeat errors", &PnicStats::txHeartbeatErrors},
    {"Transmit window errors", &PnicStats::txWindowErrors},
};
// clang-format on

std::string CounterFields() {
    std::string fields;
    for (const Counter& counter : kCounters) {
        if (!fields.empty()) fields += ',';
        fields += counter.field;
    }
    return fields;
}

}  // namespace

NicStatsGet::NicStatsGet() {
    SetDescription("Get NIC statistics for a given interface.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:Nic", "NIC statistics for %NIC Name%");
    SetDefaultOutputParameter("fields:Nic", CounterFields());
}

ORVIX_COMMAND_NEW(NicStatsGet)

boost::shared_ptr<CallSpec::InputSpec> NicStatsGet::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "nic-name", CallSpec::PARAM_STRING, "n", "Name of the NIC to get statistics from.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> NicStatsGet::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> NicStatsGet::GetOutputStructure() {
    return MetaObj::MetaStruct::New("Nic");
}

void NicStatsGet::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                  boost::shared_ptr<CallSpec::Output> output) {
    ReportingHostErrors(
        output,
        [&] {
            boost::shared_ptr<MetaObj::MetaList> list =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            PldCtl::Network::PnicImpl pnic(input->GetString("nic-name"));
            // A counter the NIC does not keep reads 0.
            PnicStats stats{};
            pnic.GetPnicStats(stats);
            record->SetField("NIC Name", pnic.GetName());
            for (const Counter& counter : kCounters) record->SetField(counter.field, stats.*counter.member);
            list->Append(std::move(record));
            Finish(output, list);
        },
        "Unable to get stats for NIC: ");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
