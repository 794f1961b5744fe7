## A switch with no free port takes no further uplink.
@profile fixtures/vswitch/switches-bare.json
$ orvixcli network vswitch standard add -v tiny -P 1

$ orvixcli network vswitch standard uplink add -v tiny -u hwnic0

$ orvixcli network vswitch standard uplink add -v tiny -u hwnic1
! Unable to add uplink hwnic1: virtual switch tiny has no free port
[1]

$ orvixcli network vswitch standard list -v tiny --formatter=keyvalue
VirtualSwitch[0].Name=tiny
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=1
VirtualSwitch[0].Used Ports=1
VirtualSwitch[0].Configured Ports=1
VirtualSwitch[0].MTU=1500
VirtualSwitch[0].CDP Status=listen
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks[0]=hwnic0
VirtualSwitch[0].Portgroups=
