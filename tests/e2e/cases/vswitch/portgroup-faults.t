## Failures of the host-control library reach the user as the library's own
## message, with no result, for every port group command.
$ orvix-hostsim fault add NetworkInfoImpl::GetAllPortGroups --message "Unable to read port groups: host busy" --count 1
1

$ orvixcli network vswitch standard portgroup list
! Unable to read port groups: host busy
[1]

## A failure for one port group leaves no partial list.
$ orvix-hostsim fault add PortGroupImpl::GetActiveClients --key Storage --message "Unable to count the clients of Storage" --count 1
2

$ orvixcli network vswitch standard portgroup list --formatter=json
! Unable to count the clients of Storage
[1]

$ orvix-hostsim fault add VirtualSwitchImpl::AddPortGroup --message "Unable to add port group Lab2: portset busy" --count 1
3

$ orvixcli network vswitch standard portgroup add -p Lab2 -v vSwitch1
! Unable to add port group Lab2: portset busy
[1]

$ orvix-hostsim fault add VirtualSwitchImpl::RemovePortGroup --key vSwitch1 --message "Unable to remove port group Lab Isolated: portset busy" --count 1
4

$ orvixcli network vswitch standard portgroup remove -p "Lab Isolated" -v vSwitch1 --formatter=json
! Unable to remove port group Lab Isolated: portset busy
[1]

$ orvix-hostsim fault add PortGroupImpl::SetVlanId --message "Unable to set the VLAN ID: uplink rejected it" --count 1
5

$ orvixcli network vswitch standard portgroup set -p Storage -v 21
! Unable to set the VLAN ID: uplink rejected it
[1]

$ orvix-hostsim fault add NetworkFactory::GetPortGroupByName --message "Unable to look up port groups" --count 1
6

$ orvixcli network vswitch standard portgroup set -p Storage
! Unable to look up port groups
[1]

## Nothing was changed by the failed commands.
$ orvixcli network vswitch standard portgroup list
Name                Virtual Switch  Active Clients  VLAN ID
------------------  --------------  --------------  -------
Management Network  vSwitch0        1               0
VM Network          vSwitch0        2               0
Storage             vSwitch0        2               20
Migration           vSwitch0        1               30
Lab Isolated        vSwitch1        0               100
