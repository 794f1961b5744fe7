## IPv4 routes of the default host: listing in every formatter, adding and
## removing routes, the word "default", and the library's refusals.
$ orvixcli network ip route ipv4 list
Network        Netmask          Gateway      Interface  Source
-------------  ---------------  -----------  ---------  ------
default        0.0.0.0          192.0.2.1    pld0       MANUAL
192.0.2.0      255.255.255.0    0.0.0.0      pld0       MANUAL
198.51.100.0   255.255.255.0    0.0.0.0      pld1       DHCP
203.0.113.128  255.255.255.128  192.0.2.254  pld0       MANUAL

$ orvixcli network ip route ipv4 list --formatter=simple
   Network: default
   Netmask: 0.0.0.0
   Gateway: 192.0.2.1
   Interface: pld0
   Source: MANUAL

   Network: 192.0.2.0
   Netmask: 255.255.255.0
   Gateway: 0.0.0.0
   Interface: pld0
   Source: MANUAL

   Network: 198.51.100.0
   Netmask: 255.255.255.0
   Gateway: 0.0.0.0
   Interface: pld1
   Source: DHCP

   Network: 203.0.113.128
   Netmask: 255.255.255.128
   Gateway: 192.0.2.254
   Interface: pld0
   Source: MANUAL

$ orvixcli network ip route ipv4 list --formatter=json
[
  {
    "Network": "default",
    "Netmask": "0.0.0.0",
    "Gateway": "192.0.2.1",
    "Interface": "pld0",
    "Source": "MANUAL"
  },
  {
    "Network": "192.0.2.0",
    "Netmask": "255.255.255.0",
    "Gateway": "0.0.0.0",
    "Interface": "pld0",
    "Source": "MANUAL"
  },
  {
    "Network": "198.51.100.0",
    "Netmask": "255.255.255.0",
    "Gateway": "0.0.0.0",
    "Interface": "pld1",
    "Source": "DHCP"
  },
  {
    "Network": "203.0.113.128",
    "Netmask": "255.255.255.128",
    "Gateway": "192.0.2.254",
    "Interface": "pld0",
    "Source": "MANUAL"
  }
]

## Another netstack has its own routes; an empty value means the default one.
$ orvixcli network ip route ipv4 list -N migrix
Network      Netmask        Gateway      Interface  Source
-----------  -------------  -----------  ---------  ------
default      0.0.0.0        203.0.113.1  pld2       MANUAL
203.0.113.0  255.255.255.0  0.0.0.0      pld2       MANUAL

$ orvixcli network ip route ipv4 list --netstack=
Network        Netmask          Gateway      Interface  Source
-------------  ---------------  -----------  ---------  ------
default        0.0.0.0          192.0.2.1    pld0       MANUAL
192.0.2.0      255.255.255.0    0.0.0.0      pld0       MANUAL
198.51.100.0   255.255.255.0    0.0.0.0      pld1       DHCP
203.0.113.128  255.255.255.128  192.0.2.254  pld0       MANUAL

$ orvixcli network ip route ipv4 list --netstack nowhere
! Netstack instance nowhere does not exist
[1]

## A new route takes its place in the host's order, behind the default route.
$ orvixcli network ip route ipv4 add --network 10.10.0.0/16 --gateway 192.0.2.99

$ orvixcli network ip route ipv4 add -n 10.10.0.0/16 -g 192.0.2.99
! Route to 10.10.0.0/16 via 192.0.2.99 already exists on netstack defaultTcpipStack
[1]

$ orvixcli network ip route ipv4 add -n 10.11.0.0/16 -g 10.9.9.9
! Gateway 10.9.9.9 is not reachable from any interface of netstack defaultTcpipStack
[1]

$ orvixcli network ip route ipv4 add -n 10.12.0.0/16 -g 203.0.113.99 -N migrix

$ orvixcli network ip route ipv4 add -n 10.13.0.0/16 -g 192.0.2.99 -N nowhere
! Netstack instance nowhere does not exist
[1]

$ orvixcli network ip route ipv4 list
Network        Netmask          Gateway      Interface  Source
-------------  ---------------  -----------  ---------  ------
default        0.0.0.0          192.0.2.1    pld0       MANUAL
10.10.0.0      255.255.0.0      192.0.2.99   pld0       MANUAL
192.0.2.0      255.255.255.0    0.0.0.0      pld0       MANUAL
198.51.100.0   255.255.255.0    0.0.0.0      pld1       DHCP
203.0.113.128  255.255.255.128  192.0.2.254  pld0       MANUAL

