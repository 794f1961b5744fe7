## network ip netstack list and get: "Enabled" means the instance exists in
## the kernel (state 4660).
$ orvixcli network ip netstack list
defaultTcpipStack
   Key: defaultTcpipStack
   Name: defaultTcpipStack
   State: 4660

migrix
   Key: migrix
   Name: migrix
   State: 4660

faultTolerance
   Key: faultTolerance
   Name: faultTolerance
   State: 2

$ orvixcli network ip netstack list --formatter=json
[
  {
    "Key": "defaultTcpipStack",
    "Name": "defaultTcpipStack",
    "State": 4660
  },
  {
    "Key": "migrix",
    "Name": "migrix",
    "State": 4660
  },
  {
    "Key": "faultTolerance",
    "Name": "faultTolerance",
    "State": 2
  }
]

$ orvixcli network ip netstack get -N migrix
migrix
   Key: migrix
   Name: migrix
   Enabled: true
   Max Connections: 11000
   Current Max Connections: 11000
   Congestion Control Algorithm: cubic
   IPv6 Enabled: true
   Current IPv6 Enabled: true
   State: 4660

$ orvixcli network ip netstack get --netstack faultTolerance --formatter=json
[
  {
    "Key": "faultTolerance",
    "Name": "faultTolerance",
    "Enabled": false,
    "Max Connections": 11000,
    "Current Max Connections": 0,
    "Congestion Control Algorithm": "newreno",
    "IPv6 Enabled": true,
    "Current IPv6 Enabled": false,
    "State": 2
  }
]

$ orvixcli network ip netstack get -N nowhere
! Unable to find a Netstack instance nowhere
[1]

$ orvixcli network ip netstack get
! orvixcli: Missing required option --netstack
! Run 'orvixcli network ip netstack get --help' for its options.
[2]

## network ip netstack add: in the kernel, or with --disabled in the
## configuration only.
$ orvixcli network ip netstack add -N backupStack

$ orvixcli network ip netstack add --netstack coldStack --disabled --formatter=json
true

$ orvixcli network ip netstack get -N backupStack
backupStack
   Key: backupStack
   Name: backupStack
   Enabled: true
   Max Connections: 11000
   Current Max Connections: 11000
   Congestion Control Algorithm: newreno
   IPv6 Enabled: true
   Current IPv6 Enabled: true
   State: 4660

$ orvixcli network ip netstack get -N coldStack
coldStack
   Key: coldStack
   Name: coldStack
   Enabled: false
   Max Connections: 11000
   Current Max Connections: 0
   Congestion Control Algorithm: newreno
   IPv6 Enabled: true
   Current IPv6 Enabled: false
   State: 2

$ orvixcli network ip netstack add -N backupStack
! Unable to add Netstack Instance. Error was : Netstack instance backupStack already exists
[1]

$ orvixcli network ip netstack add -N "bad key"
! Unable to add Netstack Instance. Error was : Invalid netstack instance name bad key: use 1 to 64 letters, digits, '-', '_' or '.'
[1]

$ orvixcli network ip netstack list --formatter=csv
Key,Name,State
defaultTcpipStack,defaultTcpipStack,4660
migrix,migrix,4660
faultTolerance,faultTolerance,2
backupStack,backupStack,4660
coldStack,coldStack,2

## network ip netstack set: only --netstack changes nothing; an empty name
## keeps the name.
$ orvixcli network ip netstack set -N nowhere -n Nowhere
! Unable to find a Netstack instance nowhere
[1]

$ orvixcli network ip netstack set -N coldStack

$ orvixcli network ip netstack set -N coldStack --name ""

$ orvixcli network ip netstack get -N coldStack --formatter=csv
Key,Name,Enabled,Max Connections,Current Max Connections,Congestion Control Algorithm,IPv6 Enabled,Current IPv6 Enabled,State
coldStack,coldStack,false,11000,0,newreno,true,false,2

$ orvixcli network ip netstack set -N coldStack -n "Cold standby" -m 20000 -c cubic -i false

$ orvixcli network ip netstack get -N coldStack --formatter=csv
Key,Name,Enabled,Max Connections,Current Max Connections,Congestion Control Algorithm,IPv6 Enabled,Current IPv6 Enabled,State
coldStack,Cold standby,false,20000,0,cubic,false,false,2

## Enabling creates the instance in the kernel with the configured limit and
## IPv6 switch.
$ orvixcli network ip netstack set -N coldStack --enable true --formatter=json
true

