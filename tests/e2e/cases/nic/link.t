## network nic up and down change the administrative state, which the next
## process sees; a NIC down has link status Down even with a link partner.
@profile fixtures/nic/inventory.json
$ orvixcli network nic down -n hwnic0

$ orvixcli network nic list
Name    PCI Device    Driver  Admin Status  Link Status  Speed  Duplex  MAC Address        MTU   Description
------  ------------  ------  ------------  -----------  -----  ------  -----------------  ----  ------------------------------------------------------------------
hwnic0  0000:03:00.0  lrk1g   Down          Down         0      Full    02:a1:00:00:10:01  1500  Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller
hwnic1  Pseudo        vmxsim  Down          Down         0      Half    02:a1:00:00:10:02  1500  Unknown Unknown
hwnic2  0000:04:00.0  cvx10   Down          Down         0      Full    02:a1:00:00:10:03  9000  Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter

$ orvixcli network nic up --nic-name=hwnic2

$ orvixcli network nic up -n hwnic0 --formatter=json
true

$ orvixcli network nic list --formatter=csv
Name,PCI Device,Driver,Admin Status,Link Status,Speed,Duplex,MAC Address,MTU,Description
hwnic0,0000:03:00.0,lrk1g,Up,Up,1000,Full,02:a1:00:00:10:01,1500,Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller
hwnic1,Pseudo,vmxsim,Down,Down,0,Half,02:a1:00:00:10:02,1500,Unknown Unknown
hwnic2,0000:04:00.0,cvx10,Up,Up,10000,Full,02:a1:00:00:10:03,9000,Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter

$ orvixcli network nic down -n hwnic9
! There is no pnic with name hwnic9
[1]

$ orvixcli network nic up -n hwnic9
! There is no pnic with name hwnic9
[1]

## network nic set: without any option there is nothing to change.
$ orvixcli network nic set -n hwnic0
! There is no change for nic hwnic0
[1]

## Speed and duplex go together, and this is checked before the NIC is
## looked up, so a wrong name still gets the speed and duplex message.
$ orvixcli network nic set -n hwnic9 --speed 1000
! The --speed and --duplex options must be specified together
[1]

$ orvixcli network nic set -n hwnic0 --duplex full
! The --speed and --duplex options must be specified together
[1]

$ orvixcli network nic set -n hwnic9 --speed 1000 --duplex full --auto
! The options --speed and --duplex cannot be specified with the --auto option.
[1]

$ orvixcli network nic set -n hwnic9 --auto
! There is no pnic with name hwnic9
[1]

## The port hwnic0 is already on is no change, alone; with a speed and a
## duplex only the link changes.
$ orvixcli network nic set -n hwnic0 --port tp
! There is no change for nic hwnic0
[1]

$ orvixcli network nic set -n hwnic0 --port tp --speed 100 --duplex full

## A fixed speed turns autonegotiation off.
$ orvixcli network nic list --formatter=csv
Name,PCI Device,Driver,Admin Status,Link Status,Speed,Duplex,MAC Address,MTU,Description
hwnic0,0000:03:00.0,lrk1g,Up,Up,100,Full,02:a1:00:00:10:01,1500,Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller
hwnic1,Pseudo,vmxsim,Down,Down,0,Half,02:a1:00:00:10:02,1500,Unknown Unknown
hwnic2,0000:04:00.0,cvx10,Up,Up,10000,Full,02:a1:00:00:10:03,9000,Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter

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
   Auto Negotiation: false
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

## --auto alone turns autonegotiation back on, at the best advertised mode,
## even though no generic option changed.
$ orvixcli network nic set -n hwnic0 --auto

$ orvixcli network nic list --formatter=csv
Name,PCI Device,Driver,Admin Status,Link Status,Speed,Duplex,MAC Address,MTU,Description
hwnic0,0000:03:00.0,lrk1g,Up,Up,1000,Full,02:a1:00:00:10:01,1500,Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller
hwnic1,Pseudo,vmxsim,Down,Down,0,Half,02:a1:00:00:10:02,1500,Unknown Unknown
hwnic2,0000:04:00.0,cvx10,Up,Up,10000,Full,02:a1:00:00:10:03,9000,Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter

