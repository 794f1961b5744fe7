## network vswitch standard set: MTU and CDP status of a switch.
$ orvixcli network vswitch standard set --vswitch-name=vSwitch1 --mtu=1280

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch1,stdswitch,64,0,1,1280,down,false,1,3,,,Lab Isolated

## A negative MTU is refused by the command; nothing changes.
$ orvixcli network vswitch standard set --vswitch-name=vSwitch1 --mtu=-1
! MTU size should be a positive value
[1]

## Zero passes the command's own check and reaches the switch, which refuses it.
$ orvixcli network vswitch standard set --vswitch-name=vSwitch1 --mtu=0
! Invalid MTU 0 for virtual switch vSwitch1: it must be between 1280 and 9000
[1]

## A value far beyond every MTU reaches the switch as typed and is refused;
## it is never cut down to some other, acceptable number.
$ orvixcli network vswitch standard set --vswitch-name=vSwitch1 --mtu=99999999999
! Invalid MTU 99999999999 for virtual switch vSwitch1: it must be between 1280 and 9000
[1]

$ orvixcli network vswitch standard set --vswitch-name=vSwitch1 --mtu=4294968576
! Invalid MTU 4294968576 for virtual switch vSwitch1: it must be between 1280 and 9000
[1]

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch1,stdswitch,64,0,1,1280,down,false,1,3,,,Lab Isolated

$ orvixcli network vswitch standard set -v vSwitch1 -m 9000 --formatter=json
true

## Each CDP status word, as list shows it afterwards.
$ orvixcli network vswitch standard set -v vSwitch0 --cdp-status=down

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,128,7,8,1500,down,false,1,3,Migration,"hwnic0,hwnic1","Management Network,VM Network,Storage,Migration"

$ orvixcli network vswitch standard set -v vSwitch0 --cdp-status=listen

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,128,7,8,1500,listen,false,1,3,Migration,"hwnic0,hwnic1","Management Network,VM Network,Storage,Migration"

$ orvixcli network vswitch standard set -v vSwitch0 --cdp-status=advertise

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,128,7,8,1500,advertise,false,1,3,Migration,"hwnic0,hwnic1","Management Network,VM Network,Storage,Migration"

$ orvixcli network vswitch standard set -v vSwitch0 -c both

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,128,7,8,1500,both,false,1,3,Migration,"hwnic0,hwnic1","Management Network,VM Network,Storage,Migration"

## Both at once.
$ orvixcli network vswitch standard set -v vSwitch0 -m 9000 -c listen

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=json
[
  {
    "Name": "vSwitch0",
    "Class": "stdswitch",
    "Num Ports": 128,
    "Used Ports": 7,
    "Configured Ports": 8,
    "MTU": 9000,
    "CDP Status": "listen",
    "Beacon Enabled": false,
    "Beacon Interval": 1,
    "Beacon Threshold": 3,
    "Beacon Required By": [
      "Migration"
    ],
    "Uplinks": [
      "hwnic0",
      "hwnic1"
    ],
    "Portgroups": [
      "Management Network",
      "VM Network",
      "Storage",
      "Migration"
    ]
  }
]

## A bad MTU stops the command before the CDP status is written.
$ orvixcli network vswitch standard set -v vSwitch0 -m -5 -c down
! MTU size should be a positive value
[1]

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,128,7,8,9000,listen,false,1,3,Migration,"hwnic0,hwnic1","Management Network,VM Network,Storage,Migration"

## Neither option: nothing changes, and the result is still true.
$ orvixcli network vswitch standard set -v vSwitch0 --formatter=json
true

## A word that is not a CDP status is refused before the command runs.
$ orvixcli network vswitch standard set -v vSwitch0 --cdp-status=lisen
! orvixcli: Invalid value 'lisen' for --cdp-status: it must be one of down, listen, advertise, both. Did you mean 'listen'?
! Run 'orvixcli network vswitch standard set --help' for its options.
[2]

## A switch the host does not have.
$ orvixcli network vswitch standard set --vswitch-name=vSwitch9 --mtu=1500
! vSwitch9 is not a valid name for a virtual switch
[1]

$ orvixcli network vswitch standard set --vswitch-name=dvSwitch0 --cdp-status=down --formatter=json
! dvSwitch0 is not a valid name for a virtual switch
[1]

$ orvixcli network vswitch standard set --help
Usage: orvixcli network vswitch standard set [cmd options]

Description:
  This command sets the MTU size and CDP status of a given virtual switch.

Cmd options:
  -v|--vswitch-name=<str>  (required)
      The name of virtual switch to apply the configurations.
  -m|--mtu=<long>
      The MTU size of the given virtual switch. 
  -c|--cdp-status=<str>
      The CDP status of the given virtual switch. It can be 'down', 'listen', 'advertise' or 'both'
