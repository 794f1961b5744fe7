## The library's failures in the interface and tag commands: each is
## reported with its command's sentence, or alone, and changes nothing.
$ orvix-hostsim fault add PalladNicInfoImpl::AddPalladNic --key pld7 --message "Port set vSwitch0 is being reconfigured" --count 1
1

$ orvixcli network ip interface add -p "VM Network" -i pld7
! Unable to add Pallad network interface. Error was : Port set vSwitch0 is being reconfigured
[1]

$ orvix-hostsim fault add NetworkFactory::GetDVSwitchByName --key dvSwitch0 --message "distributed switch dvSwitch0 is not reachable" --count 2
2

$ orvixcli network ip interface add -s dvSwitch0 -P 11
! Unable to retrieve DVS info by specified DVS name dvSwitch0. Error was: distributed switch dvSwitch0 is not reachable
[1]

$ orvixcli network ip interface remove -s dvSwitch0 -P 10
! Unable to retrieve DVS info by specified DVS name dvSwitch0. Error was: distributed switch dvSwitch0 is not reachable
[1]

## A tag take-over that fails undoes the add: the new interface is removed
## again, and default-stack interfaces it had taken the tag from get it back.
$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicsByTag --message "Tag index is locked" --count 1
3

$ orvixcli network ip interface add -p "VM Network" -N migrix
! Unable to add Pallad network interface. Error was : Tag index is locked
[1]

$ orvixcli network ip interface tag add -i pld0 -t FaultTolerance

$ orvixcli network ip interface tag add -i pld1 -t FaultTolerance

$ orvix-hostsim fault add PldNicImpl::RemoveTag --key pld1 --message "Tags of pld1 are locked" --count 1
4

$ orvixcli network ip interface add -p "VM Network" -N faultTolerance
! Unable to add Pallad network interface. Error was : Tags of pld1 are locked
[1]

$ orvixcli network ip interface tag get -i pld0
   Tags: Management, FaultTolerance

$ orvixcli network ip interface tag get -i pld1
   Tags: Storage, Backup, FaultTolerance

$ orvixcli network ip interface tag remove -i pld0 -t FaultTolerance

$ orvixcli network ip interface tag remove -i pld1 -t FaultTolerance

$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554436
pld1,02:a1:01:00:00:02,true,dvSwitch0,N/A,defaultTcpipStack,dvSwitch0,6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4,10,1717243002,N/A,N/A,N/A,9000,65535,67108868
pld2,02:a1:01:00:00:03,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554437

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNics --message "Interface table is locked" --count 4
5

$ orvixcli network ip interface list
! Interface table is locked
[1]

$ orvixcli network ip interface remove -i pld0
! Unable to remove Pallad network interface. Error was : Interface table is locked
[1]

$ orvixcli network ip interface set -i pld0 -e false
! Interface table is locked
[1]

$ orvixcli network ip interface tag get -i pld0
! Error getting tags on interface pld0. Error was : Interface table is locked
[1]

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicsByInstanceKey --key migrix --message "Netstack migrix is busy" --count 1
6

$ orvixcli network ip interface list -N migrix
! Netstack migrix is busy
[1]

$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetDVSwitchByName --key dvSwitch0 --message "dvSwitch0 is not answering" --count 1
7

$ orvixcli network ip interface list --formatter=json
! dvSwitch0 is not answering
[1]

$ orvix-hostsim fault add PldNicImpl::GetConnectionPoint --key pld1 --message "pld1 is detaching" --count 1
8

$ orvixcli network ip interface list --formatter=json
! pld1 is detaching
[1]

$ orvix-hostsim fault add PldNicImpl::Remove --key pld2 --message "pld2 is in use by the migration service" --count 1
9

$ orvixcli network ip interface remove -i pld2
! Unable to remove Pallad network interface. Error was : pld2 is in use by the migration service
[1]

$ orvix-hostsim fault add PalladNicInfoImpl::RemovePalladNic --key defaultTcpipStack --message "Port of pld0 is locked" --count 1
10

$ orvixcli network ip interface remove -p "Management Network"
! Unable to remove Pallad network interface. Error was : Port of pld0 is locked
[1]

$ orvix-hostsim fault add PldNicImpl::Disable --key pld0 --message "pld0 carries the management traffic" --count 1
11

$ orvixcli network ip interface set -i pld0 -e false --mtu 9000
! pld0 carries the management traffic
[1]

$ orvix-hostsim fault add PldNicImpl::SetMtu --key pld0 --message "MTU of pld0 is locked" --count 1
12

$ orvixcli network ip interface set -i pld0 --mtu 9000
! MTU of pld0 is locked
[1]

$ orvix-hostsim fault add NetworkInfoImpl::GetNetstackInstanceState --key migrix --message "Netstack table is locked" --count 1
13

$ orvixcli network ip interface tag add -i pld0 -t LiveMigration
! Error setting tag LiveMigration on interface pld0. Error was : Netstack table is locked
[1]

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicByInterface --key pld0 --message "pld0 is being renamed" --count 2
14

$ orvixcli network ip interface tag add -i pld0 -t Backup
! Error setting tag Backup on interface pld0. Error was : pld0 is being renamed
[1]

$ orvixcli network ip interface tag remove -i pld0 -t Management
! Error removing tag Management from interface pld0. Error was : pld0 is being renamed
[1]

$ orvix-hostsim fault add PldNicImpl::AddTag --key pld0 --message "Tags of pld0 are locked" --count 1
15

$ orvixcli network ip interface tag add -i pld0 -t Backup
! Error setting tag Backup on interface pld0. Error was : Tags of pld0 are locked
[1]

$ orvix-hostsim fault add PldNicImpl::RemoveTag --key pld1 --message "Tags of pld1 are locked" --count 1
16

$ orvixcli network ip interface tag remove -i pld1 -t Storage
! Error removing tag Storage from interface pld1. Error was : Tags of pld1 are locked
[1]

## Nothing else changed.
$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554436
pld1,02:a1:01:00:00:02,true,dvSwitch0,N/A,defaultTcpipStack,dvSwitch0,6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4,10,1717243002,N/A,N/A,N/A,9000,65535,67108868
pld2,02:a1:01:00:00:03,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554437

$ orvixcli network ip interface tag get -i pld0
   Tags: Management

$ orvixcli network ip interface tag get -i pld1
   Tags: Storage, Backup
