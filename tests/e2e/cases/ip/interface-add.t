## network ip interface add: the connection point, the options' checks in
## their order, the library's refusals, and interfaces that are made.
@profile fixtures/ip/interface-points.json

## A port group, or a distributed switch together with a port on it: every
## other choice is refused with one message and adds nothing.
$ orvixcli network ip interface add
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface add --dvs-name dvSwitch1
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface add --dvport-id 6
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface add -p Spare -P 6
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface add -p Spare -s dvSwitch1
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface add -p Spare -s dvSwitch1 -P 6
! Only one connection point can be specified, vswitch port group or DVPort.
[1]

## The connection point is checked before the MAC address, and the MAC
## address before the port group or switch is looked up.
$ orvixcli network ip interface add -s dvSwitch1 -M nonsense
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface add -p NoSuchGroup --mac-address 02:a1:01:00:00
! Invalid unicast MAC address specified.
[1]

$ orvixcli network ip interface add -s dvSwitch9 -P 6 -M 02-a1-01-00-00-zz
! Invalid unicast MAC address specified.
[1]

## Points the host does not have.
$ orvixcli network ip interface add -p NoSuchGroup
! Invalid vswitch port group or DVPort parameters.
[1]

$ orvixcli network ip interface add -p "management network"
! Invalid vswitch port group or DVPort parameters.
[1]

$ orvixcli network ip interface add -s dvSwitch9 -P 6
! Unable to retrieve DVS info by specified DVS name dvSwitch9. Error was: no such distributed switch
[1]

$ orvixcli network ip interface add -s dvSwitch1 -P 99
! Invalid vswitch port group or DVPort parameters.
[1]

## Names are pld0 to pld255, without leading zeros; the MTU is 1280 to 9000.
$ orvixcli network ip interface add -p Spare -i pld256
! orvixcli: Invalid value 'pld256' for --interface-name: it must match pld([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])
! Run 'orvixcli network ip interface add --help' for its options.
[2]

$ orvixcli network ip interface add -p Spare -i pld01
! orvixcli: Invalid value 'pld01' for --interface-name: it must match pld([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])
! Run 'orvixcli network ip interface add --help' for its options.
[2]

$ orvixcli network ip interface add -p Spare -i PLD1
! orvixcli: Invalid value 'PLD1' for --interface-name: it must match pld([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])
! Run 'orvixcli network ip interface add --help' for its options.
[2]

$ orvixcli network ip interface add -p Spare --mtu 1279
! orvixcli: Value 1279 for --mtu is out of range: it must be between 1280 and 9000
! Run 'orvixcli network ip interface add --help' for its options.
[2]

$ orvixcli network ip interface add -p Spare --mtu 9001
! orvixcli: Value 9001 for --mtu is out of range: it must be between 1280 and 9000
! Run 'orvixcli network ip interface add --help' for its options.
[2]

## What the library refuses.
$ orvixcli network ip interface add -p Spare -i pld0
! Unable to add Pallad network interface. Error was : Interface pld0 already exists
[1]

$ orvixcli network ip interface add -p "Management Network"
! Unable to add Pallad network interface. Error was : The connection point is already used by interface pld0
[1]

$ orvixcli network ip interface add -s dvSwitch1 -P 5
! Unable to add Pallad network interface. Error was : The connection point is already used by interface pld1
[1]

$ orvixcli network ip interface add -p Spare -M 02:A1:01:00:00:01
! Unable to add Pallad network interface. Error was : MAC address 02:a1:01:00:00:01 is already used by interface pld0
[1]

$ orvixcli network ip interface add -p Spare -M 03:a1:01:00:00:09
! Unable to add Pallad network interface. Error was : MAC address 03:a1:01:00:00:09 is not a unicast address
[1]

$ orvixcli network ip interface add -p Spare -N noSuchStack
! Unable to add Pallad network interface. Error was : Netstack instance noSuchStack does not exist
[1]

## None of it added anything.
$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554434
pld1,02:a1:01:00:00:02,true,dvSwitch1,N/A,defaultTcpipStack,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,5,1700000005,N/A,N/A,N/A,9000,65535,67108866
pld2,02:a1:01:00:00:03,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554435
pld3,02:a1:01:00:00:04,false,vSwitch0,Lab,lab,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554436
pld4,02:a1:01:00:00:05,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,1460,0
pld5,02:a1:01:00:00:06,true,ovSwitch0,N/A,defaultTcpipStack,N/A,N/A,N/A,-1,seg-7f3a,overlay,ext-0042,1500,65535,83886082
pld7,02:a1:01:00:00:07,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,0

## A named interface on a port group, with its MTU and MAC address, and one
## on a DV port that already had a connection: it keeps the port's
## connection id. Without a name the host picks the lowest free one.
$ orvixcli network ip interface add -p Spare -i pld255 --mtu 9000 -M 02:a1:01:00:00:ff

