// The stored form of a NIC: every field of its object, nested objects
// included, by name.
#include "network/nic/NicRecords.h"

#include "hostctl/Lib.h"
#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<LinkModeRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("speed", &LinkModeRecord::speed),
            Field("duplex", &LinkModeRecord::duplex));
    }
};

template <>
struct RecordFields<PauseRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("supported", &PauseRecord::supported),
            Field("autoNegotiate", &PauseRecord::autoNegotiate),
            Field("rx", &PauseRecord::rx),
            Field("tx", &PauseRecord::tx),
            Field("rxResolution", &PauseRecord::rxResolution),
            Field("txResolution", &PauseRecord::txResolution));
    }
};

template <>
struct RecordFields<CoalesceRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("adaptiveRx", &CoalesceRecord::adaptiveRx),
            Field("adaptiveTx", &CoalesceRecord::adaptiveTx),
            Field("sampleInterval", &CoalesceRecord::sampleInterval),
            Field("rxUsecs", &CoalesceRecord::rxUsecs),
            Field("rxMaxFrames", &CoalesceRecord::rxMaxFrames),
            Field("txUsecs", &CoalesceRecord::txUsecs),
            Field("txMaxFrames", &CoalesceRecord::txMaxFrames));
    }
};

template <>
struct RecordFields<RingSizesRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("rx", &RingSizesRecord::rx),
            Field("rxMini", &RingSizesRecord::rxMini),
            Field("rxJumbo", &RingSizesRecord::rxJumbo),
            Field("tx", &RingSizesRecord::tx));
    }
};

template <>
struct RecordFields<RingsRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("preset", &RingsRecord::preset),
            Field("current", &RingsRecord::current));
    }
};

template <>
struct RecordFields<OffloadsRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("rxChecksum", &OffloadsRecord::rxChecksum),
            Field("txChecksum", &OffloadsRecord::txChecksum),
            Field("scatterGather", &OffloadsRecord::scatterGather),
            Field("tso", &OffloadsRecord::tso));
    }
};

template <>
struct RecordFields<SoftwareSimulationRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("ipv4Cso", &SoftwareSimulationRecord::ipv4Cso),
            Field("ipv4Tso", &SoftwareSimulationRecord::ipv4Tso),
            Field("scatterGather", &SoftwareSimulationRecord::scatterGather),
            Field("offsetBasedOffload", &SoftwareSimulationRecord::offsetBasedOffload),
            Field("vxlanEncap", &SoftwareSimulationRecord::vxlanEncap),
            Field("ipv6Tso", &SoftwareSimulationRecord::ipv6Tso),
            Field("ipv6TsoExt", &SoftwareSimulationRecord::ipv6TsoExt),
            Field("ipv6Cso", &SoftwareSimulationRecord::ipv6Cso),
            Field("ipv6CsoExt", &SoftwareSimulationRecord::ipv6CsoExt),
            Field("highDma", &SoftwareSimulationRecord::highDma),
            Field("scatterGatherMultiPage", &SoftwareSimulationRecord::scatterGatherMultiPage),
            Field("vlanTagging", &SoftwareSimulationRecord::vlanTagging),
            Field("vlanUntagging", &SoftwareSimulationRecord::vlanUntagging),
            Field("geneveOffload", &SoftwareSimulationRecord::geneveOffload));
    }
};

template <>
struct RecordFields<NicStatsRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("rxPackets", &NicStatsRecord::rxPackets),
            Field("txPackets", &NicStatsRecord::txPackets),
            Field("rxBytes", &NicStatsRecord::rxBytes),
            Field("txBytes", &NicStatsRecord::txBytes),
            Field("rxDropped", &NicStatsRecord::rxDropped),
            Field("txDropped", &NicStatsRecord::txDropped),
            Field("rxMulticast", &NicStatsRecord::rxMulticast),
            Field("rxBroadcast", &NicStatsRecord::rxBroadcast),
            Field("txMulticast", &NicStatsRecord::txMulticast),
            Field("txBroadcast", &NicStatsRecord::txBroadcast),
            Field("rxErrors", &NicStatsRecord::rxErrors),
            Field("rxLengthErrors", &NicStatsRecord::rxLengthErrors),
            Field("rxOverErrors", &NicStatsRecord::rxOverErrors),
            Field("rxCrcErrors", &NicStatsRecord::rxCrcErrors),
            Field("rxFrameErrors", &NicStatsRecord::rxFrameErrors),
            Field("rxFifoErrors", &NicStatsRecord::rxFifoErrors),
            Field("rxMissedErrors", &NicStatsRecord::rxMissedErrors),
            Field("txErrors", &NicStatsRecord::txErrors),
            Field("txAbortedErrors", &NicStatsRecord::txAbortedErrors),
            Field("txCarrierErrors", &NicStatsRecord::txCarrierErrors),
            Field("txFifoErrors", &NicStatsRecord::txFifoErrors),
            Field("txHeartbeatErrors", &NicStatsRecord::txHeartbeatErrors),
            Field("txWindowErrors", &NicStatsRecord::txWindowErrors));
    }
};

