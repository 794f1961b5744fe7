## network ip interface set: the enabled state and the MTU of one interface,
## found by its exact name.
$ orvixcli network ip interface set -i pld0 --enabled false

$ orvixcli network ip interface set -i pld1 -e true --mtu 1280

$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,false,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554436
pld1,02:a1:01:00:00:02,true,dvSwitch0,N/A,defaultTcpipStack,dvSwitch0,6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4,10,1717243002,N/A,N/A,N/A,1280,65535,67108868
pld2,02:a1:01:00:00:03,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554437

$ orvixcli network ip interface set -i pld0 -e true -m 9000

$ orvixcli network ip interface list --formatter=json
[
  {
    "Name": "pld0",
    "MAC Address": "02:a1:01:00:00:01",
    "Enabled": true,
    "Portset": "vSwitch0",
    "Portgroup": "Management Network",
    "Netstack Instance": "defaultTcpipStack",
    "VDS Name": "N/A",
    "VDS UUID": "N/A",
    "VDS Port": "N/A",
    "VDS Connection": -1,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 9000,
    "TSO MSS": 65535,
    "Port ID": 33554436
  },
  {
    "Name": "pld1",
    "MAC Address": "02:a1:01:00:00:02",
    "Enabled": true,
    "Portset": "dvSwitch0",
    "Portgroup": "N/A",
    "Netstack Instance": "defaultTcpipStack",
    "VDS Name": "dvSwitch0",
    "VDS UUID": "6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4",
    "VDS Port": "10",
    "VDS Connection": 1717243002,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 1280,
    "TSO MSS": 65535,
    "Port ID": 67108868
  },
  {
    "Name": "pld2",
    "MAC Address": "02:a1:01:00:00:03",
    "Enabled": true,
    "Portset": "vSwitch0",
    "Portgroup": "Migration",
    "Netstack Instance": "migrix",
    "VDS Name": "N/A",
    "VDS UUID": "N/A",
    "VDS Port": "N/A",
    "VDS Connection": -1,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 1500,
    "TSO MSS": 65535,
    "Port ID": 33554437
  }
]

## Only the name: nothing changes, and the result is still success.
$ orvixcli network ip interface set -i pld0

## A negative MTU is refused before anything changes, the enabled state
## included.
$ orvixcli network ip interface set -i pld0 -e false --mtu -1
! MTU size should be a positive value
[1]

## 0 and every other value go to the library whole, which refuses those out
## of range; a value past 32 bits is not cut down to one that fits.
$ orvixcli network ip interface set -i pld0 --mtu 0
! Invalid MTU value 0 for interface pld0: must be between 1280 and 9000
[1]

$ orvixcli network ip interface set -i pld0 --mtu 1279
! Invalid MTU value 1279 for interface pld0: must be between 1280 and 9000
[1]

$ orvixcli network ip interface set -i pld0 --mtu 9001
! Invalid MTU value 9001 for interface pld0: must be between 1280 and 9000
[1]

$ orvixcli network ip interface set -i pld0 --mtu 4294968796
! Invalid MTU value 4294968796 for interface pld0: must be between 1280 and 9000
[1]

$ orvixcli network ip interface set -i pld0 --mtu -9223372036854775808
! MTU size should be a positive value
[1]

$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,9000,65535,33554436
pld1,02:a1:01:00:00:02,true,dvSwitch0,N/A,defaultTcpipStack,dvSwitch0,6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4,10,1717243002,N/A,N/A,N/A,1280,65535,67108868
pld2,02:a1:01:00:00:03,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554437

## Names are compared exactly; any text is looked up.
$ orvixcli network ip interface set -i PLD0 -e false
! Unable to find an interface with name PLD0
[1]

$ orvixcli network ip interface set -i pld9 --mtu 1500
! Unable to find an interface with name pld9
[1]

$ orvixcli network ip interface set -i "" -e false
! Unable to find an interface with name 
[1]

## Options the framework refuses.
$ orvixcli network ip interface set -e false
! orvixcli: Missing required option --interface-name
! Run 'orvixcli network ip interface set --help' for its options.
[2]

$ orvixcli network ip interface set -i pld0 --mtu 15x0
! orvixcli: Invalid value '15x0' for --mtu: expected an integer
! Run 'orvixcli network ip interface set --help' for its options.
[2]

$ orvixcli network ip interface set -i pld0 --enabled maybe
! orvixcli: Invalid value 'maybe' for --enabled: expected true or false
! Run 'orvixcli network ip interface set --help' for its options.
[2]
