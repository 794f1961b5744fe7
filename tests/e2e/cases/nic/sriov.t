## network sriovnic list: the SR-IOV capable NICs as nic list shows them,
## with fewer columns; a NIC without a PCI device reads "Pseudo".
@profile fixtures/nic/sriov.json
$ orvixcli network sriovnic list
Name    PCI Device    Driver  Link  Speed  Duplex  MAC Address        MTU   Description
------  ------------  ------  ----  -----  ------  -----------------  ----  -------------------------------------------------------------
hwnic4  0000:06:00.0  fwk25   Up    25000  Full    02:a1:00:00:30:05  9000  Fenwick Fabric Systems FW-25E 25GbE SR-IOV Network Controller
hwnic5  Pseudo        vfsim   Down  0      Half    02:a1:00:00:30:06  1500  Unknown Unknown

$ orvixcli network sriovnic list --formatter=json
[
  {
    "Name": "hwnic4",
    "PCI Device": "0000:06:00.0",
    "Driver": "fwk25",
    "Link": "Up",
    "Speed": 25000,
    "Duplex": "Full",
    "MAC Address": "02:a1:00:00:30:05",
    "MTU": 9000,
    "Description": "Fenwick Fabric Systems FW-25E 25GbE SR-IOV Network Controller"
  },
  {
    "Name": "hwnic5",
    "PCI Device": "Pseudo",
    "Driver": "vfsim",
    "Link": "Down",
    "Speed": 0,
    "Duplex": "Half",
    "MAC Address": "02:a1:00:00:30:06",
    "MTU": 1500,
    "Description": "Unknown Unknown"
  }
]

## network sriovnic vf list: the VFs of one SR-IOV NIC in id order.
$ orvixcli network sriovnic vf list -n hwnic4
VF ID  Active  PCI Address   Owner World ID
-----  ------  ------------  --------------
0      true    0000:06:00.1  1049601
1      false   0000:06:00.2  0
3      true    0000:06:00.4  1049733

$ orvixcli network sriovnic vf list -n hwnic4 --formatter=json
[
  {
    "VF ID": 0,
    "Active": true,
    "PCI Address": "0000:06:00.1",
    "Owner World ID": "1049601"
  },
  {
    "VF ID": 1,
    "Active": false,
    "PCI Address": "0000:06:00.2",
    "Owner World ID": "0"
  },
  {
    "VF ID": 3,
    "Active": true,
    "PCI Address": "0000:06:00.4",
    "Owner World ID": "1049733"
  }
]

$ orvixcli network sriovnic vf list -n hwnic5
VF ID  Active  PCI Address  Owner World ID
-----  ------  -----------  --------------

$ orvixcli network sriovnic vf list -n hwnic0
! There is no SRIOV Nic with name hwnic0
[1]

$ orvixcli network sriovnic vf list -n hwnic9
! There is no SRIOV Nic with name hwnic9
[1]

## network sriovnic vf stats: the name as typed and the VF ID, then the
## twenty counters.
$ orvixcli network sriovnic vf stats -n hwnic4 -v 3
   NIC Name: hwnic4
   VF ID: 3
   Rx Unicast Pkt: 88213
   Rx Unicast Bytes: 18446744073709551615
   Rx Multicast Pkts: 0
   Rx Multicast Bytes: 0
   Rx Broadcast Pkts: 0
   Rx Broadcast Bytes: 0
   Rx Out of Buffer drops: 0
   Rx Error drops: 0
   Rx LRO Pkts: 0
   Rx LRO Bytes: 0
   Tx Unicast Pkt: 70211
   Tx Unicast Bytes: 61299487
   Tx Multicast Pkts: 0
   Tx Multicast Bytes: 0
   Tx Broadcast Pkts: 0
   Tx Broadcast Bytes: 0
   Tx Errors: 0
   Tx Discards: 0
   Tx TSO Pkts: 412
   Tx TSO Bytes: 5980211

$ orvixcli network sriovnic vf stats -n hwnic4 -v 0 --formatter=json
[
  {
    "NIC Name": "hwnic4",
    "VF ID": 0,
    "Rx Unicast Pkt": 1,
    "Rx Unicast Bytes": 2,
    "Rx Multicast Pkts": 3,
    "Rx Multicast Bytes": 4,
    "Rx Broadcast Pkts": 5,
    "Rx Broadcast Bytes": 6,
    "Rx Out of Buffer drops": 7,
    "Rx Error drops": 8,
    "Rx LRO Pkts": 9,
    "Rx LRO Bytes": 10,
    "Tx Unicast Pkt": 11,
    "Tx Unicast Bytes": 12,
    "Tx Multicast Pkts": 13,
    "Tx Multicast Bytes": 14,
    "Tx Broadcast Pkts": 15,
    "Tx Broadcast Bytes": 16,
    "Tx Errors": 17,
    "Tx Discards": 18,
    "Tx TSO Pkts": 19,
    "Tx TSO Bytes": 20
  }
]

## An ID beyond 32 bits is not wrapped onto VF 3: the library does not know
## it. Nor a VF the NIC does not have, nor a negative ID.
$ orvixcli network sriovnic vf stats -n hwnic4 -v 4294967299
! Unable to get VF Stats. Error:NIC hwnic4 has no VF with ID 4294967299
[1]

$ orvixcli network sriovnic vf stats -n hwnic4 -v 2
! Unable to get VF Stats. Error:NIC hwnic4 has no VF with ID 2
[1]

$ orvixcli network sriovnic vf stats -n hwnic4 -v -253
! Unable to get VF Stats. Error:NIC hwnic4 has no VF with ID -253
[1]

$ orvixcli network sriovnic vf stats -n hwnic5 -v 0
! Unable to get VF Stats. Error:NIC hwnic5 has no VF with ID 0
[1]

$ orvixcli network sriovnic vf stats -n hwnic0 -v 0
! There is no SRIOV Nic with name hwnic0
[1]
