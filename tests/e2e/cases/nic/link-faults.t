## A change the library refuses is reported as it is and changes nothing.
@profile fixtures/nic/inventory.json
$ orvix-hostsim fault add PnicImpl::SetAdminUp --key hwnic0 --message "Device hwnic0 is busy"
1

$ orvixcli network nic down -n hwnic0
! Device hwnic0 is busy
[1]

$ orvixcli network nic up -n hwnic0
! Device hwnic0 is busy
[1]

$ orvix-hostsim fault add PnicImpl::SetPnicInfo --key hwnic0 --message "Settings of hwnic0 are locked"
2

$ orvixcli network nic set -n hwnic0 --port mii
! Settings of hwnic0 are locked
[1]

$ orvix-hostsim fault add PnicImpl::SetLinkSpeedDuplex --key hwnic0 --message "Link of hwnic0 cannot be forced"
3

$ orvixcli network nic set -n hwnic0 --speed 100 --duplex half
! Link of hwnic0 cannot be forced
[1]

$ orvixcli network nic set -n hwnic0 --auto
! Link of hwnic0 cannot be forced
[1]

$ orvix-hostsim fault add PnicImpl::RestartNegotiation --key hwnic0 --message "Negotiation of hwnic0 did not restart"
4

$ orvixcli network nic negotiate restart -n hwnic0
! Negotiation of hwnic0 did not restart
[1]

## hwnic0 is as it was.
$ orvixcli network nic list --formatter=csv
Name,PCI Device,Driver,Admin Status,Link Status,Speed,Duplex,MAC Address,MTU,Description
hwnic0,0000:03:00.0,lrk1g,Up,Up,1000,Full,02:a1:00:00:10:01,1500,Larkspur Networks Inc. LN210 Dual Port Gigabit Ethernet Controller
hwnic1,Pseudo,vmxsim,Down,Down,0,Half,02:a1:00:00:10:02,1500,Unknown Unknown
hwnic2,0000:04:00.0,cvx10,Down,Down,0,Full,02:a1:00:00:10:03,9000,Corvid Optics Ltd. CV-10SX 10-Gigabit SFP+ Network Adapter

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
