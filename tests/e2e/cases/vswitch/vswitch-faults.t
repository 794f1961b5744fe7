## Failures of the host-control library reach the user as the library's own
## message, with no result, for every standard switch command.
$ orvix-hostsim fault add VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy --message "Unable to create virtual switch vSwitch2: portset allocation failed" --count 1
1

$ orvixcli network vswitch standard add -v vSwitch2 --formatter=json
! Unable to create virtual switch vSwitch2: portset allocation failed
[1]

$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetVirtualSwitches --message "Unable to read portsets: host busy" --count 1
2

$ orvixcli network vswitch standard list --formatter=json
! Unable to read portsets: host busy
[1]

## A failure in the middle of the walk leaves no partial list: the switch
## read before it is not shown either.
$ orvix-hostsim fault add VirtualSwitchImpl::GetPortGroups --key vSwitch1 --message "Unable to read port groups of vSwitch1" --count 1
3

$ orvixcli network vswitch standard list
! Unable to read port groups of vSwitch1
[1]

$ orvix-hostsim fault add NetworkInfoImpl::GetPnics --message "Unable to read the NIC inventory" --count 1
4

$ orvixcli network vswitch standard list -v vSwitch0
! Unable to read the NIC inventory
[1]

$ orvix-hostsim fault add VirtualSwitchInfoImpl::RemoveVirtualSwitch --message "Unable to remove virtual switch vSwitch1: portset busy" --count 1
5

$ orvixcli network vswitch standard remove -v vSwitch1
! Unable to remove virtual switch vSwitch1: portset busy
[1]

$ orvix-hostsim fault add PortsetImpl::IsValidVirtualSwitch --message "Unable to look up portsets" --count 2
6

$ orvixcli network vswitch standard remove -v vSwitch1
! Unable to look up portsets
[1]

$ orvixcli network vswitch standard set -v vSwitch1 -m 1500
! Unable to look up portsets
[1]

$ orvix-hostsim fault add VirtualSwitchImpl::SetCDPStatus --key vSwitch1 --message "Unable to set CDP status: discovery daemon not running" --count 1
7

$ orvixcli network vswitch standard set -v vSwitch1 -c both
! Unable to set CDP status: discovery daemon not running
[1]

$ orvix-hostsim fault add VirtualSwitchImpl::AddUplink --message "Unable to add uplink hwnic4: link negotiation failed" --count 1
8

$ orvixcli network vswitch standard uplink add -v vSwitch1 -u hwnic4
! Unable to add uplink hwnic4: link negotiation failed
[1]

$ orvix-hostsim fault add VirtualSwitchImpl::RemoveUplink --message "Unable to remove uplink hwnic1: port busy" --count 1
9

$ orvixcli network vswitch standard uplink remove -v vSwitch0 -u hwnic1 --formatter=json
! Unable to remove uplink hwnic1: port busy
[1]

$ orvix-hostsim fault add NetworkFactory::GetVirtualSwitchById --message "Unable to look up vSwitch0" --count 1
10

$ orvixcli network vswitch standard uplink remove -v vSwitch0 -u hwnic1
! Unable to look up vSwitch0
[1]

## Every fault has fired its count; nothing was changed by the failed commands.
$ orvix-hostsim fault list
ID  OPERATION  KEY  REMAINING  MESSAGE

$ orvixcli network vswitch standard list --formatter=csv
Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups
vSwitch0,stdswitch,128,8,9,1500,listen,false,1,3,Migration,"hwnic0,hwnic1","Management Network,VM Network,Storage,Migration"
vSwitch1,stdswitch,64,0,1,9000,down,false,1,3,,,Lab Isolated
