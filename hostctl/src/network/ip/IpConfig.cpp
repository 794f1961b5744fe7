#include "hostctl/network/ip/IpConfig.h"

#include <algorithm>

#include "hostctl/Lib.h"

namespace HostCtl {
namespace Network {

IpConfig::IpConfig() = default;

Ipv4Address IpConfig::GetIpv4Broadcast() const {
    return Ipv4Address(ipv4Address_.ToUint32() | ~ipv4Netmask_.ToUint32());
}

void IpConfig::SetIpv4Address(const Ipv4Address& address) {
    mode_ = IPV4_STATIC;
    ipv4Address_ = address;
}

void IpConfig::SetIpv4Netmask(const Ipv4Address& netmask) {
    mode_ = IPV4_STATIC;
    ipv4Netmask_ = netmask;
}

void IpConfig::SetUseDhcp(bool useDhcp) {
    mode_ = useDhcp ? IPV4_DHCP : IPV4_STATIC;
}

void IpConfig::SetIpv4UseNone() {
    mode_ = IPV4_NONE;
    ipv4Address_ = Ipv4Address();
    ipv4Netmask_ = Ipv4Address();
}

void IpConfig::AddIpv6Network(const Ipv6Network& network) {
    const auto sameAddress = [&](const Ipv6Network& held) { return held.GetAddress() == network.GetAddress(); };
    if (std::any_of(ipv6Networks_.begin(), ipv6Networks_.end(), sameAddress)) {
        throw Lib::HostCtlException("The IPv6 address " + network.GetStringAddress() + " is already configured");
    }
    // Made anew so that it is static and preferred, whatever the caller's
    // value carried.
    ipv6Networks_.emplace_back(network.GetAddress(), network.GetPrefixLength());
}

void IpConfig::RemoveIpv6Network(const Ipv6Network& network) {
    const auto held = std::find(ipv6Networks_.begin(), ipv6Networks_.end(), network);
    if (held == ipv6Networks_.end()) {
        throw Lib::HostCtlException("The IPv6 address " + network.GetStringAddress() + " is not configured");
    }
    ipv6Networks_.erase(held);
}

}  // namespace Network
}  // namespace HostCtl