$ orvixcli network ip interface add -s dvSwitch1 -P 6

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
    "MTU": 1500,
    "TSO MSS": 65535,
    "Port ID": 33554434
  },
  {
    "Name": "pld1",
    "MAC Address": "02:a1:01:00:00:02",
    "Enabled": true,
    "Portset": "dvSwitch1",
    "Portgroup": "N/A",
    "Netstack Instance": "defaultTcpipStack",
    "VDS Name": "dvSwitch1",
    "VDS UUID": "50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18",
    "VDS Port": "5",
    "VDS Connection": 1700000005,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 9000,
    "TSO MSS": 65535,
    "Port ID": 67108866
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
    "Port ID": 33554435
  },
  {
    "Name": "pld3",
    "MAC Address": "02:a1:01:00:00:04",
    "Enabled": false,
    "Portset": "vSwitch0",
    "Portgroup": "Lab",
    "Netstack Instance": "lab",
    "VDS Name": "N/A",
    "VDS UUID": "N/A",
    "VDS Port": "N/A",
    "VDS Connection": -1,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 1500,
    "TSO MSS": 65535,
    "Port ID": 33554436
  },
  {
    "Name": "pld4",
    "MAC Address": "02:a1:01:00:00:05",
    "Enabled": true,
    "Portset": "N/A",
    "Portgroup": "N/A",
    "Netstack Instance": "N/A",
    "VDS Name": "N/A",
    "VDS UUID": "N/A",
    "VDS Port": "N/A",
    "VDS Connection": -1,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 1500,
    "TSO MSS": 1460,
    "Port ID": 0
  },
  {
    "Name": "pld5",
    "MAC Address": "02:a1:01:00:00:06",
    "Enabled": true,
    "Portset": "ovSwitch0",
    "Portgroup": "N/A",
    "Netstack Instance": "defaultTcpipStack",
    "VDS Name": "N/A",
    "VDS UUID": "N/A",
    "VDS Port": "N/A",
    "VDS Connection": -1,
    "Opaque Network ID": "seg-7f3a",
    "Opaque Network Type": "overlay",
    "External ID": "ext-0042",
    "MTU": 1500,
    "TSO MSS": 65535,
    "Port ID": 83886082
  },
  {
    "Name": "pld6",
    "MAC Address": "02:a1:01:00:00:08",
    "Enabled": true,
    "Portset": "dvSwitch1",
    "Portgroup": "N/A",
    "Netstack Instance": "defaultTcpipStack",
    "VDS Name": "dvSwitch1",
    "VDS UUID": "50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18",
    "VDS Port": "6",
    "VDS Connection": 1700000006,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 1500,
    "TSO MSS": 65535,
    "Port ID": 67108867
  },
  {
    "Name": "pld7",
    "MAC Address": "02:a1:01:00:00:07",
    "Enabled": true,
    "Portset": "N/A",
    "Portgroup": "N/A",
    "Netstack Instance": "N/A",
    "VDS Name": "N/A",
    "VDS UUID": "N/A",
    "VDS Port": "N/A",
    "VDS Connection": -1,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 1500,
    "TSO MSS": 65535,
    "Port ID": 0
  },
  {
    "Name": "pld255",
    "MAC Address": "02:a1:01:00:00:ff",
    "Enabled": true,
    "Portset": "vSwitch0",
    "Portgroup": "Spare",
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
    "Port ID": 33554437
  }
]

## The new interfaces are on the default netstack and carry no tag.
$ orvixcli network ip interface tag get -i pld255
   Tags: 

$ orvixcli network ip interface tag get -i pld6 --formatter=json
{
  "Tags": []
}

## pld0 can be made again once it is gone.
$ orvixcli network ip interface remove -i pld0

$ orvixcli network ip interface add -p "Management Network" -i pld0

$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554438
pld1,02:a1:01:00:00:02,true,dvSwitch1,N/A,defaultTcpipStack,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,5,1700000005,N/A,N/A,N/A,9000,65535,67108866
pld2,02:a1:01:00:00:03,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554435
pld3,02:a1:01:00:00:04,false,vSwitch0,Lab,lab,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554436
pld4,02:a1:01:00:00:05,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,1460,0
pld5,02:a1:01:00:00:06,true,ovSwitch0,N/A,defaultTcpipStack,N/A,N/A,N/A,-1,seg-7f3a,overlay,ext-0042,1500,65535,83886082
pld6,02:a1:01:00:00:08,true,dvSwitch1,N/A,defaultTcpipStack,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,6,1700000006,N/A,N/A,N/A,1500,65535,67108867
pld7,02:a1:01:00:00:07,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,0
pld255,02:a1:01:00:00:ff,true,vSwitch0,Spare,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,9000,65535,33554437

## An empty netstack is the default one.
$ orvixcli network ip interface add -s dvSwitch1 -P 0 -N ""

$ orvixcli network ip interface list -N defaultTcpipStack --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554438
pld1,02:a1:01:00:00:02,true,dvSwitch1,N/A,defaultTcpipStack,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,5,1700000005,N/A,N/A,N/A,9000,65535,67108866
pld4,02:a1:01:00:00:05,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,1460,0
pld5,02:a1:01:00:00:06,true,ovSwitch0,N/A,defaultTcpipStack,N/A,N/A,N/A,-1,seg-7f3a,overlay,ext-0042,1500,65535,83886082
pld6,02:a1:01:00:00:08,true,dvSwitch1,N/A,defaultTcpipStack,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,6,1700000006,N/A,N/A,N/A,1500,65535,67108867
pld8,02:a1:01:00:00:09,true,dvSwitch1,N/A,defaultTcpipStack,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,0,1700000000,N/A,N/A,N/A,1500,65535,67108868
pld255,02:a1:01:00:00:ff,true,vSwitch0,Spare,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,9000,65535,33554437

$ orvixcli network ip interface add --help
Usage: orvixcli network ip interface add [cmd options]

Description:
  Add a new Pallad network interface.

Cmd options:
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance
  -p|--portgroup-name=<str>
      The name of the vswitch port group to add this Pallad network interface to.
  -s|--dvs-name=<str>
      DVSwitch name of the connection point. This requires --dvport-id to be given in the same command
  -P|--dvport-id=<str>
      DVPort ID of the connection point. This requires --dvs-name to be given in the same command
  -m|--mtu=<long>
      Set the MTU setting for a given Pallad network interface on creation
  -M|--mac-address=<str>
      Set the MAC address for the newly created Pallad network interface.
  -i|--interface-name=<str>
      The name of the Pallad network interface to create. This name must be in the form pldX, where X is a number 0-255
