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
            Field("currentIpv6Enabled", &NetstackRecord::currentIpv6Enabled),
            Field("ipv4Gateway", &NetstackRecord::ipv4Gateway),
            Field("ipv6Gateway", &NetstackRecord::ipv6Gateway),
            Field("dnsServers", &NetstackRecord::dnsServers),
            Field("searchDomains", &NetstackRecord::searchDomains));
    }
};

template <>
struct RecordFields<RouteRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("netstack", &RouteRecord::netstack),
            Field("network", &RouteRecord::network),
            Field("gateway", &RouteRecord::gateway),
            Field("interface", &RouteRecord::interfaceName),
            Field("source", &RouteRecord::source));
    }
};

template <>
struct RecordFields<NeighborRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("netstack", &NeighborRecord::netstack),
            Field("interface", &NeighborRecord::interfaceName),
            Field("address", &NeighborRecord::address),
            Field("mac", &NeighborRecord::mac),
            Field("expiry", &NeighborRecord::expiry),
            Field("type", &NeighborRecord::type),
            Field("state", &NeighborRecord::state));
    }
};

template <>
struct RecordFields<ConnectionRecord> {
    static constexpr auto All() {
        return std::make_tuple(
            Field("netstack", &ConnectionRecord::netstack),
            Field("proto", &ConnectionRecord::proto),
            Field("localAddress", &ConnectionRecord::localAddress),
            Field("localPort", &ConnectionRecord::localPort),
            Field("foreignAddress", &ConnectionRecord::foreignAddress),
            Field("foreignPort", &ConnectionRecord::foreignPort),
            Field("recvQ", &ConnectionRecord::recvQ),
            Field("sendQ", &ConnectionRecord::sendQ),
            Field("state", &ConnectionRecord::state),
            Field("worldId", &ConnectionRecord::worldId),
            Field("ccAlgorithm", &ConnectionRecord::ccAlgorithm));
    }
};
// clang-format on

}  // namespace Detail
}  // namespace PldCtl

STORED_RECORD(PldCtl::Detail::InterfaceRecord);
STORED_RECORD(PldCtl::Detail::NetstackRecord);
STORED_RECORD(PldCtl::Detail::RouteRecord);
STORED_RECORD(PldCtl::Detail::NeighborRecord);
STORED_RECORD(PldCtl::Detail::ConnectionRecord);
