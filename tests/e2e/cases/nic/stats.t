## network nic stats get and network nic vlan stats get / set on the default
## host: hwnic0 counts VLANs on its vSwitch0 uplink port, hwnic1 is a vSwitch0
## uplink without counting, hwnic2 is an uplink of the distributed switch
## only, hwnic4 of no switch.

## One record, the name as typed, the 23 counters in their order.
$ orvixcli network nic stats get -n hwnic0
NIC statistics for hwnic0
   Packets received: 48211934
   Packets sent: 31877602
   Bytes received: 39148094818
   Bytes sent: 20879830600
   Receive packets dropped: 535
   Transmit packets dropped: 0
   Multicast packets received: 229580
   Broadcast packets received: 507494
   Multicast packets sent: 39847
   Broadcast packets sent: 21251
   Total receive errors: 3
   Receive length errors: 0
   Receive over errors: 0
   Receive CRC errors: 3
   Receive frame errors: 0
   Receive FIFO errors: 0
   Receive missed errors: 0
   Total transmit errors: 0
   Transmit aborted errors: 0
   Transmit carrier errors: 0
   Transmit FIFO errors: 0
   Transmit heartbeat errors: 0
   Transmit window errors: 0
$ orvixcli network nic stats get --nic-name=hwnic1 --formatter=json
[
  {
    "Packets received": 20733518,
    "Packets sent": 18402276,
    "Bytes received": 16835621026,
    "Bytes sent": 12053492070,
    "Receive packets dropped": 230,
    "Transmit packets dropped": 0,
    "Multicast packets received": 98731,
    "Broadcast packets received": 218247,
    "Multicast packets sent": 23002,
    "Broadcast packets sent": 12268,
    "Total receive errors": 0,
    "Receive length errors": 0,
    "Receive over errors": 0,
    "Receive CRC errors": 0,
    "Receive frame errors": 0,
    "Receive FIFO errors": 0,
    "Receive missed errors": 0,
    "Total transmit errors": 0,
    "Transmit aborted errors": 0,
    "Transmit carrier errors": 0,
    "Transmit FIFO errors": 0,
    "Transmit heartbeat errors": 0,
    "Transmit window errors": 0,
    "NIC Name": "hwnic1"
  }
]

## A name the host does not have is the library's error.
$ orvixcli network nic stats get -n hwnic99
! Unable to get stats for NIC: NIC hwnic99 does not exist
[1]

## Per-VLAN counters, one record per VLAN in the order they were seen.
$ orvixcli network nic vlan stats get -n hwnic0
VLAN 0
   Packets received: 39120877
   Packets sent: 25511934

VLAN 20
   Packets received: 7734008
   Packets sent: 5120770

VLAN 30
   Packets received: 1357049
   Packets sent: 1244898
$ orvixcli network nic vlan stats get -n hwnic0 --formatter=json
[
  {
    "Packets received": 39120877,
    "Packets sent": 25511934,
    "VLAN ID": 0
  },
  {
    "Packets received": 7734008,
    "Packets sent": 5120770,
    "VLAN ID": 20
  },
  {
    "Packets received": 1357049,
    "Packets sent": 1244898,
    "VLAN ID": 30
  }
]

## Counting off: reported as disabled.
$ orvixcli network nic vlan stats get -n hwnic1
! VLAN stats are disabled for hwnic1 please enable them first.
[1]

## Switching counting on changes nothing visible until a VLAN is seen: the
## command cannot tell "on, nothing seen" from "off".
$ orvixcli network nic vlan stats set -n hwnic1 -e true
$ orvixcli network nic vlan stats get -n hwnic1
! VLAN stats are disabled for hwnic1 please enable them first.
[1]

## Switching it off drops the counters; switching it on again starts empty.
$ orvixcli network nic vlan stats set -n hwnic0 --enabled=false
$ orvixcli network nic vlan stats get -n hwnic0
! VLAN stats are disabled for hwnic0 please enable them first.
[1]
$ orvixcli network nic vlan stats set -n hwnic0 --enabled=true
$ orvixcli network nic vlan stats get -n hwnic0
! VLAN stats are disabled for hwnic0 please enable them first.
[1]

## Only uplinks of a standard switch count VLANs, whatever --enabled says.
$ orvixcli network nic vlan stats get -n hwnic2
! hwnic2 is not a valid NIC connected to any virtual switch.
[1]
$ orvixcli network nic vlan stats set -n hwnic2 -e true
! hwnic2 is not a valid NIC connected to any virtual switch.
[1]
$ orvixcli network nic vlan stats set -n hwnic4 -e false
! hwnic4 is not a valid NIC connected to any virtual switch.
[1]
$ orvixcli network nic vlan stats get -n HWNIC0
! HWNIC0 is not a valid NIC connected to any virtual switch.
[1]

## --enabled takes true or false and is required.
$ orvixcli network nic vlan stats set -n hwnic0 -e maybe
! orvixcli: Invalid value 'maybe' for --enabled: expected true or false
! Run 'orvixcli network nic vlan stats set --help' for its options.
[2]
$ orvixcli network nic vlan stats set -n hwnic0
! orvixcli: Missing required option --enabled
! Run 'orvixcli network nic vlan stats set --help' for its options.
[2]
