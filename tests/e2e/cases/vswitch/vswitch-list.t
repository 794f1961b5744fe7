## network vswitch standard list on the default host: one record a switch,
## headed by its name, every field in order; lists joined by ", ".
$ orvixcli network vswitch standard list
vSwitch0
   Name: vSwitch0
   Class: stdswitch
   Num Ports: 128
   Used Ports: 8
   Configured Ports: 9
   MTU: 1500
   CDP Status: listen
   Beacon Enabled: false
   Beacon Interval: 1
   Beacon Threshold: 3
   Beacon Required By: Migration
   Uplinks: hwnic0, hwnic1
   Portgroups: Management Network, VM Network, Storage, Migration

vSwitch1
   Name: vSwitch1
   Class: stdswitch
   Num Ports: 64
   Used Ports: 0
   Configured Ports: 1
   MTU: 9000
   CDP Status: down
   Beacon Enabled: false
   Beacon Interval: 1
   Beacon Threshold: 3
   Beacon Required By: 
   Uplinks: 
   Portgroups: Lab Isolated

## Limited to one switch by name; in JSON ints are numbers, bools booleans
## and the string lists arrays.
$ orvixcli network vswitch standard list --vswitch-name=vSwitch1 --formatter=json
[
  {
    "Name": "vSwitch1",
    "Class": "stdswitch",
    "Num Ports": 64,
    "Used Ports": 0,
    "Configured Ports": 1,
    "MTU": 9000,
    "CDP Status": "down",
    "Beacon Enabled": false,
    "Beacon Interval": 1,
    "Beacon Threshold": 3,
    "Beacon Required By": [],
    "Uplinks": [],
    "Portgroups": [
      "Lab Isolated"
    ]
  }
]

## A name no switch has: the walk stops at once. The (empty) list is still
## the result, and the error goes to stderr.
$ orvixcli network vswitch standard list --vswitch-name=vSwitch9
! Unable to access all portsets
[1]

$ orvixcli network vswitch standard list --vswitch-name=vSwitch9 --formatter=json
[]
! Unable to access all portsets
[1]

## A distributed switch is not a standard one.
$ orvixcli network vswitch standard list --vswitch-name=dvSwitch0
! Unable to access all portsets
[1]
