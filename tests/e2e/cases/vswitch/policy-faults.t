## Each policy command reports the library's failures with the library's own
## message and no result; a failed change changes nothing.
$ orvix-hostsim fault add PortsetImpl::IsValidVirtualSwitch --key vSwitch0 --message "Unable to read the portset table: busy" --count 1
1

$ orvixcli network vswitch standard policy failover get -v vSwitch0 --formatter=json
! Unable to read the portset table: busy
[1]

$ orvix-hostsim fault add VirtualSwitchImpl::SetTeamingPolicy --message "Unable to write the teaming policy: host is read-only" --count 1
2

$ orvixcli network vswitch standard policy failover set -v vSwitch0 --load-balancing=iphash
! Unable to write the teaming policy: host is read-only
[1]

## The NIC check is the library's too.
$ orvix-hostsim fault add PnicImpl::IsValidPnic --key hwnic1 --message "Unable to query NIC hwnic1: driver not responding" --count 1
3

$ orvixcli network vswitch standard policy failover set -v vSwitch0 --active-uplinks=hwnic1 --formatter=json
! Unable to query NIC hwnic1: driver not responding
[1]

$ orvixcli network vswitch standard policy failover get -v vSwitch0
   Load Balancing: srcport
   Network Failure Detection: link
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic0
   Standby Adapters: hwnic1
   Unused Adapters: 

$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetVirtualSwitchByName --message "Unable to load virtual switch vSwitch1" --count 1
4

$ orvixcli network vswitch standard policy security get -v vSwitch1
! Unable to load virtual switch vSwitch1
[1]

$ orvix-hostsim fault add VirtualSwitchImpl::SetSecurityPolicy --message "Unable to write the security policy" --count 1
5

$ orvixcli network vswitch standard policy security set -v vSwitch1 -p true
! Unable to write the security policy
[1]

$ orvixcli network vswitch standard policy security get -v vSwitch1
   Allow Promiscuous: false
   Allow MAC Address Change: false
   Allow Forged Transmits: false

$ orvix-hostsim fault add PortsetImpl::IsValidVirtualSwitch --message "Unable to read the portset table" --count 1
6

$ orvixcli network vswitch standard policy shaping get -v vSwitch1
! Unable to read the portset table
[1]

$ orvix-hostsim fault add VirtualSwitchImpl::SetShapingPolicy --message "Unable to write the shaping policy" --count 1
7

$ orvixcli network vswitch standard policy shaping set -v vSwitch1 --avg-bandwidth=1
! Unable to write the shaping policy
[1]

$ orvix-hostsim fault add PortGroupImpl::GetVirtualSwitch --key Migration --message "Unable to load the switch of port group Migration" --count 1
8

$ orvixcli network vswitch standard portgroup policy failover get -p Migration
! Unable to load the switch of port group Migration
[1]

$ orvix-hostsim fault add PortGroupImpl::SetOwnTeamingPolicy --message "Unable to write the port group's teaming policy" --count 1
9

$ orvixcli network vswitch standard portgroup policy failover set -p Migration --use-vswitch
! Unable to write the port group's teaming policy
[1]

$ orvix-hostsim fault add NetworkFactory::GetPortGroupByName --key "VM Network" --message "Unable to load port group VM Network" --count 1
10

$ orvixcli network vswitch standard portgroup policy security get -p "VM Network"
! Unable to load port group VM Network
[1]

$ orvix-hostsim fault add PortGroupImpl::SetOwnSecurityPolicy --message "Unable to write the port group's security policy" --count 1
11

$ orvixcli network vswitch standard portgroup policy security set -p "VM Network" -u
! Unable to write the port group's security policy
[1]

$ orvix-hostsim fault add NetworkFactory::GetPortGroupByName --message "Unable to load port groups" --count 1
12

$ orvixcli network vswitch standard portgroup policy shaping get -p Storage
! Unable to load port groups
[1]

$ orvix-hostsim fault add PortGroupImpl::SetOwnShapingPolicy --message "Unable to write the port group's shaping policy" --count 1
13

$ orvixcli network vswitch standard portgroup policy shaping set -p Storage -u
! Unable to write the port group's shaping policy
[1]

## Every fault was for one call: the port groups are as they were.
$ orvixcli network vswitch standard portgroup policy failover get -p Migration
   Load Balancing: srcport
   Network Failure Detection: beacon
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic1
   Standby Adapters: 
   Unused Adapters: hwnic0
   Override Vswitch Load Balancing: false
   Override Vswitch Network Failure Detection: true
   Override Vswitch Notify Switches: false
   Override Vswitch Failback: false
   Override Vswitch Uplinks: true

$ orvixcli network vswitch standard portgroup policy security get -p "VM Network"
   Allow Promiscuous: true
   Allow MAC Address Change: true
   Allow Forged Transmits: true
   Override Vswitch Allow Promiscuous: true
   Override Vswitch Allow MAC Address Change: false
   Override Vswitch Allow Forged Transmits: false

$ orvixcli network vswitch standard portgroup policy shaping get -p Storage
   Enabled: true
   Average Bandwidth: 2000000 Kbps
   Peak Bandwidth: 4000000 Kbps
   Burst Size: 1638400 Kib
   Override Vswitch Enabled: true
   Override Vswitch Average Bandwidth: true
   Override Vswitch Peak Bandwidth: true
   Override Vswitch Burst Size: true
