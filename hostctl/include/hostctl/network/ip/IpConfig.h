// The IP configuration of a kernel interface, a value the commands read from
// the interface, change and write back whole (PldNic::SetIpConfig).
#pragma once

#include <vector>

#include "hostctl/Export.h"
#include "hostctl/Values.h"

namespace PldCtl {
namespace Detail {
// How the library fills a configuration from what it stores, IPv6 address
// types and states included.
struct IpConfigAccess;
}  // namespace Detail
}  // namespace PldCtl

namespace HostCtl {
namespace Network {

class HOSTCTL_EXPORT IpConfig {
public:
    enum Ipv4Mode : int { IPV4_STATIC = 0, IPV4_DHCP = 1, IPV4_NONE = 2 };

    // No IPv4 address (IPV4_NONE), IPv6 switches off, no IPv6 address.
    IpConfig();

    // IPv4. The address and netmask are 0.0.0.0 while the mode is none.
    Ipv4Address GetIpv4Address() const { return ipv4Address_; }
    Ipv4Address GetIpv4Netmask() const { return ipv4Netmask_; }
    // The address with the host bits of the netmask set.
    Ipv4Address GetIpv4Broadcast() const;
    bool GetUseDhcp() const { return mode_ == IPV4_DHCP; }
    bool GetIpv4UseNone() const { return mode_ == IPV4_NONE; }
    Ipv4Mode GetIpv4Mode() const { return mode_; }
    // Setting an address or a netmask makes the configuration static.
    void SetIpv4Address(const Ipv4Address& address);
    void SetIpv4Netmask(const Ipv4Address& netmask);
    // true: DHCP; false: static with the current address and netmask.
    void SetUseDhcp(bool useDhcp);
    // No IPv4 address at all.
    void SetIpv4UseNone();

    // Whether DNS servers learned by DHCP or DHCPv6 are used.
    bool GetDhcpDns() const { return dhcpDns_; }
    void SetDhcpDns(bool dhcpDns) { dhcpDns_ = dhcpDns; }

    // IPv6.
    bool GetUseIpv6Dhcp() const { return ipv6Dhcp_; }
    bool GetUseIpv6RouterAdvertised() const { return ipv6RouterAdvertised_; }
    void SetUseIpv6Dhcp(bool use) { ipv6Dhcp_ = use; }
    void SetUseIpv6RouterAdvertised(bool use) { ipv6RouterAdvertised_ = use; }
    // The interface's IPv6 addresses, in order.
    const std::vector<Ipv6Network>& GetIpv6Network() const { return ipv6Networks_; }
    // A new address is static and preferred. Throws HostCtlException for an
    // address (with any prefix length) the configuration has already.
    void AddIpv6Network(const Ipv6Network& network);
    // Removes the address with that prefix length. Throws HostCtlException
    // when the configuration does not have it.
    void RemoveIpv6Network(const Ipv6Network& network);

private:
    friend struct PldCtl::Detail::IpConfigAccess;
    Ipv4Mode mode_ = IPV4_NONE;
    Ipv4Address ipv4Address_;
    Ipv4Address ipv4Netmask_;
    bool dhcpDns_ = false;
    bool ipv6Dhcp_ = false;
    bool ipv6RouterAdvertised_ = false;
    std::vector<Ipv6Network> ipv6Networks_;
};

}  // namespace Network
}  // namespace HostCtl
