## network vswitch standard portgroup list on the default host: every port
## group of every standard switch, switch by switch; a table by default.
$ orvixcli network vswitch standard portgroup list
Name                Virtual Switch  Active Clients  VLAN ID
------------------  --------------  --------------  -------
Management Network  vSwitch0        1               0
VM Network          vSwitch0        2               0
Storage             vSwitch0        2               20
Migration           vSwitch0        1               30
Lab Isolated        vSwitch1        0               100

$ orvixcli network vswitch standard portgroup list --formatter=simple
   Name: Management Network
   Virtual Switch: vSwitch0
   Active Clients: 1
   VLAN ID: 0

   Name: VM Network
   Virtual Switch: vSwitch0
   Active Clients: 2
   VLAN ID: 0

   Name: Storage
   Virtual Switch: vSwitch0
   Active Clients: 2
   VLAN ID: 20

   Name: Migration
   Virtual Switch: vSwitch0
   Active Clients: 1
   VLAN ID: 30

   Name: Lab Isolated
   Virtual Switch: vSwitch1
   Active Clients: 0
   VLAN ID: 100

$ orvixcli network vswitch standard portgroup list --formatter=json
[
  {
    "Name": "Management Network",
    "Virtual Switch": "vSwitch0",
    "Active Clients": 1,
    "VLAN ID": 0
  },
  {
    "Name": "VM Network",
    "Virtual Switch": "vSwitch0",
    "Active Clients": 2,
    "VLAN ID": 0
  },
  {
    "Name": "Storage",
    "Virtual Switch": "vSwitch0",
    "Active Clients": 2,
    "VLAN ID": 20
  },
  {
    "Name": "Migration",
    "Virtual Switch": "vSwitch0",
    "Active Clients": 1,
    "VLAN ID": 30
  },
  {
    "Name": "Lab Isolated",
    "Virtual Switch": "vSwitch1",
    "Active Clients": 0,
    "VLAN ID": 100
  }
]

## The command takes no options.
$ orvixcli network vswitch standard portgroup list --vswitch-name=vSwitch0
! orvixcli: Unknown option --vswitch-name
! Run 'orvixcli network vswitch standard portgroup list --help' for its options.
[2]
