#include "nic/VfStats.h"

#include <cstdint>
#include <cstdlib>
#include <string>

#include "common/CommandSupport.h"
#include "hostctl/network/NetworkInfoImpl.h"
#include "nic/NicLookup.h"

namespace OrvixCli {
namespace NetworkNamespace {

namespace {

// The counters of a VF, in the order of the output.
struct VfCounter {
    const char* field;
    std::uint64_t HostCtl::Network::SriovNicVFStats::*member;
};

using Stats = HostCtl::Network::SriovNicVFStats;
const VfCounter kCounters[] = {
    {"Rx Unicast Pkt", &Stats::rxUnicastPackets},
    {"Rx Unicast Bytes", &Stats::rxUnicastBytes},
    {"Rx Multicast Pkts", &Stats::rxMulticastPackets},
    {"Rx Multicast Bytes", &Stats::rxMulticastBytes},
    {"Rx Broadcast Pkts", &Stats::rxBroadcastPackets},
    {"Rx Broadcast Bytes", &Stats::rxBroadcastBytes},
    {"Rx Out of Buffer drops", &Stats::rxOutOfBufferDrops},
    {"Rx Error drops", &Stats::rxErrorDrops},
    {"Rx LRO Pkts", &Stats::rxLroPackets},
    {"Rx LRO Bytes", &Stats::rxLroBytes},
    {"Tx Unicast Pkt", &Stats::txUnicastPackets},
    {"Tx Unicast Bytes", &Stats::txUnicastBytes},
    {"Tx Multicast Pkts", &Stats::txMulticastPackets},
    {"Tx Multicast Bytes", &Stats::txMulticastBytes},
    {"Tx Broadcast Pkts", &Stats::txBroadcastPackets},
    {"Tx Broadcast Bytes", &Stats::txBroadcastBytes},
    {"Tx Errors", &Stats::txErrors},
    {"Tx Discards", &Stats::txDiscards},
    {"Tx TSO Pkts", &Stats::txTsoPackets},
    {"Tx TSO Bytes", &Stats::txTsoBytes},
};

std::string CounterFields() {
    std::string fields;
    for (const VfCounter& counter : kCounters) {
        if (!fields.empty()) fields += ',';
        fields += counter.field;
    }
    return fields;
}

// The VF ID as typed, in base 10 with the full 64-bit range, so that an ID
// beyond what a VF can have reaches the library as it is and is refused
// there instead of wrapping onto a VF that exists. Text that is no number
// reads as 0.
std::int64_t VfIdOfText(const std::string& text) {
    return std::strtoll(text.c_str(), nullptr, 10);
}

}  // namespace

VfStats::VfStats() {
    SetDescription("Get statistics for given VF of a SRIOV NIC.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:VF", "Statistics for %vf% VF of %NIC Name%");
    SetDefaultOutputParameter("fields:VFStats", CounterFields());
}

ORVIX_COMMAND_NEW(VfStats)

boost::shared_ptr<CallSpec::InputSpec> VfStats::GetInputSpecInternal() {
    boost::shared_ptr<CallSpec::InputSpec> declared = CallSpec::InputSpec::New();
    DeclareParameter(declared, "nic-name", CallSpec::PARAM_STRING, "n",
                     "The name of the SRIOV NIC. This must be one of the cards listed in the sriovNic list command.",
                     Required::Yes);
    DeclareParameter(declared, "vf-id", CallSpec::PARAM_INT, "v",
                     "The VF ID of the virtual function whose stats are to be collected. This must be one of the VF "
                     "IDs listed in the sriovnic vf list command.",
                     Required::Yes);
    return declared;
}

boost::shared_ptr<CallSpec::OutputSpec> VfStats::GetOutputSpecInternal() {
    return OutputSpecOf(MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaObj::MetaStruct> VfStats::GetOutputStructure() {
    return MetaObj::MetaStruct::New("VfStats");
}

void VfStats::ExecuteInternal(boost::shared_ptr<CallSpec::Input> input, boost::shared_ptr<CallSpec::Output> output) {
    PldCtl::Network::NetworkInfoImpl networkInfo;
    ReportingHostErrors(
        output,
        [&] {
            boost::shared_ptr<MetaObj::MetaList> records =
                MetaObj::MetaList::New(MetaObj::META_STRUCT, GetOutputStructure());
            const std::string name = input->GetString("nic-name");
            const std::int64_t vfId = VfIdOfText(input->GetString("vf-id"));
            if (!FindSriovNic(networkInfo, name, *output)) return;
            Stats stats;
            networkInfo.GetSriovNicVFStats(stats, name, vfId);

            boost::shared_ptr<MetaObj::MetaStruct> record = GetOutputStructure();
            record->SetField("NIC Name", name);
            record->SetField("VF ID", static_cast<long long>(vfId));
            for (const VfCounter& counter : kCounters) {
                record->SetField(counter.field, static_cast<unsigned long long>(stats.*counter.member));
            }
            records->Append(std::move(record));
            Finish(output, records);
        },
        "Unable to get VF Stats. Error:");
}

}  // namespace NetworkNamespace
}  // namespace OrvixCli
