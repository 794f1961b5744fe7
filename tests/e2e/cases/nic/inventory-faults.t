## The library's failures: nic list reports them behind its own words, nic
## get as they are. A fault keyed to one NIC leaves the others alone.
@profile fixtures/nic/inventory.json
$ orvix-hostsim fault add NetworkInfoImpl::GetPnics --message "NIC table busy" --count 1
1

$ orvixcli network nic list
! Unable to list NICs.  Error was NIC table busy
[1]

## The fault was armed for one call only.
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

$ orvix-hostsim fault add PnicImpl::GetPnicInfo --key hwnic0 --message "Driver of hwnic0 timed out"
2

$ orvixcli network nic get -n hwnic0
! Driver of hwnic0 timed out
[1]

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

## Faults of the other two reads of nic get.
$ orvix-hostsim fault clear

$ orvix-hostsim fault add PnicImpl::GetPauseParams --key hwnic1 --message "Pause query failed"
3

$ orvixcli network nic get -n hwnic1
! Pause query failed
[1]

$ orvix-hostsim fault add PnicImpl::GetDriverInfo --key hwnic0 --message "Driver info unavailable"
4

$ orvixcli network nic get -n hwnic0
! Driver info unavailable
[1]
