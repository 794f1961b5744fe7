## A switch whose uplink list still names a NIC the host no longer has
## (hwnic7): that name is left out of "Uplinks", the others keep their order.
## The port the stale uplink holds still counts as used.
@profile fixtures/vswitch/switches-stale-uplink.json
$ orvixcli network vswitch standard list
vSwitch0
   Name: vSwitch0
   Class: stdswitch
   Num Ports: 32
   Used Ports: 3
   Configured Ports: 3
   MTU: 1500
   CDP Status: both
   Beacon Enabled: false
   Beacon Interval: 1
   Beacon Threshold: 3
   Beacon Required By: 
   Uplinks: hwnic0, hwnic1
   Portgroups: 
