## network ip interface remove: by name, by connection point (on a
## netstack), and the ways of naming both or neither.
@profile fixtures/ip/interface-points.json

## A name and a connection point together are refused, whichever point.
$ orvixcli network ip interface remove -i pld3 -p Lab
! Please correctly and uniquely specify a way to remove it. A Pallad network interface can be uniquely specified by --interface-name or --portgroup-name or --dvs-name/--dvport-id. i.e. Providing its name or its connection point are two ways to uniquely specify a Pallad network interface.
[1]

$ orvixcli network ip interface remove -i pld1 -s dvSwitch1
! Please correctly and uniquely specify a way to remove it. A Pallad network interface can be uniquely specified by --interface-name or --portgroup-name or --dvs-name/--dvport-id. i.e. Providing its name or its connection point are two ways to uniquely specify a Pallad network interface.
[1]

$ orvixcli network ip interface remove -i pld1 --dvport-id 5
! Please correctly and uniquely specify a way to remove it. A Pallad network interface can be uniquely specified by --interface-name or --portgroup-name or --dvs-name/--dvport-id. i.e. Providing its name or its connection point are two ways to uniquely specify a Pallad network interface.
[1]

## Neither: the connection point is missing.
$ orvixcli network ip interface remove
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface remove -N lab
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface remove -s dvSwitch1
! A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.
[1]

$ orvixcli network ip interface remove -p Lab -s dvSwitch1 -P 5
! Only one connection point can be specified, vswitch port group or DVPort.
[1]

## Names are checked like those of add.
$ orvixcli network ip interface remove -i pld256
! orvixcli: Invalid value 'pld256' for --interface-name: it must match pld([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])
! Run 'orvixcli network ip interface remove --help' for its options.
[2]

$ orvixcli network ip interface remove -i pld01
! orvixcli: Invalid value 'pld01' for --interface-name: it must match pld([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])
! Run 'orvixcli network ip interface remove --help' for its options.
[2]

$ orvixcli network ip interface remove -i PLD1
! orvixcli: Invalid value 'PLD1' for --interface-name: it must match pld([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])
! Run 'orvixcli network ip interface remove --help' for its options.
[2]

## A name the host does not have: the error and a false result.
$ orvixcli network ip interface remove -i pld9
false
! Unable to find Pallad network interface with the name pld9
[1]

$ orvixcli network ip interface remove -i pld9 --formatter=json
false
! Unable to find Pallad network interface with the name pld9
[1]

## By name.
$ orvixcli network ip interface remove -i pld3

## By connection point: on the default netstack unless another is given;
## an empty netstack is the default one.
$ orvixcli network ip interface remove -p Migration
! Unable to remove Pallad network interface. Error was : No interface is connected to that connection point on netstack defaultTcpipStack
[1]

$ orvixcli network ip interface remove -p Migration -N migrix

$ orvixcli network ip interface remove -p "Management Network" --netstack ""

$ orvixcli network ip interface remove -s dvSwitch1 -P 5 -N lab
! Unable to remove Pallad network interface. Error was : No interface is connected to that connection point on netstack lab
[1]

$ orvixcli network ip interface remove -s dvSwitch1 -P 5

## Points the host does not have.
$ orvixcli network ip interface remove -p NoSuchGroup
! Invalid vswitch port group or DVPort parameters.
[1]

$ orvixcli network ip interface remove -s dvSwitch9 -P 5
! Unable to retrieve DVS info by specified DVS name dvSwitch9. Error was: no such distributed switch
[1]

$ orvixcli network ip interface remove -p Spare
! Unable to remove Pallad network interface. Error was : No interface is connected to that connection point on netstack defaultTcpipStack
[1]

$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld4,02:a1:01:00:00:05,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,1460,0
pld5,02:a1:01:00:00:06,true,ovSwitch0,N/A,defaultTcpipStack,N/A,N/A,N/A,-1,seg-7f3a,overlay,ext-0042,1500,65535,83886082
pld7,02:a1:01:00:00:07,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,0

## The freed points can be used again.
$ orvixcli network ip interface add -p Migration -N migrix

$ orvixcli network ip interface add -s dvSwitch1 -P 5

$ orvixcli network ip interface list --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554434
pld1,02:a1:01:00:00:02,true,dvSwitch1,N/A,defaultTcpipStack,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,5,1700000005,N/A,N/A,N/A,1500,65535,67108866
pld4,02:a1:01:00:00:05,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,1460,0
pld5,02:a1:01:00:00:06,true,ovSwitch0,N/A,defaultTcpipStack,N/A,N/A,N/A,-1,seg-7f3a,overlay,ext-0042,1500,65535,83886082
pld7,02:a1:01:00:00:07,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,0
