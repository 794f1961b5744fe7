#include "network/port/PortRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<VlanStatsRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("vlanId", &VlanStatsRecord::vlanId),
            Field("rxPackets", &VlanStatsRecord::rxPackets),
            Field("txPackets", &VlanStatsRecord::txPackets));
    }
};

template <>
struct RecordFields<PortStatsRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("rxPackets", &PortStatsRecord::rxPackets),
            Field("txPackets", &PortStatsRecord::txPackets),
            Field("rxBytes", &PortStatsRecord::rxBytes),
            Field("txBytes", &PortStatsRecord::txBytes),
            Field("rxBroadcast", &PortStatsRecord::rxBroadcast),
            Field("txBroadcast", &PortStatsRecord::txBroadcast),
            Field("rxMulticast", &PortStatsRecord::rxMulticast),
            Field("txMulticast", &PortStatsRecord::txMulticast),
            Field("rxDropped", &PortStatsRecord::rxDropped),
            Field("txDropped", &PortStatsRecord::txDropped));
    }
};

template <>
struct RecordFields<FilterRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &FilterRecord::name),
            Field("key", &FilterRecord::key),
            Field("present", &FilterRecord::present),
            Field("direction", &FilterRecord::direction),
            Field("extended", &FilterRecord::extended),
            Field("packetsIn", &FilterRecord::packetsIn),
            Field("packetsOut", &FilterRecord::packetsOut),
            Field("packetsDropped", &FilterRecord::packetsDropped),
            Field("packetsFiltered", &FilterRecord::packetsFiltered),
            Field("packetsFaulted", &FilterRecord::packetsFaulted),
            Field("packetsQueued", &FilterRecord::packetsQueued),
            Field("packetsInjected", &FilterRecord::packetsInjected),
            Field("packetErrors", &FilterRecord::packetErrors));
    }
};

template <>
struct RecordFields<PortRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("id", &PortRecord::id),
            Field("portset", &PortRecord::portset),
            Field(PortRecord::kTypeField, &PortRecord::type),
            Field(PortRecord::kClientField, &PortRecord::client),
            Field(PortRecord::kPortGroupField, &PortRecord::portgroup),
            Field("dvPortId", &PortRecord::dvPortId),
            Field("worldId", &PortRecord::worldId),
            Field("mac", &PortRecord::mac),
            Field("ip", &PortRecord::ip),
            Field("teamUplink", &PortRecord::teamUplink),
            Field("stats", &PortRecord::stats),
            Field("filters", &PortRecord::filters),
            Field("vlanStatsEnabled", &PortRecord::vlanStatsEnabled),
            Field("vlanStats", &PortRecord::vlanStats));
    }
};
// clang-format on

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::PortRecord);
