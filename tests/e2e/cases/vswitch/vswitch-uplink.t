## network vswitch standard uplink add / remove on the default host.
## hwnic4 is an uplink of no switch: it can join vSwitch1.
$ orvixcli network vswitch standard uplink add --vswitch-name=vSwitch1 --uplink-name=hwnic4

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

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch0
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=128
VirtualSwitch[0].Used Ports=7
VirtualSwitch[0].Configured Ports=8
VirtualSwitch[0].MTU=1500
VirtualSwitch[0].CDP Status=listen
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By[0]=Migration
VirtualSwitch[0].Uplinks[0]=hwnic0
VirtualSwitch[0].Portgroups[0]=Management Network
VirtualSwitch[0].Portgroups[1]=VM Network
VirtualSwitch[0].Portgroups[2]=Storage
VirtualSwitch[0].Portgroups[3]=Migration

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

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch1
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=64
VirtualSwitch[0].Used Ports=2
VirtualSwitch[0].Configured Ports=3
VirtualSwitch[0].MTU=9000
VirtualSwitch[0].CDP Status=down
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks[0]=hwnic4
VirtualSwitch[0].Uplinks[1]=hwnic1
VirtualSwitch[0].Portgroups[0]=Lab Isolated

$ orvixcli network vswitch standard uplink remove -v vSwitch1 -u hwnic4 --formatter=json
true

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch1
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=64
VirtualSwitch[0].Used Ports=1
VirtualSwitch[0].Configured Ports=2
VirtualSwitch[0].MTU=9000
VirtualSwitch[0].CDP Status=down
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks[0]=hwnic1
VirtualSwitch[0].Portgroups[0]=Lab Isolated

$ orvixcli network vswitch standard uplink add --vswitch-name=vSwitch1
! orvixcli: Missing required option --uplink-name
! Run 'orvixcli network vswitch standard uplink add --help' for its options.
[2]
