## An interface made on a dedicated netstack gets that netstack's tag, which
## interfaces on the default netstack lose; those on other netstacks keep it.
@profile fixtures/ip/interface-points.json

$ orvixcli network ip interface tag get -i pld0
   Tags: Management, LiveMigration

$ orvixcli network ip interface tag get -i pld2
   Tags: LiveMigration

$ orvixcli network ip interface tag get -i pld3
   Tags: LiveMigration

$ orvixcli network ip interface add -p Spare -N migrix

$ orvixcli network ip interface list --netstack migrix --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld2,02:a1:01:00:00:03,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554435
pld6,02:a1:01:00:00:08,true,vSwitch0,Spare,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554437

$ orvixcli network ip interface tag get -i pld6
   Tags: LiveMigration

$ orvixcli network ip interface tag get -i pld0
   Tags: Management

$ orvixcli network ip interface tag get -i pld2
   Tags: LiveMigration

$ orvixcli network ip interface tag get -i pld3 --formatter=json
{
  "Tags": [
    "LiveMigration"
  ]
}

## Netstack names are compared exactly: the host has no Migrix.
$ orvixcli network ip interface add -s dvSwitch1 -P 6 -N Migrix
! Unable to add Pallad network interface. Error was : Netstack instance Migrix does not exist
[1]

## On the fault-tolerance netstack.
$ orvixcli network ip interface add -s dvSwitch1 -P 6 -N faultTolerance

$ orvixcli network ip interface list --netstack faultTolerance --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld7,02:a1:01:00:00:07,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,0
pld8,02:a1:01:00:00:09,true,dvSwitch1,N/A,faultTolerance,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,6,1700000006,N/A,N/A,N/A,1500,65535,67108867

$ orvixcli network ip interface tag get -i pld8 --formatter=json
{
  "Tags": [
    "FaultTolerance"
  ]
}
