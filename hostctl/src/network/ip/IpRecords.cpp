#include "network/ip/IpRecords.h"

#include "network/RecordCodec.h"

namespace PldCtl {
namespace Detail {

// clang-format off
template <>
struct RecordFields<Ipv6AddressRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("address", &Ipv6AddressRecord::address),
            Field("type", &Ipv6AddressRecord::type),
            Field("status", &Ipv6AddressRecord::status));
    }
};

template <>
struct RecordFields<InterfaceRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("name", &InterfaceRecord::name),
            Field("netstack", &InterfaceRecord::netstack),
            Field("portgroup", &InterfaceRecord::portgroup),
            Field("dvswitch", &InterfaceRecord::dvswitch),
            Field("dvPortId", &InterfaceRecord::dvPortId),
            Field("opaqueNetworkId", &InterfaceRecord::opaqueNetworkId),
            Field("opaqueNetworkType", &InterfaceRecord::opaqueNetworkType),
            Field("externalId", &InterfaceRecord::externalId),
            Field("opaqueSwitch", &InterfaceRecord::opaqueSwitch),
            Field("portId", &InterfaceRecord::portId),
            Field("mac", &InterfaceRecord::mac),
            Field("mtu", &InterfaceRecord::mtu),
            Field("tsoMss", &InterfaceRecord::tsoMss),
            Field("enabled", &InterfaceRecord::enabled),
            Field("ipv4Mode", &InterfaceRecord::ipv4Mode),
            Field("ipv4Address", &InterfaceRecord::ipv4Address),
            Field("ipv4Netmask", &InterfaceRecord::ipv4Netmask),
            Field("dhcpDns", &InterfaceRecord::dhcpDns),
            Field("ipv6Dhcp", &InterfaceRecord::ipv6Dhcp),
            Field("ipv6RouterAdv", &InterfaceRecord::ipv6RouterAdv),
            Field("ipv6Addresses", &InterfaceRecord::ipv6Addresses),
            Field("tags", &InterfaceRecord::tags));
    }
};

template <>
struct RecordFields<NetstackRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("key", &NetstackRecord::key),
            Field("name", &NetstackRecord::name),
            Field("state", &NetstackRecord::state),
            Field("maxConnections", &NetstackRecord::maxConnections),
            Field("currentMaxConnections", &NetstackRecord::currentMaxConnections),
            Field("ccAlgorithm", &NetstackRecord::ccAlgorithm),
            Field("ipv6Enabled", &NetstackRecord::ipv6Enabled),
            Field("currentIpv6Enabled", &NetstackRecord::currentIpv6Enabled));
    }
};
// clang-format on

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::InterfaceRecord);
STORED_RECORD(PldCtl::Detail::NetstackRecord);
