## network vswitch standard add on the default host.
## Without --ports the switch gets the library's default of 128 ports and the
## default policies; a successful add prints nothing in simple output.
$ orvixcli network vswitch standard add --vswitch-name=vSwitch2

$ orvixcli network vswitch standard list -v vSwitch2 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch2
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=128
VirtualSwitch[0].Used Ports=0
VirtualSwitch[0].Configured Ports=0
VirtualSwitch[0].MTU=1500
VirtualSwitch[0].CDP Status=listen
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks=
VirtualSwitch[0].Portgroups=

## In JSON the operation's result is the boolean true.
$ orvixcli network vswitch standard add -v vSwitch3 -P 16 --formatter=json
true

$ orvixcli network vswitch standard list -v vSwitch3 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch3
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=16
VirtualSwitch[0].Used Ports=0
VirtualSwitch[0].Configured Ports=0
VirtualSwitch[0].MTU=1500
VirtualSwitch[0].CDP Status=listen
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks=
VirtualSwitch[0].Portgroups=

## A name in use is refused by the library, with its message.
$ orvixcli network vswitch standard add --vswitch-name=vSwitch0
! A virtual switch with the name vSwitch0 already exists
[1]

$ orvixcli network vswitch standard add --vswitch-name=dvSwitch0 --formatter=json
! A virtual switch with the name dvSwitch0 already exists
[1]

## The per-switch bound is the option's own range, checked before the command runs.
$ orvixcli network vswitch standard add --vswitch-name=vSwitch4 --ports=4097
! orvixcli: Value 4097 for --ports is out of range: it must be between 1 and 4096
! Run 'orvixcli network vswitch standard add --help' for its options.
[2]

$ orvixcli network vswitch standard add --vswitch-name=vSwitch4 --ports=0
! orvixcli: Value 0 for --ports is out of range: it must be between 1 and 4096
! Run 'orvixcli network vswitch standard add --help' for its options.
[2]

$ orvixcli network vswitch standard add --ports=8
! orvixcli: Missing required option --vswitch-name
! Run 'orvixcli network vswitch standard add --help' for its options.
[2]

## 4096 fits the option, but not the host: 128 + 64 + 512 ports of the host's
## own switches, plus the 128 and 16 added above, are allocated already.
$ orvixcli network vswitch standard add --vswitch-name=vSwitch4 --ports=4096
! Unable to create virtual switch vSwitch4 with 4096 ports: 848 of the host's 4608 ports are allocated already
[1]

## A name the library cannot use as a switch name.
$ orvixcli network vswitch standard add --vswitch-name="my switch"
! Invalid virtual switch name 'my switch': use 1 to 32 letters, digits, '.', '-' or '_'
[1]

## Nothing of the refused switches was created; the new ones are listed after
## the ones the host had.
$ orvixcli network vswitch standard list --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,128,8,9,1500,listen,false,1,3,Migration,"hwnic0,hwnic1","Management Network,VM Network,Storage,Migration"
vSwitch1,stdswitch,64,0,1,9000,down,false,1,3,,,Lab Isolated
vSwitch2,stdswitch,128,0,0,1500,listen,false,1,3,,,
vSwitch3,stdswitch,16,0,0,1500,listen,false,1,3,,,

$ orvixcli network vswitch standard add --help
Usage: orvixcli network vswitch standard add [cmd options]

Description:
  Add a new virtual switch to the Tovrin networking system.

Cmd options:
  -v|--vswitch-name=<str>  (required)
      The name of the virtual switch to create.
  -P|--ports=<long>
      The number of ports to to give this newly created virtual switch. Maximum ports per virtual switch is 4096. If no value is given the default value(128) is used. The number of ports is limited by the number of already allocated ports on the host. The system wide port count cannot be greater than 4608.
