## network vswitch standard remove on the default host.
## A name the host has no standard switch of is refused by the command itself.
$ orvixcli network vswitch standard remove --vswitch-name=vSwitch9
! Unable to find virtual switch with the name vSwitch9
[1]

$ orvixcli network vswitch standard remove --vswitch-name=dvSwitch0 --formatter=json
! Unable to find virtual switch with the name dvSwitch0
[1]

## A switch whose ports are in use by anything but its uplinks stays.
$ orvixcli network vswitch standard remove -v vSwitch0
! Unable to remove virtual switch vSwitch0: its ports are in use by pld0, pld2, web01.eth0, db01.eth0, db01.eth1
[1]

## vSwitch1 has no client: it goes, with its port group.
$ orvixcli network vswitch standard remove -v vSwitch1

$ orvixcli network vswitch standard list
vSwitch0
   Name: vSwitch0
   Class: stdswitch
   Num Ports: 128
   Used Ports: 7
   Configured Ports: 8
   MTU: 1500
   CDP Status: listen
   Beacon Enabled: false
   Beacon Interval: 1
   Beacon Threshold: 3
   Beacon Required By: Migration
   Uplinks: hwnic0, hwnic1
   Portgroups: Management Network, VM Network, Storage, Migration

$ orvixcli network vswitch standard portgroup list
Name                Virtual Switch  Active Clients  VLAN ID
------------------  --------------  --------------  -------
Management Network  vSwitch0        1               0
VM Network          vSwitch0        2               0
Storage             vSwitch0        1               20
Migration           vSwitch0        1               30

## Removed once, it is unknown the second time.
$ orvixcli network vswitch standard remove -v vSwitch1 --formatter=json
! Unable to find virtual switch with the name vSwitch1
[1]

## A switch with only uplinks in use can go; its NICs are free again.
$ orvixcli network vswitch standard add -v vSwitch5

$ orvixcli network vswitch standard uplink add -v vSwitch5 -u hwnic4

$ orvixcli network vswitch standard remove -v vSwitch5 --formatter=json
true

$ orvixcli network vswitch standard add -v vSwitch6

$ orvixcli network vswitch standard uplink add -v vSwitch6 -u hwnic4

$ orvixcli network vswitch standard list -v vSwitch6
vSwitch6
   Name: vSwitch6
   Class: stdswitch
   Num Ports: 128
   Used Ports: 1
   Configured Ports: 1
   MTU: 1500
   CDP Status: listen
   Beacon Enabled: false
   Beacon Interval: 1
   Beacon Threshold: 3
   Beacon Required By: 
   Uplinks: hwnic4
   Portgroups: 
