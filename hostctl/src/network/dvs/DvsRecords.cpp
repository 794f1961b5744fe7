#include "network/dvs/DvsRecords.h"

#include "hostctl/network/dvs/DVSwitch.h"
#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<LacpLocalRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("adminKey", &LacpLocalRecord::adminKey),
            Field("operKey", &LacpLocalRecord::operKey),
            Field("portPriority", &LacpLocalRecord::portPriority),
            Field("portNumber", &LacpLocalRecord::portNumber),
            Field("state", &LacpLocalRecord::state));
    }
};

template <>
struct RecordFields<LacpPartnerRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("deviceId", &LacpPartnerRecord::deviceId),
            Field("flags", &LacpPartnerRecord::flags),
            Field("age", &LacpPartnerRecord::age),
            Field("operKey", &LacpPartnerRecord::operKey),
            Field("portPriority", &LacpPartnerRecord::portPriority),
            Field("portNumber", &LacpPartnerRecord::portNumber),
            Field("state", &LacpPartnerRecord::state));
    }
};

template <>
struct RecordFields<LacpStatsRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("txLacpdus", &LacpStatsRecord::txLacpdus),
            Field("rxLacpdus", &LacpStatsRecord::rxLacpdus),
            Field("txErrors", &LacpStatsRecord::txErrors),
            Field("rxErrors", &LacpStatsRecord::rxErrors));
    }
};

template <>
struct RecordFields<LagMemberRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("nic", &LagMemberRecord::nic),
            Field("state", &LagMemberRecord::state),
            Field("shortTimeout", &LagMemberRecord::shortTimeout),
            Field("local", &LagMemberRecord::local),
            Field("partner", &LagMemberRecord::partner),
            Field("stats", &LagMemberRecord::stats));
    }
};

template <>
struct RecordFields<LagRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("id", &LagRecord::id),
            Field("name", &LagRecord::name),
            Field("mode", &LagRecord::mode),
            Field("loadBalance", &LagRecord::loadBalance),
            Field("members", &LagRecord::members));
    }
};

template <>
struct RecordFields<DvSwitchRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &DvSwitchRecord::name),
            Field("uuid", &DvSwitchRecord::uuid),
            Field("class", &DvSwitchRecord::className),
            Field(DvSwitchRecord::kNumPortsField, &DvSwitchRecord::numPorts),
            Field("mtu", &DvSwitchRecord::mtu),
            Field("cdp", &DvSwitchRecord::cdp),
            Field("beaconTimeout", &DvSwitchRecord::beaconTimeout),
            Field("orvixBranded", &DvSwitchRecord::orvixBranded),
            Field("uplinks", &DvSwitchRecord::uplinks),
            Field("lags", &DvSwitchRecord::lags));
    }
};

template <>
struct RecordFields<DvPortRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("dvswitch", &DvPortRecord::dvswitch),
            Field("id", &DvPortRecord::id),
            Field("portgroupId", &DvPortRecord::portgroupId),
            Field("connectionId", &DvPortRecord::connectionId),
            Field("lacpEnabled", &DvPortRecord::lacpEnabled),
            Field("lacpMode", &DvPortRecord::lacpMode));
    }
};
// clang-format on

int LacpModeNumber(const std::string& word) {
    if (word == "active") return HostCtl::Network::LACP_MODE_ACTIVE;
    if (word == "passive") return HostCtl::Network::LACP_MODE_PASSIVE;
    return HostCtl::Network::LACP_MODE_NONE;
}

bool FitsJoinedKey(const std::string& part) {
    return part.find('|') == std::string::npos;
}

std::string DvPortKey(const std::string& dvswitch, const std::string& id) {
    return dvswitch + "|" + id;
}

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::DvSwitchRecord);
STORED_RECORD(PldCtl::Detail::DvPortRecord);