$ orvixcli network nic get -n hwnic0 --formatter=keyvalue
NICInfo.Name=hwnic0
NICInfo.Supported Ports[0]=TP
NICInfo.Supported Ports[1]=MII
NICInfo.Supports Auto Negotiation=true
NICInfo.Advertised Link Modes[0]=10baseT/Half
NICInfo.Advertised Link Modes[1]=100baseT/Full
NICInfo.Advertised Link Modes[2]=1000baseT/Full
NICInfo.Advertised Auto Negotiation=true
NICInfo.Cable Type=Twisted Pair
NICInfo.PHY Address=1
NICInfo.Virtual Address=
NICInfo.Transceiver=internal
NICInfo.Auto Negotiation=true
NICInfo.Supports Wakeon=true
NICInfo.Wakeon[0]=PHY Activity
NICInfo.Wakeon[1]=Unicast Messagess
NICInfo.Wakeon[2]=MagicPacket(tm)
NICInfo.Wakeon[3]=Enable SecureOn(tm) Password for                            MagicPacket(tm)
NICInfo.Wakeon[4]=Unsupported
NICInfo.Wakeon[5]=Disabled
NICInfo.Wakeon[6]=None
NICInfo.Current Message Level=7
NICInfo.Link Detected=true
NICInfo.Supports Pause=true
NICInfo.Pause Autonegotiate=true
NICInfo.Pause RX=true
NICInfo.Pause TX=false
NICInfo.Link Status=Up
NICInfo.Driver Info.Driver=lrk1g
NICInfo.Driver Info.Version=4.2.7
NICInfo.Driver Info.Firmware Version=1.63, 0x80000b3f
NICInfo.Driver Info.Bus Info=0000:03:00.0

## A PHY address of -1 keeps the current one; 0 and other negative values are
## refused before anything is written.
$ orvixcli network nic set -n hwnic0 --phy-address -1
! There is no change for nic hwnic0
[1]

$ orvixcli network nic set -n hwnic0 --phy-address 0
! Invalid PHY address value.
[1]

$ orvixcli network nic set -n hwnic0 --phy-address -7 --port mii
! Invalid PHY address value.
[1]

## A value too large for the NIC's field reaches the library whole and is
## refused there, rather than wrapped onto a small one.
$ orvixcli network nic set -n hwnic0 --phy-address 4294967297
! Invalid PHY address value 4294967297 for NIC hwnic0: must be between 0 and 2147483647
[1]

$ orvixcli network nic set -n hwnic0 --message-level 4294967296
! Invalid message level value 4294967296 for NIC hwnic0: must be between 0 and 4294967295
[1]

$ orvixcli network nic set -n hwnic0 --message-level -1
! Invalid message level value -1 for NIC hwnic0: must be between 0 and 4294967295
[1]

## Nothing of the refused changes was written.
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

## Wake-on letters replace the NIC's modes in the order typed, and always
## count as a change; `d` passes the option's pattern but is no mode.
$ orvixcli network nic set -n hwnic0 --wake-on-lan pg

$ orvixcli network nic set -n hwnic0 -w pg

$ orvixcli network nic get -n hwnic0 --formatter=csv
Name,Supported Ports,Supports Auto Negotiation,Advertised Link Modes,Advertised Auto Negotiation,Cable Type,PHY Address,Virtual Address,Transceiver,Auto Negotiation,Supports Wakeon,Wakeon,Current Message Level,Link Detected,Supports Pause,Pause Autonegotiate,Pause RX,Pause TX,Link Status,Driver Info
hwnic0,"TP,MII",true,"10baseT/Half,100baseT/Full,1000baseT/Full",true,Twisted Pair,1,,internal,true,true,"PHY Activity,MagicPacket(tm)",7,true,true,true,true,false,Up,"{Driver: lrk1g, Version: 4.2.7, Firmware Version: 1.63, 0x80000b3f, Bus Info: 0000:03:00.0}"

$ orvixcli network nic set -n hwnic0 --wake-on-lan pgd
! Invalid wol value.
[1]

$ orvixcli network nic set -n hwnic0 --wake-on-lan x
! orvixcli: Invalid value 'x' for --wake-on-lan: it must match [pumbagsd]+
! Run 'orvixcli network nic set --help' for its options.
[2]

$ orvixcli network nic set -n hwnic1 --wake-on-lan p
! Not Support wol.
[1]

$ orvixcli network nic set -n hwnic1 --message-level 3
! Not Support msglvl.
[1]

## Every generic option at once, visible to the next process.
$ orvixcli network nic set -n hwnic0 -p mii -P 5 -V vaddr-9 -t external -l 65535 -w bums

$ orvixcli network nic get -n hwnic0
   Name: hwnic0
   Supported Ports: TP, MII
   Supports Auto Negotiation: true
   Advertised Link Modes: 10baseT/Half, 100baseT/Full, 1000baseT/Full
   Advertised Auto Negotiation: true
   Cable Type: MII
   PHY Address: 5
   Virtual Address: vaddr-9
   Transceiver: external
   Auto Negotiation: true
   Supports Wakeon: true
   Wakeon: Broadcast Messages, Unicast Messagess, Multicast Messages, Enable SecureOn(tm) Password for                            MagicPacket(tm)
   Current Message Level: 65535
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

## An unknown name, once the options are consistent.
$ orvixcli network nic set -n hwnic9 --port tp
! There is no pnic with name hwnic9
[1]
