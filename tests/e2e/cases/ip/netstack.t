## network ip netstack list and get: "Enabled" means the instance exists in
## the kernel (state 4660).
$ orvixcli network ip netstack list

$ orvixcli network ip netstack list --formatter=json

$ orvixcli network ip netstack get -N migrix

$ orvixcli network ip netstack get --netstack faultTolerance --formatter=json

$ orvixcli network ip netstack get -N nowhere
! Unable to find a Netstack instance nowhere
[1]

$ orvixcli network ip netstack get
[2]

## network ip netstack add: in the kernel, or with --disabled in the
## configuration only.
$ orvixcli network ip netstack add -N backupStack

$ orvixcli network ip netstack add --netstack coldStack --disabled --formatter=json

$ orvixcli network ip netstack get -N backupStack

$ orvixcli network ip netstack get -N coldStack

$ orvixcli network ip netstack add -N backupStack
! Unable to add Netstack Instance. Error was : Netstack instance backupStack already exists
[1]

$ orvixcli network ip netstack add -N "bad key"
! Unable to add Netstack Instance. Error was : Invalid netstack instance name bad key: use 1 to 64 letters, digits, '-', '_' or '.'
[1]

$ orvixcli network ip netstack list --formatter=csv

## network ip netstack set: only --netstack changes nothing; an empty name
## keeps the name.
$ orvixcli network ip netstack set -N nowhere -n Nowhere
! Unable to find a Netstack instance nowhere
[1]

$ orvixcli network ip netstack set -N coldStack

$ orvixcli network ip netstack set -N coldStack --name ""

$ orvixcli network ip netstack get -N coldStack --formatter=json

$ orvixcli network ip netstack set -N coldStack -n "Cold standby" -m 20000 -c cubic -i false

$ orvixcli network ip netstack get -N coldStack --formatter=json

## Enabling creates the instance in the kernel with the configured limit and
## IPv6 switch.
$ orvixcli network ip netstack set -N coldStack --enable true --formatter=json

$ orvixcli network ip netstack get -N coldStack

## Disabling destroys the kernel instance and keeps the configuration.
$ orvixcli network ip netstack set -N coldStack -e false

$ orvixcli network ip netstack get -N coldStack

$ orvixcli network ip netstack set -N defaultTcpipStack -e false
! Error setting configuration for the netstack instance defaultTcpipStack. Error was : The default netstack instance cannot be disabled
[1]

## The algorithm must be one the host offers; the framework refuses others.
$ orvixcli network ip netstack set --help

$ orvixcli network ip netstack set -N coldStack -c vegas
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

$ orvixcli network ip netstack get -N coldStack --formatter=json

$ orvixcli network ip netstack set -N coldStack -m 2147483647

$ orvixcli network ip netstack get -N coldStack --formatter=simple

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

$ orvixcli network ip netstack list
