## network ip neighbor remove: on an interface, on a whole netstack, and
## the interface's own netstack winning over --netstack.
$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.53 -i pld0

$ orvixcli network ip neighbor list -v 4 -i pld0 --formatter=simple
   Neighbor: 192.0.2.1
   Mac Address: 02:a1:fe:00:01:01
   Pldnic: pld0
   Expiry: 1187 sec
   State: 
   Type: Dynamic

   Neighbor: 192.0.2.254
   Mac Address: 02:a1:fe:00:01:fe
   Pldnic: pld0
   Expiry: 0 sec
   State: 
   Type: Static

   Neighbor: 192.0.2.21
   Mac Address: 02:a1:01:00:00:01
   Pldnic: pld0
   Expiry: -1 sec
   State: 
   Type: Local

   Neighbor: 192.0.2.80
   Mac Address: 02:a1:fe:00:01:50
   Pldnic: pld0
   Expiry: 1020 sec
   State: 
   Type: Dynamic

   Neighbor: 192.0.2.90
   Mac Address: 02:a1:fe:00:01:5a
   Pldnic: pld0
   Expiry: 347 sec
   State: 
   Type: Dynamic

   Neighbor: 192.0.2.200
   Mac Address: 02:a1:fe:00:01:c8
   Pldnic: pld0
   Expiry: 58 sec
   State: 
   Type: Dynamic

## pld2 is on migrix: its neighbor is found there although the default
## netstack is named.
$ orvixcli network ip neighbor remove -v 4 -a 203.0.113.22 -i pld2 -N defaultTcpipStack

$ orvixcli network ip neighbor list -N migrix
Neighbor         Mac Address        Pldnic  Expiry    State      Type
---------------  -----------------  ------  --------  ---------  -------
203.0.113.1      02:a1:fe:00:03:01  pld2    1160 sec             Dynamic
2001:db8:30::1   02:a1:fe:00:03:01  pld2    22 sec    Reachable  Router
2001:db8:30::22  02:a1:01:00:10:03  pld2    4 sec     Delay      Dynamic

## Without an interface the named netstack is searched, all of it.
$ orvixcli network ip neighbor remove -v 4 -a 203.0.113.1 -N defaultTcpipStack
! No neighbor 203.0.113.1 on netstack defaultTcpipStack
[1]

$ orvixcli network ip neighbor remove --version 4 --neighbor-addr 203.0.113.1 --netstack migrix

$ orvixcli network ip neighbor list -N migrix --formatter=json
[
  {
    "Neighbor": "2001:db8:30::1",
    "Mac Address": "02:a1:fe:00:03:01",
    "Pldnic": "pld2",
    "Expiry": 22,
    "State": "Reachable",
    "Type": "Router"
  },
  {
    "Neighbor": "2001:db8:30::22",
    "Mac Address": "02:a1:01:00:10:03",
    "Pldnic": "pld2",
    "Expiry": 4,
    "State": "Delay",
    "Type": "Dynamic"
  }
]

$ orvixcli network ip neighbor remove -v 6 -a 2001:db8:20::1

$ orvixcli network ip neighbor list -v 6
Neighbor          Mac Address        Pldnic  Expiry  State       Type
----------------  -----------------  ------  ------  ----------  -------
2001:db8:10::1    02:a1:fe:00:01:01  pld0    27 sec  Reachable   Router
2001:db8:10::53   02:a1:fe:00:01:35  pld0    0 sec   Stale       Dynamic
2001:db8:10::21   02:a1:01:00:00:01  pld0    0 sec   Reachable   Local
2001:db8:10::80   02:a1:fe:00:01:50  pld0    30 sec  Reachable   Dynamic
2001:db8:10::90   00:00:00:00:00:00  pld0    3 sec   Incomplete  Dynamic
2001:db8:10::fe   02:a1:fe:00:01:fe  pld0    5 sec   Probe       Router
2001:db8:10::200  02:a1:fe:00:01:c8  pld0    0 sec   Stale       Dynamic
2001:db8:20::9    02:a1:fe:00:02:09  pld1    0 sec   Reachable   Static
2001:db8:20::21   02:a1:01:00:00:02  pld1    0 sec   Reachable   Local

## Refusals: an interface the host does not have, an address that is not
## one, an address that is not there, a version that is not 4 or 6, and a
## missing address.
$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.1 -i pld9
! Unable to find a Pallad interface with the name pld9
[1]

$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.300
! Invalid IPv4 address: '192.0.2.300'
[1]

$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.99 -i pld0
! No neighbor 192.0.2.99 on interface pld0 of netstack defaultTcpipStack
[1]

$ orvixcli network ip neighbor remove -v all -a 192.0.2.1
! orvixcli: Invalid value 'all' for --version: it must be one of 4, 6
! Run 'orvixcli network ip neighbor remove --help' for its options.
[2]

$ orvixcli network ip neighbor remove -v 4
! orvixcli: Missing required option --neighbor-addr
! Run 'orvixcli network ip neighbor remove --help' for its options.
[2]

## With IPv6 off nothing is removed, and the answer is still true.
$ orvixcli network ip set --ipv6-enabled=false

$ orvixcli network ip neighbor remove -v 6 -a 2001:db8:10::1

$ orvixcli network ip set --ipv6-enabled=true

$ orvixcli network ip neighbor list -v 6 -i pld0
Neighbor          Mac Address        Pldnic  Expiry  State       Type
----------------  -----------------  ------  ------  ----------  -------
2001:db8:10::1    02:a1:fe:00:01:01  pld0    27 sec  Reachable   Router
2001:db8:10::53   02:a1:fe:00:01:35  pld0    0 sec   Stale       Dynamic
2001:db8:10::21   02:a1:01:00:00:01  pld0    0 sec   Reachable   Local
2001:db8:10::80   02:a1:fe:00:01:50  pld0    30 sec  Reachable   Dynamic
2001:db8:10::90   00:00:00:00:00:00  pld0    3 sec   Incomplete  Dynamic
2001:db8:10::fe   02:a1:fe:00:01:fe  pld0    5 sec   Probe       Router
2001:db8:10::200  02:a1:fe:00:01:c8  pld0    0 sec   Stale       Dynamic
