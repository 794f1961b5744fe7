@profile fixtures/ip/routes.json
## Default gateways in force and configured, the source column, and both
## families on a netstack other than the default one.
$ orvixcli network ip route ipv4 list
Network    Netmask        Gateway    Interface  Source
---------  -------------  ---------  ---------  ------
default    0.0.0.0        192.0.2.1  pld0       DHCP
192.0.2.0  255.255.255.0  0.0.0.0    pld0       DHCP

$ orvixcli network ip route ipv4 list -N lab --formatter=json
[
  {
    "Network": "default",
    "Netmask": "0.0.0.0",
    "Gateway": "198.51.100.1",
    "Interface": "pld1",
    "Source": "MANUAL"
  },
  {
    "Network": "10.20.0.0",
    "Netmask": "255.255.0.0",
    "Gateway": "198.51.100.254",
    "Interface": "pld1",
    "Source": "MANUAL"
  },
  {
    "Network": "198.51.100.0",
    "Netmask": "255.255.255.0",
    "Gateway": "0.0.0.0",
    "Interface": "pld1",
    "Source": "MANUAL"
  }
]

$ orvixcli network ip route ipv6 list -N lab
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
default        ::                     2001:db8:20::1   pld1
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:99::  ffff:ffff:ffff::       2001:db8:20::fe  pld1

## A netstack without routes lists none.
$ orvixcli network ip route ipv4 list -N quiet
Network  Netmask  Gateway  Interface  Source
-------  -------  -------  ---------  ------

$ orvixcli network ip route ipv4 list -N quiet --formatter=json
[]

$ orvixcli network ip route ipv6 list -N quiet --formatter=simple

## The configured gateway (192.0.2.2) differs from the one in force
## (192.0.2.1); removing the default route with it clears the gateway.
$ orvixcli network ip route ipv4 remove -n default -g 192.0.2.2

$ orvixcli network ip route ipv4 list
Network    Netmask        Gateway  Interface  Source
---------  -------------  -------  ---------  ------
192.0.2.0  255.255.255.0  0.0.0.0  pld0       DHCP

## Nothing is left to match now.
$ orvixcli network ip route ipv4 remove -n default -g 192.0.2.1
! 192.0.2.1 is not a default route.
[1]

$ orvixcli network ip route ipv6 remove -n default -g 2001:db8:10::2

$ orvixcli network ip route ipv6 list
Network  Netmask  Gateway  Interface
-------  -------  -------  ---------

## Both families on another netstack; the default netstack is untouched.
$ orvixcli network ip route ipv4 remove -n default -g 198.51.100.1 -N lab

$ orvixcli network ip route ipv4 remove -n 10.20.0.0/16 -g 198.51.100.254 -N lab

$ orvixcli network ip route ipv4 add -n 10.30.0.0/16 -g 198.51.100.253 -N lab

$ orvixcli network ip route ipv4 list -N lab --formatter=simple
   Network: 10.30.0.0
   Netmask: 255.255.0.0
   Gateway: 198.51.100.253
   Interface: pld1
   Source: MANUAL

   Network: 198.51.100.0
   Netmask: 255.255.255.0
   Gateway: 0.0.0.0
   Interface: pld1
   Source: MANUAL

$ orvixcli network ip route ipv6 remove -n default -g 2001:db8:20::1 -N lab

$ orvixcli network ip route ipv6 remove -n 2001:db8:99::/48 -g 2001:db8:20::fe --netstack lab

$ orvixcli network ip route ipv6 add -n 2001:db8:98::/48 -g 2001:db8:20::fd -N lab

$ orvixcli network ip route ipv6 list -N lab
Network        Netmask                Gateway          Interface
-------------  ---------------------  ---------------  ---------
2001:db8:20::  ffff:ffff:ffff:ffff::  ::               pld1
2001:db8:98::  ffff:ffff:ffff::       2001:db8:20::fd  pld1

$ orvixcli network ip route ipv4 list --netstack=
Network    Netmask        Gateway  Interface  Source
---------  -------------  -------  ---------  ------
192.0.2.0  255.255.255.0  0.0.0.0  pld0       DHCP

$ orvixcli network ip route ipv6 list --netstack=
Network  Netmask  Gateway  Interface
-------  -------  -------  ---------
