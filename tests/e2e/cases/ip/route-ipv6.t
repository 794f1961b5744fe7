## IPv6 routes of the default host: listing, adding and removing routes, the
## word "default", and the library's refusals.
$ orvixcli network ip route ipv6 list
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
default        ::                     2001:db8:10::1   pld0
2001:db8:10::  ffff:ffff:ffff:ffff::  ::               pld0
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:40::  ffff:ffff:ffff::       2001:db8:10::fe  pld0

$ orvixcli network ip route ipv6 list --formatter=simple
   Network: default
   Netmask: ::
   Gateway: 2001:db8:10::1
   Interface: pld0

   Network: 2001:db8:10::
   Netmask: ffff:ffff:ffff:ffff::
   Gateway: ::
   Interface: pld0

   Network: 2001:db8:20::
   Netmask: ffff:ffff:ffff:ffff::
   Gateway: ::
   Interface: pld1

   Network: 2001:db8:40::
   Netmask: ffff:ffff:ffff::
   Gateway: 2001:db8:10::fe
   Interface: pld0

$ orvixcli network ip route ipv6 list --formatter=json
[
  {
    "Network": "default",
    "Netmask": "::",
    "Gateway": "2001:db8:10::1",
    "Interface": "pld0"
  },
  {
    "Network": "2001:db8:10::",
    "Netmask": "ffff:ffff:ffff:ffff::",
    "Gateway": "::",
    "Interface": "pld0"
  },
  {
    "Network": "2001:db8:20::",
    "Netmask": "ffff:ffff:ffff:ffff::",
    "Gateway": "::",
    "Interface": "pld1"
  },
  {
    "Network": "2001:db8:40::",
    "Netmask": "ffff:ffff:ffff::",
    "Gateway": "2001:db8:10::fe",
    "Interface": "pld0"
  }
]

$ orvixcli network ip route ipv6 list -N migrix
Network        Netmask                Gateway  Interface
-------------  ---------------------  -------  ---------
2001:db8:30::  ffff:ffff:ffff:ffff::  ::       pld2

$ orvixcli network ip route ipv6 list --netstack=
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
default        ::                     2001:db8:10::1   pld0
2001:db8:10::  ffff:ffff:ffff:ffff::  ::               pld0
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:40::  ffff:ffff:ffff::       2001:db8:10::fe  pld0

$ orvixcli network ip route ipv6 list -N nowhere
! Netstack instance nowhere does not exist
[1]

## Addresses are shown in canonical text whatever way they were typed.
$ orvixcli network ip route ipv6 add --network 2001:DB8:50:0::/64 --gateway 2001:db8:10:0:0:0:0:99

$ orvixcli network ip route ipv6 add -n 2001:db8:50::/64 -g 2001:db8:10::99
! Route to 2001:db8:50::/64 via 2001:db8:10::99 already exists on netstack defaultTcpipStack
[1]

$ orvixcli network ip route ipv6 add -n 2001:db8:51::/64 -g 2001:db8:77::1
! Gateway 2001:db8:77::1 is not reachable from any interface of netstack defaultTcpipStack
[1]

$ orvixcli network ip route ipv6 add -n 2001:db8:52::/56 -g 2001:db8:30::99 -N migrix

$ orvixcli network ip route ipv6 list
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
default        ::                     2001:db8:10::1   pld0
2001:db8:10::  ffff:ffff:ffff:ffff::  ::               pld0
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:40::  ffff:ffff:ffff::       2001:db8:10::fe  pld0
2001:db8:50::  ffff:ffff:ffff:ffff::  2001:db8:10::99  pld0

$ orvixcli network ip route ipv6 list -N migrix --formatter=simple
   Network: 2001:db8:30::
   Netmask: ffff:ffff:ffff:ffff::
   Gateway: ::
   Interface: pld2

   Network: 2001:db8:52::
   Netmask: ffff:ffff:ffff:ff00::
   Gateway: 2001:db8:30::99
   Interface: pld2

$ orvixcli network ip route ipv6 add -n 2001:db8:53::/129 -g 2001:db8:10::99
! Invalid IPv6 network: '2001:db8:53::/129'
[1]

$ orvixcli network ip route ipv6 add -n 2001:db8:53::/64 -g 2001:db8:10::zz
! Invalid IPv6 address: '2001:db8:10::zz'
[1]

$ orvixcli network ip route ipv6 add -n Default -g 2001:db8:10::99
! Invalid IPv6 network: 'Default'
[1]

$ orvixcli network ip route ipv6 add -n 10.0.0.0/8 -g 2001:db8:10::99
! Invalid IPv6 network: '10.0.0.0/8'
[1]

$ orvixcli network ip route ipv6 remove -n 2001:db8:50::/64 -g 2001:db8:10::99

$ orvixcli network ip route ipv6 remove -n 2001:db8:50::/64 -g 2001:db8:10::99
! Route to 2001:db8:50::/64 via 2001:db8:10::99 does not exist on netstack defaultTcpipStack
[1]

$ orvixcli network ip route ipv6 remove -n default -g 2001:db8:10::9
! 2001:db8:10::9 is not a default route.
[1]

$ orvixcli network ip route ipv6 list
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
default        ::                     2001:db8:10::1   pld0
2001:db8:10::  ffff:ffff:ffff:ffff::  ::               pld0
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:40::  ffff:ffff:ffff::       2001:db8:10::fe  pld0

$ orvixcli network ip route ipv6 remove -n default -g 2001:db8:10::1

$ orvixcli network ip route ipv6 list
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
2001:db8:10::  ffff:ffff:ffff:ffff::  ::               pld0
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:40::  ffff:ffff:ffff::       2001:db8:10::fe  pld0

$ orvixcli network ip route ipv6 add -n default -g 2001:db8:10::1

$ orvixcli network ip route ipv6 list --formatter=json
[
  {
    "Network": "default",
    "Netmask": "::",
    "Gateway": "2001:db8:10::1",
    "Interface": "pld0"
  },
  {
    "Network": "2001:db8:10::",
    "Netmask": "ffff:ffff:ffff:ffff::",
    "Gateway": "::",
    "Interface": "pld0"
  },
  {
    "Network": "2001:db8:20::",
    "Netmask": "ffff:ffff:ffff:ffff::",
    "Gateway": "::",
    "Interface": "pld1"
  },
  {
    "Network": "2001:db8:40::",
    "Netmask": "ffff:ffff:ffff::",
    "Gateway": "2001:db8:10::fe",
    "Interface": "pld0"
  }
]
