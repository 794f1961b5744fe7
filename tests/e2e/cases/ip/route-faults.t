## The library's failures in every route command reach the user as its own
## message, and a failed change changes nothing.
$ orvix-hostsim fault add RoutingInfoImpl::GetCurrentPalladRoutes --key defaultTcpipStack --message "Unable to read the IPv4 routes" --count 1
1

$ orvixcli network ip route ipv4 list
! Unable to read the IPv4 routes
[1]

## The key is the netstack: another one is not affected.
$ orvix-hostsim fault add RoutingInfoImpl::GetCurrentIpv6PalladRoutes --key migrix --message "Unable to read the IPv6 routes of migrix" --count 1
2

$ orvixcli network ip route ipv6 list
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
default        ::                     2001:db8:10::1   pld0
2001:db8:10::  ffff:ffff:ffff:ffff::  ::               pld0
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:40::  ffff:ffff:ffff::       2001:db8:10::fe  pld0

$ orvixcli network ip route ipv6 list -N migrix
! Unable to read the IPv6 routes of migrix
[1]

$ orvix-hostsim fault add RoutingInfoImpl::GetDefaultGatewaySource --message "Unable to tell the gateway source" --count 1
3

$ orvixcli network ip route ipv4 list --formatter=json
! Unable to tell the gateway source
[1]

$ orvix-hostsim fault add RoutingInfoImpl::AddPalladRoute --message "Unable to add the IPv4 route" --count 1
4

$ orvixcli network ip route ipv4 add -n 10.10.0.0/16 -g 192.0.2.99
! Unable to add the IPv4 route
[1]

$ orvix-hostsim fault add RoutingInfoImpl::RemovePalladRoute --message "Unable to remove the IPv4 route" --count 1
5

$ orvixcli network ip route ipv4 remove -n 203.0.113.128/25 -g 192.0.2.254
! Unable to remove the IPv4 route
[1]

$ orvix-hostsim fault add RoutingInfoImpl::GetPalladDefaultGateway --message "Unable to read the IPv4 default gateway" --count 1
6

$ orvixcli network ip route ipv4 remove -n default -g 192.0.2.1
! Unable to read the IPv4 default gateway
[1]

$ orvix-hostsim fault add RoutingInfoImpl::SetPalladDefaultGateway --message "Unable to clear the IPv4 default gateway" --count 1
7

$ orvixcli network ip route ipv4 remove -n default -g 192.0.2.1
! Unable to clear the IPv4 default gateway
[1]

$ orvixcli network ip route ipv4 list
Network        Netmask          Gateway      Interface  Source
-------------  ---------------  -----------  ---------  ------
default        0.0.0.0          192.0.2.1    pld0       MANUAL
192.0.2.0      255.255.255.0    0.0.0.0      pld0       MANUAL
198.51.100.0   255.255.255.0    0.0.0.0      pld1       DHCP
203.0.113.128  255.255.255.128  192.0.2.254  pld0       MANUAL

$ orvix-hostsim fault add RoutingInfoImpl::AddIpv6PalladRoute --message "Unable to add the IPv6 route" --count 1
8

$ orvixcli network ip route ipv6 add -n 2001:db8:50::/64 -g 2001:db8:10::99
! Unable to add the IPv6 route
[1]

$ orvix-hostsim fault add RoutingInfoImpl::RemoveIpv6PalladRoute --message "Unable to remove the IPv6 route" --count 1
9

$ orvixcli network ip route ipv6 remove -n 2001:db8:40::/48 -g 2001:db8:10::fe
! Unable to remove the IPv6 route
[1]

$ orvix-hostsim fault add RoutingInfoImpl::GetIpv6PalladConfigDefaultGateway --message "Unable to read the IPv6 configured gateway" --count 1
10

## A gateway other than the one in force makes the command read the configured one.
$ orvixcli network ip route ipv6 remove -n default -g 2001:db8:10::9
! Unable to read the IPv6 configured gateway
[1]

$ orvix-hostsim fault add RoutingInfoImpl::SetIpv6PalladDefaultGateway --message "Unable to clear the IPv6 default gateway" --count 1
11

$ orvixcli network ip route ipv6 remove -n default -g 2001:db8:10::1
! Unable to clear the IPv6 default gateway
[1]

$ orvixcli network ip route ipv6 list
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
default        ::                     2001:db8:10::1   pld0
2001:db8:10::  ffff:ffff:ffff:ffff::  ::               pld0
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:40::  ffff:ffff:ffff::       2001:db8:10::fe  pld0
