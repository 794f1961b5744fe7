## network vswitch standard set: MTU and CDP status of a switch.
$ orvixcli network vswitch standard set --vswitch-name=vSwitch1 --mtu=1280

## A negative MTU is refused by the command.
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

## The first MTU was written, none of the refused ones.
$ orvixcli network vswitch standard list -v vSwitch1 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch1
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=64
VirtualSwitch[0].Used Ports=0
VirtualSwitch[0].Configured Ports=1
VirtualSwitch[0].MTU=1280
VirtualSwitch[0].CDP Status=down
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks=
VirtualSwitch[0].Portgroups[0]=Lab Isolated

$ orvixcli network vswitch standard set -v vSwitch1 -m 9000 --formatter=json
true

## Each CDP status word, as list shows it afterwards (vSwitch1's was down).
$ orvixcli network vswitch standard set -v vSwitch1 --cdp-status=listen

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch1
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=64
VirtualSwitch[0].Used Ports=0
VirtualSwitch[0].Configured Ports=1
VirtualSwitch[0].MTU=9000
VirtualSwitch[0].CDP Status=listen
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks=
VirtualSwitch[0].Portgroups[0]=Lab Isolated

$ orvixcli network vswitch standard set -v vSwitch1 --cdp-status=advertise

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch1
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=64
VirtualSwitch[0].Used Ports=0
VirtualSwitch[0].Configured Ports=1
VirtualSwitch[0].MTU=9000
VirtualSwitch[0].CDP Status=advertise
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks=
VirtualSwitch[0].Portgroups[0]=Lab Isolated

$ orvixcli network vswitch standard set -v vSwitch1 -c both

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch1
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=64
VirtualSwitch[0].Used Ports=0
VirtualSwitch[0].Configured Ports=1
VirtualSwitch[0].MTU=9000
VirtualSwitch[0].CDP Status=both
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks=
VirtualSwitch[0].Portgroups[0]=Lab Isolated

$ orvixcli network vswitch standard set -v vSwitch1 --cdp-status=down

$ orvixcli network vswitch standard list -v vSwitch1 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch1
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=64
VirtualSwitch[0].Used Ports=0
VirtualSwitch[0].Configured Ports=1
VirtualSwitch[0].MTU=9000
VirtualSwitch[0].CDP Status=down
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks=
VirtualSwitch[0].Portgroups[0]=Lab Isolated

## Both at once; a bad MTU stops the command before the CDP status is
## written.
$ orvixcli network vswitch standard set -v vSwitch0 -m 9000 -c advertise

$ orvixcli network vswitch standard set -v vSwitch0 -m -5 -c down
! MTU size should be a positive value
[1]

$ orvixcli network vswitch standard list -v vSwitch0 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch0
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=128
VirtualSwitch[0].Used Ports=8
VirtualSwitch[0].Configured Ports=9
VirtualSwitch[0].MTU=9000
VirtualSwitch[0].CDP Status=advertise
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By[0]=Migration
VirtualSwitch[0].Uplinks[0]=hwnic0
VirtualSwitch[0].Uplinks[1]=hwnic1
VirtualSwitch[0].Portgroups[0]=Management Network
VirtualSwitch[0].Portgroups[1]=VM Network
VirtualSwitch[0].Portgroups[2]=Storage
VirtualSwitch[0].Portgroups[3]=Migration

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