template <>
struct RecordFields<SelfTestRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("passed", &SelfTestRecord::passed),
            Field("online", &SelfTestRecord::online),
            Field("offline", &SelfTestRecord::offline));
    }
};

template <>
struct RecordFields<VfStatsRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("rxUnicastPackets", &VfStatsRecord::rxUnicastPackets),
            Field("rxUnicastBytes", &VfStatsRecord::rxUnicastBytes),
            Field("rxMulticastPackets", &VfStatsRecord::rxMulticastPackets),
            Field("rxMulticastBytes", &VfStatsRecord::rxMulticastBytes),
            Field("rxBroadcastPackets", &VfStatsRecord::rxBroadcastPackets),
            Field("rxBroadcastBytes", &VfStatsRecord::rxBroadcastBytes),
            Field("rxOutOfBufferDrops", &VfStatsRecord::rxOutOfBufferDrops),
            Field("rxErrorDrops", &VfStatsRecord::rxErrorDrops),
            Field("rxLroPackets", &VfStatsRecord::rxLroPackets),
            Field("rxLroBytes", &VfStatsRecord::rxLroBytes),
            Field("txUnicastPackets", &VfStatsRecord::txUnicastPackets),
            Field("txUnicastBytes", &VfStatsRecord::txUnicastBytes),
            Field("txMulticastPackets", &VfStatsRecord::txMulticastPackets),
            Field("txMulticastBytes", &VfStatsRecord::txMulticastBytes),
            Field("txBroadcastPackets", &VfStatsRecord::txBroadcastPackets),
            Field("txBroadcastBytes", &VfStatsRecord::txBroadcastBytes),
            Field("txErrors", &VfStatsRecord::txErrors),
            Field("txDiscards", &VfStatsRecord::txDiscards),
            Field("txTsoPackets", &VfStatsRecord::txTsoPackets),
            Field("txTsoBytes", &VfStatsRecord::txTsoBytes));
    }
};

template <>
struct RecordFields<VfRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("id", &VfRecord::id),
            Field("active", &VfRecord::active),
            Field("pciAddress", &VfRecord::pciAddress),
            Field("ownerWorldId", &VfRecord::ownerWorldId),
            Field("stats", &VfRecord::stats));
    }
};

template <>
struct RecordFields<NicRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &NicRecord::name),
            Field("pciDevice", &NicRecord::pciDevice),
            Field("vendorName", &NicRecord::vendorName),
            Field("deviceName", &NicRecord::deviceName),
            Field("driver", &NicRecord::driver),
            Field("driverVersion", &NicRecord::driverVersion),
            Field("firmwareVersion", &NicRecord::firmwareVersion),
            Field("adminUp", &NicRecord::adminUp),
            Field("linkUp", &NicRecord::linkUp),
            Field("speed", &NicRecord::speed),
            Field("duplex", &NicRecord::duplex),
            Field("autoNegotiation", &NicRecord::autoNegotiation),
            Field("mtu", &NicRecord::mtu),
            Field("mac", &NicRecord::mac),
            Field("supportedPorts", &NicRecord::supportedPorts),
            Field("port", &NicRecord::port),
            Field("transceiver", &NicRecord::transceiver),
            Field("phyAddress", &NicRecord::phyAddress),
            Field("virtualAddress", &NicRecord::virtualAddress),
            Field("supportsAutoNegotiation", &NicRecord::supportsAutoNegotiation),
            Field("advertisedAutoNegotiation", &NicRecord::advertisedAutoNegotiation),
            Field("advertisedLinkModes", &NicRecord::advertisedLinkModes),
            Field("supportsWakeOn", &NicRecord::supportsWakeOn),
            Field("wakeOn", &NicRecord::wakeOn),
            Field("supportsMessageLevel", &NicRecord::supportsMessageLevel),
            Field("messageLevel", &NicRecord::messageLevel),
            Field("uplinkPortId", &NicRecord::uplinkPortId),
            Field("pause", &NicRecord::pause),
            Field("coalesce", &NicRecord::coalesce),
            Field("rings", &NicRecord::rings),
            Field("offloads", &NicRecord::offloads),
            Field("softwareSimulation", &NicRecord::softwareSimulation),
            Field("stats", &NicRecord::stats),
            Field("registers", &NicRecord::registers),
            Field("eeprom", &NicRecord::eeprom),
            Field("eepromMagic", &NicRecord::eepromMagic),
            Field("selfTest", &NicRecord::selfTest),
            Field("sriovVfs", &NicRecord::sriovVfs));
    }
};

// clang-format on

void NoSuchNic(const std::string& name) {
    throw HostCtl::Lib::HostCtlException("NIC " + name + " does not exist");
}

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::NicRecord);
