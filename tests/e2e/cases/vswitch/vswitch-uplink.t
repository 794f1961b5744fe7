## network vswitch standard uplink add / remove on the default host.
## hwnic4 is an uplink of no switch: it can join vSwitch1.
$ orvixcli network vswitch standard uplink add --vswitch-name=vSwitch1 --uplink-name=hwnic4

$ orvixcli network vswitch standard list -v vSwitch1
vSwitch1
   Name: vSwitch1
   Class: stdswitch
   Num Ports: 64
   Used Ports: 1
   Configured Ports: 2
   MTU: 9000
   CDP Status: down
   Beacon Enabled: false
   Beacon Interval: 1
   Beacon Threshold: 3
   Beacon Required By: 
   Uplinks: hwnic4
   Portgroups: Lab Isolated

## A NIC the host does not have.
$ orvixcli network vswitch standard uplink add -v vSwitch1 -u hwnic9
! Unable to add uplink hwnic9: the host has no physical NIC of that name
[1]

## NICs that are uplinks already: of this switch, of another standard
## switch, of the distributed switch.
$ orvixcli network vswitch standard uplink add -v vSwitch1 -u hwnic4
! Unable to add uplink hwnic4: it is already an uplink of vSwitch1
[1]

$ orvixcli network vswitch standard uplink add -v vSwitch1 -u hwnic0
! Unable to add uplink hwnic0: it is already an uplink of vSwitch0
[1]

$ orvixcli network vswitch standard uplink add -v vSwitch1 -u hwnic2 --formatter=json
! Unable to add uplink hwnic2: it is already an uplink of dvSwitch0
[1]

## A switch the host does not have is named in the error; nothing is changed.
$ orvixcli network vswitch standard uplink add -v vSwitch9 -u hwnic4
! Unable to find virtual switch with the name vSwitch9
[1]

$ orvixcli network vswitch standard uplink remove -v vSwitch9 -u hwnic4 --formatter=json
! Unable to find virtual switch with the name vSwitch9
[1]

$ orvixcli network vswitch standard uplink add -v dvSwitch0 -u hwnic4
! Unable to find virtual switch with the name dvSwitch0
[1]

## Removing an uplink frees its port; the NIC is no longer listed.
$ orvixcli network vswitch standard uplink remove --vswitch-name=vSwitch0 --uplink-name=hwnic1

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,128,6,7,1500,listen,false,1,3,Migration,hwnic0,"Management Network,VM Network,Storage,Migration"

## A NIC that is not an uplink of the switch.
$ orvixcli network vswitch standard uplink remove -v vSwitch0 -u hwnic1
! Unable to remove uplink hwnic1: it is not an uplink of virtual switch vSwitch0
[1]

$ orvixcli network vswitch standard uplink remove -v vSwitch0 -u hwnic4 --formatter=json
! Unable to remove uplink hwnic4: it is not an uplink of virtual switch vSwitch0
[1]

## The freed NIC can join another switch; results in JSON are true.
$ orvixcli network vswitch standard uplink add -v vSwitch1 -u hwnic1 --formatter=json
true

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=json
[
  {
    "Name": "vSwitch1",
    "Class": "stdswitch",
    "Num Ports": 64,
    "Used Ports": 2,
    "Configured Ports": 3,
    "MTU": 9000,
    "CDP Status": "down",
    "Beacon Enabled": false,
    "Beacon Interval": 1,
    "Beacon Threshold": 3,
    "Beacon Required By": [],
    "Uplinks": [
      "hwnic4",
      "hwnic1"
    ],
    "Portgroups": [
      "Lab Isolated"
    ]
  }
]

$ orvixcli network vswitch standard uplink remove -v vSwitch1 -u hwnic4 --formatter=json
true

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch1,stdswitch,64,1,2,9000,down,false,1,3,,hwnic1,Lab Isolated

$ orvixcli network vswitch standard uplink add --vswitch-name=vSwitch1
! orvixcli: Missing required option --uplink-name
! Run 'orvixcli network vswitch standard uplink add --help' for its options.
[2]
