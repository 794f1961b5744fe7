## network vswitch standard portgroup add / remove on the default host.
## A new port group is untagged and has no clients; it is listed after the
## switch's other port groups.
$ orvixcli network vswitch standard portgroup add --portgroup-name="Backup Net" --vswitch-name=vSwitch1

$ orvixcli network vswitch standard portgroup add -p Lab2 -v vSwitch1 --formatter=json
true

$ orvixcli network vswitch standard portgroup list
Name                Virtual Switch  Active Clients  VLAN ID
------------------  --------------  --------------  -------
Management Network  vSwitch0        1               0
VM Network          vSwitch0        2               0
Storage             vSwitch0        2               20
Migration           vSwitch0        1               30
Lab Isolated        vSwitch1        0               100
Backup Net          vSwitch1        0               0
Lab2                vSwitch1        0               0

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
VirtualSwitch[0].Portgroups[1]=Backup Net
VirtualSwitch[0].Portgroups[2]=Lab2

## Port group names are unique on the whole host, not only on one switch.
$ orvixcli network vswitch standard portgroup add -p Storage -v vSwitch1
! A port group with the name Storage already exists on virtual switch vSwitch0
[1]

$ orvixcli network vswitch standard portgroup add -p " Lab3" -v vSwitch1
! Invalid port group name ' Lab3': use 1 to 64 printable characters, not beginning or ending with a blank
[1]

## A switch the host does not have is named in the error.
$ orvixcli network vswitch standard portgroup add -p Lab3 -v vSwitch9
! Unable to find virtual switch with the name vSwitch9
[1]

$ orvixcli network vswitch standard portgroup remove -p Lab2 -v vSwitch9 --formatter=json
! Unable to find virtual switch with the name vSwitch9
[1]

$ orvixcli network vswitch standard portgroup add -p Lab3 -v dvSwitch0
! Unable to find virtual switch with the name dvSwitch0
[1]

$ orvixcli network vswitch standard portgroup add -p Lab3
! orvixcli: Missing required option --vswitch-name
! Run 'orvixcli network vswitch standard portgroup add --help' for its options.
[2]

## A port group in use by a kernel interface or a VM stays.
$ orvixcli network vswitch standard portgroup remove -p "Management Network" -v vSwitch0
! Unable to remove port group Management Network: it is in use by pld0
[1]

$ orvixcli network vswitch standard portgroup remove -p "VM Network" -v vSwitch0
! Unable to remove port group VM Network: it is in use by web01.eth0, db01.eth0
[1]

## A port group that is not on the named switch, or nowhere.
$ orvixcli network vswitch standard portgroup remove -p Lab2 -v vSwitch0
! Unable to find port group Lab2 on virtual switch vSwitch0
[1]

$ orvixcli network vswitch standard portgroup remove -p Nowhere -v vSwitch1
! Unable to find port group Nowhere on virtual switch vSwitch1
[1]

$ orvixcli network vswitch standard portgroup remove --portgroup-name=Lab2 --vswitch-name=vSwitch1

$ orvixcli network vswitch standard portgroup remove -p "Lab Isolated" -v vSwitch1 --formatter=json
true

$ orvixcli network vswitch standard portgroup list
Name                Virtual Switch  Active Clients  VLAN ID
------------------  --------------  --------------  -------
Management Network  vSwitch0        1               0
VM Network          vSwitch0        2               0
Storage             vSwitch0        2               20
Migration           vSwitch0        1               30
Backup Net          vSwitch1        0               0

$ orvixcli network vswitch standard portgroup add --help
Usage: orvixcli network vswitch standard portgroup add [cmd options]

Description:
  Allows the addition of a standard port group to a virtual switch.

Cmd options:
  -p|--portgroup-name=<str>  (required)
      The name of the port group to add
  -v|--vswitch-name=<str>  (required)
      The virtual switch to add the port group to.

$ orvixcli network vswitch standard portgroup remove --help
Usage: orvixcli network vswitch standard portgroup remove [cmd options]

Description:
  Remove a port group from the given virtual switch

Cmd options:
  -p|--portgroup-name=<str>  (required)
       
  -v|--vswitch-name=<str>  (required)
       
