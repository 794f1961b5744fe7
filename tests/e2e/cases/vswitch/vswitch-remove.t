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
! Unable to remove virtual switch vSwitch0: its ports are in use by pld0, pld2, web01.eth0, db01.eth0, db01.eth1, app01.eth1
[1]

## vSwitch1 has no client: it goes, with its port group. Removed once, it is
## unknown the second time.
$ orvixcli network vswitch standard remove -v vSwitch1

$ orvixcli network vswitch standard remove -v vSwitch1 --formatter=json
! Unable to find virtual switch with the name vSwitch1
[1]

$ orvixcli network vswitch standard portgroup policy security get -p "Lab Isolated" --formatter=keyvalue
! Unable to find a port group with the name Lab Isolated
[1]

## A switch with only uplinks in use can go; its NICs are free again.
$ orvixcli network vswitch standard add -v vSwitch5

$ orvixcli network vswitch standard uplink add -v vSwitch5 -u hwnic4

$ orvixcli network vswitch standard remove -v vSwitch5 --formatter=json
true

$ orvixcli network vswitch standard add -v vSwitch6

$ orvixcli network vswitch standard uplink add -v vSwitch6 -u hwnic4

$ orvixcli network vswitch standard list -v vSwitch6 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch6
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=128
VirtualSwitch[0].Used Ports=1
VirtualSwitch[0].Configured Ports=1
VirtualSwitch[0].MTU=1500
VirtualSwitch[0].CDP Status=listen
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks[0]=hwnic4
VirtualSwitch[0].Portgroups=