$ orvixcli network ip netstack get -N coldStack
coldStack
   Key: coldStack
   Name: Cold standby
   Enabled: true
   Max Connections: 20000
   Current Max Connections: 20000
   Congestion Control Algorithm: cubic
   IPv6 Enabled: false
   Current IPv6 Enabled: false
   State: 4660

## Disabling destroys the kernel instance and keeps the configuration.
$ orvixcli network ip netstack set -N coldStack -e false

$ orvixcli network ip netstack get -N coldStack
coldStack
   Key: coldStack
   Name: Cold standby
   Enabled: false
   Max Connections: 20000
   Current Max Connections: 0
   Congestion Control Algorithm: cubic
   IPv6 Enabled: false
   Current IPv6 Enabled: false
   State: 2

$ orvixcli network ip netstack set -N defaultTcpipStack -e false
! Error setting configuration for the netstack instance defaultTcpipStack. Error was : The default netstack instance cannot be disabled
[1]

## The algorithm must be one the host offers; the framework refuses others.
$ orvixcli network ip netstack set --help
Usage: orvixcli network ip netstack set [cmd options]

Description:
  Configure settings for a given Netstack Instance.

Cmd options:
  -N|--netstack=<str>  (required)
      The network stack instance. This name must be an interface listed in the netstack list command.
  -e|--enable=<bool>
      Enable the netstack instance (create in kernel)
  -n|--name=<str>
      The name for this netstack instance.
  -m|--maxconn=<long>
      The maximum number of connections for this netstack instance (applied only during netstack creation).
  -c|--ccalgo=<str>
      The TCP Congestion Contol Algorithm for this netstack instance (not applied to existing connections).: 
        newreno: Set newreno as the algorithm
        cubic: Set cubic as the algorithm
  -i|--ipv6enabled=<bool>
      To enable IPv6 for this netstack instance (aplied only during netstack creation).

$ orvixcli network ip netstack set -N coldStack -c vegas
! orvixcli: Invalid value 'vegas' for --ccalgo: it must be one of newreno, cubic
! Run 'orvixcli network ip netstack set --help' for its options.
[2]

## The limit is passed whole: 2^32 + 1 is refused, not wrapped to 1.
$ orvixcli network ip netstack set -N coldStack --maxconn 4294967297
! Error setting configuration for the netstack instance coldStack. Error was : Invalid maximum connections value 4294967297 for netstack instance coldStack: must be between 1 and 2147483647
[1]

$ orvixcli network ip netstack set -N coldStack --maxconn 0
! Error setting configuration for the netstack instance coldStack. Error was : Invalid maximum connections value 0 for netstack instance coldStack: must be between 1 and 2147483647
[1]

## The settings are made one by one: those before a refused one stay made.
$ orvixcli network ip netstack set -N coldStack -n Partial -m -5 -c newreno
! Error setting configuration for the netstack instance coldStack. Error was : Invalid maximum connections value -5 for netstack instance coldStack: must be between 1 and 2147483647
[1]

$ orvixcli network ip netstack get -N coldStack --formatter=csv
Key,Name,Enabled,Max Connections,Current Max Connections,Congestion Control Algorithm,IPv6 Enabled,Current IPv6 Enabled,State
coldStack,Partial,false,20000,0,cubic,false,false,2

$ orvixcli network ip netstack set -N coldStack -m 2147483647

$ orvixcli network ip netstack get -N coldStack --formatter=simple
coldStack
   Key: coldStack
   Name: Partial
   Enabled: false
   Max Connections: 2147483647
   Current Max Connections: 0
   Congestion Control Algorithm: cubic
   IPv6 Enabled: false
   Current IPv6 Enabled: false
   State: 2

## network ip netstack remove.
$ orvixcli network ip netstack remove -N defaultTcpipStack
! Unable to Remove Netstack Instance. Error was : The default netstack instance cannot be removed
[1]

$ orvixcli network ip netstack remove -N nowhere
! Unable to Remove Netstack Instance. Error was : Netstack instance nowhere does not exist
[1]

$ orvixcli network ip netstack remove -N migrix
! Unable to Remove Netstack Instance. Error was : Netstack instance migrix still has interfaces: pld2
[1]

$ orvixcli network ip netstack remove -N coldStack

$ orvixcli network ip netstack remove --netstack faultTolerance --formatter=json
true

$ orvixcli network ip netstack list
defaultTcpipStack
   Key: defaultTcpipStack
   Name: defaultTcpipStack
   State: 4660

migrix
   Key: migrix
   Name: migrix
   State: 4660

backupStack
   Key: backupStack
   Name: backupStack
   State: 4660
