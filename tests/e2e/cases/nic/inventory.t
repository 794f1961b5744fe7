## network nic list: one row a NIC in the host's order. A NIC without a PCI
## device reads "Pseudo" with the description "Unknown Unknown". hwnic2 has
## a link partner but is administratively down: no link, no speed.
@profile fixtures/nic/inventory.json
$ orvixcli network nic list
Name    PCI Device    Driver  Admin Status  Link Status  Speed  Duplex  MAC Address        MTU   Description
------  ------------  ------  ------------  -----------  -----  ------  -----------------  ----  ------------------------------------------------------------------
hwnic0  0000:03:00.0  lrk1g   Up            Up           1000   Full    02:a1:00:00:10:01  1500  Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller
hwnic1  Pseudo        vmxsim  Down          Down         0      Half    02:a1:00:00:10:02  1500  Unknown Unknown
hwnic2  0000:04:00.0  cvx10   Down          Down         0      Full    02:a1:00:00:10:03  9000  Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter

## In JSON the speed and the MTU are numbers, and the "Link" field the table
## leaves out follows the hinted ones.
$ orvixcli network nic list --formatter=json
[
  {
    "Name": "hwnic0",
    "PCI Device": "0000:03:00.0",
    "Driver": "lrk1g",
    "Admin Status": "Up",
    "Link Status": "Up",
    "Speed": 1000,
    "Duplex": "Full",
    "MAC Address": "02:a1:00:00:10:01",
    "MTU": 1500,
    "Description": "Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller",
    "Link": "Up"
  },
  {
    "Name": "hwnic1",
    "PCI Device": "Pseudo",
    "Driver": "vmxsim",
    "Admin Status": "Down",
    "Link Status": "Down",
    "Speed": 0,
    "Duplex": "Half",
    "MAC Address": "02:a1:00:00:10:02",
    "MTU": 1500,
    "Description": "Unknown Unknown",
    "Link": "Down"
  },
  {
    "Name": "hwnic2",
    "PCI Device": "0000:04:00.0",
    "Driver": "cvx10",
    "Admin Status": "Down",
    "Link Status": "Down",
    "Speed": 0,
    "Duplex": "Full",
    "MAC Address": "02:a1:00:00:10:03",
    "MTU": 9000,
    "Description": "Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter",
    "Link": "Down"
  }
]

## network nic get: the generic settings in their order. Wake-on modes are
## shown in the NIC's order, a mode no word names as "None"; only modes of
## the NIC that supports wake-on are listed.
$ orvixcli network nic get -n hwnic0
   Name: hwnic0
   Supported Ports: TP, MII
   Supports Auto Negotiation: true
   Advertised Link Modes: 10baseT/Half, 100baseT/Full, 1000baseT/Full
   Advertised Auto Negotiation: true
   Cable Type: Twisted Pair
   PHY Address: 1
   Virtual Address: 
   Transceiver: internal
   Auto Negotiation: true
   Supports Wakeon: true
   Wakeon: PHY Activity, Unicast Messagess, MagicPacket(tm), Enable SecureOn(tm) Password for                            MagicPacket(tm), Unsupported, Disabled, None
   Current Message Level: 7
   Link Detected: true
   Supports Pause: true
   Pause Autonegotiate: true
   Pause RX: true
   Pause TX: false
   Link Status: Up
   Driver Info:
      Driver: lrk1g
      Version: 4.2.7
      Firmware Version: 1.63, 0x80000b3f
      Bus Info: 0000:03:00.0

## A NIC without pause support leaves the three pause fields out; without
## wake-on support "Wakeon" is "None"; without a message level it reads -1.
## A port code no word names is "UNKNOWN" among the supported ports and an
## empty cable type; an advertised mode of duplex auto ends in "Auto".
$ orvixcli network nic get --nic-name=hwnic1
   Name: hwnic1
   Supported Ports: FIBRE, UNKNOWN
   Supports Auto Negotiation: false
   Advertised Link Modes: 25000baseT/Auto
   Advertised Auto Negotiation: false
   Cable Type: 
   PHY Address: 0
   Virtual Address: vaddr-1
   Transceiver: external
   Auto Negotiation: false
   Supports Wakeon: false
   Wakeon: None
   Current Message Level: -1
   Link Detected: false
   Supports Pause: false
   Link Status: Down
   Driver Info:
      Driver: vmxsim
      Version: 0.3
      Firmware Version: 
      Bus Info: 

$ orvixcli network nic get -n hwnic1 --formatter=json
{
  "Name": "hwnic1",
  "Supported Ports": [
    "FIBRE",
    "UNKNOWN"
  ],
  "Supports Auto Negotiation": false,
  "Advertised Link Modes": [
    "25000baseT/Auto"
  ],
  "Advertised Auto Negotiation": false,
  "Cable Type": "",
  "PHY Address": 0,
  "Virtual Address": "vaddr-1",
  "Transceiver": "external",
  "Auto Negotiation": false,
  "Supports Wakeon": false,
  "Wakeon": [
    "None"
  ],
  "Current Message Level": -1,
  "Link Detected": false,
  "Supports Pause": false,
  "Link Status": "Down",
  "Driver Info": {
    "Driver": "vmxsim",
    "Version": "0.3",
    "Firmware Version": "",
    "Bus Info": ""
  }
}

$ orvixcli network nic get -n hwnic0 --formatter=json
{
  "Name": "hwnic0",
  "Supported Ports": [
    "TP",
    "MII"
  ],
  "Supports Auto Negotiation": true,
  "Advertised Link Modes": [
    "10baseT/Half",
    "100baseT/Full",
    "1000baseT/Full"
  ],
  "Advertised Auto Negotiation": true,
  "Cable Type": "Twisted Pair",
  "PHY Address": 1,
  "Virtual Address": "",
  "Transceiver": "internal",
  "Auto Negotiation": true,
  "Supports Wakeon": true,
  "Wakeon": [
    "PHY Activity",
    "Unicast Messagess",
    "MagicPacket(tm)",
    "Enable SecureOn(tm) Password for                            MagicPacket(tm)",
    "Unsupported",
    "Disabled",
    "None"
  ],
  "Current Message Level": 7,
  "Link Detected": true,
  "Supports Pause": true,
  "Pause Autonegotiate": true,
  "Pause RX": true,
  "Pause TX": false,
  "Link Status": "Up",
  "Driver Info": {
    "Driver": "lrk1g",
    "Version": "4.2.7",
    "Firmware Version": "1.63, 0x80000b3f",
    "Bus Info": "0000:03:00.0"
  }
}

## The name is shown as it was typed.
$ orvixcli network nic get -n hwnic9
! There is no pnic with name hwnic9
[1]