$ orvixcli network ip route ipv4 list -N migrix
Network      Netmask        Gateway       Interface  Source
-----------  -------------  ------------  ---------  ------
default      0.0.0.0        203.0.113.1   pld2       MANUAL
10.12.0.0    255.255.0.0    203.0.113.99  pld2       MANUAL
203.0.113.0  255.255.255.0  0.0.0.0       pld2       MANUAL

## Bad text is reported by the library's parsers, the gateway first; the
## word is "default" exactly.
$ orvixcli network ip route ipv4 add -n 10.14.0.0/33 -g 192.0.2.99
! Invalid IPv4 network: '10.14.0.0/33'
[1]

$ orvixcli network ip route ipv4 add -n 10.14.0.0/16 -g 192.0.2.300
! Invalid IPv4 address: '192.0.2.300'
[1]

$ orvixcli network ip route ipv4 add -n nonsense -g nonsense
! Invalid IPv4 address: 'nonsense'
[1]

$ orvixcli network ip route ipv4 add -n Default -g 192.0.2.99
! Invalid IPv4 network: 'Default'
[1]

$ orvixcli network ip route ipv4 add -n 10.14.0.0/16 -g 2001:db8:10::1
! Invalid IPv4 address: '2001:db8:10::1'
[1]

$ orvixcli network ip route ipv4 remove -n 10.10.0.0/16 -g 192.0.2.99

$ orvixcli network ip route ipv4 remove -n 10.10.0.0/16 -g 192.0.2.99
! Route to 10.10.0.0/16 via 192.0.2.99 does not exist on netstack defaultTcpipStack
[1]

$ orvixcli network ip route ipv4 remove -n 203.0.113.128/25 -g 192.0.2.253
! Route to 203.0.113.128/25 via 192.0.2.253 does not exist on netstack defaultTcpipStack
[1]

## Removing the default route with a gateway that is neither the current nor
## the configured one reports it and changes nothing.
$ orvixcli network ip route ipv4 remove -n default -g 192.0.2.9
! 192.0.2.9 is not a default route.
[1]

$ orvixcli network ip route ipv4 remove -n default -g 192.0.2.9 --formatter=json
true
! 192.0.2.9 is not a default route.
[1]

$ orvixcli network ip route ipv4 list
Network        Netmask          Gateway      Interface  Source
-------------  ---------------  -----------  ---------  ------
default        0.0.0.0          192.0.2.1    pld0       MANUAL
192.0.2.0      255.255.255.0    0.0.0.0      pld0       MANUAL
198.51.100.0   255.255.255.0    0.0.0.0      pld1       DHCP
203.0.113.128  255.255.255.128  192.0.2.254  pld0       MANUAL

## With the current gateway it clears the default gateway.
$ orvixcli network ip route ipv4 remove -n default -g 192.0.2.1

$ orvixcli network ip route ipv4 list
Network        Netmask          Gateway      Interface  Source
-------------  ---------------  -----------  ---------  ------
192.0.2.0      255.255.255.0    0.0.0.0      pld0       MANUAL
198.51.100.0   255.255.255.0    0.0.0.0      pld1       DHCP
203.0.113.128  255.255.255.128  192.0.2.254  pld0       MANUAL

## "default" added back is listed as the default route again.
$ orvixcli network ip route ipv4 add -n default -g 192.0.2.1

$ orvixcli network ip route ipv4 list --formatter=simple
   Network: default
   Netmask: 0.0.0.0
   Gateway: 192.0.2.1
   Interface: pld0
   Source: MANUAL

   Network: 192.0.2.0
   Netmask: 255.255.255.0
   Gateway: 0.0.0.0
   Interface: pld0
   Source: MANUAL

   Network: 198.51.100.0
   Netmask: 255.255.255.0
   Gateway: 0.0.0.0
   Interface: pld1
   Source: DHCP

   Network: 203.0.113.128
   Netmask: 255.255.255.128
   Gateway: 192.0.2.254
   Interface: pld0
   Source: MANUAL

## The default network given as text is the default network too.
$ orvixcli network ip route ipv4 remove -n 0.0.0.0/0 -g 192.0.2.1 --formatter=json
true

$ orvixcli network ip route ipv4 list -N ""
Network        Netmask          Gateway      Interface  Source
-------------  ---------------  -----------  ---------  ------
192.0.2.0      255.255.255.0    0.0.0.0      pld0       MANUAL
198.51.100.0   255.255.255.0    0.0.0.0      pld1       DHCP
203.0.113.128  255.255.255.128  192.0.2.254  pld0       MANUAL
