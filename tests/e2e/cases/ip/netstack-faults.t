## The library's failures reach the user behind each command's own words,
## netstack list's alone; set keeps the changes made before the failing one.
$ orvix-hostsim fault add NetworkInfoImpl::ListNetstackInstances --message "netstack table busy" --count 1
1

$ orvixcli network ip netstack list
! netstack table busy
[1]

$ orvix-hostsim fault add NetworkInfoImpl::LookupNetstackInstanceByKey --key migrix --message "migrix is locked" --count 2
2

$ orvixcli network ip netstack get -N migrix
! Error getting Netstack instance configuration. Unable to read netstack instance migrix. Error was : migrix is locked
[1]

$ orvixcli network ip netstack set -N migrix -n Migration
! Error setting configuration for the netstack instance migrix. Error was : migrix is locked
[1]

$ orvix-hostsim fault add NetworkInfoImpl::AddNetstackInstance --key newStack --message "kernel refused the instance" --count 1
3

$ orvixcli network ip netstack add -N newStack
! Unable to add Netstack Instance. Error was : kernel refused the instance
[1]

$ orvix-hostsim fault add NetworkInfoImpl::RemoveNetstackInstance --key faultTolerance --message "instance is busy" --count 1
4

$ orvixcli network ip netstack remove -N faultTolerance
! Unable to Remove Netstack Instance. Error was : instance is busy
[1]

$ orvix-hostsim fault add NetstackInstanceImpl::SetCongestionControlAlgorithm --key migrix --message "algorithm module missing" --count 1
5

$ orvixcli network ip netstack set -N migrix -n Migration -c newreno -i false
! Error setting configuration for the netstack instance migrix. Error was : algorithm module missing
[1]

$ orvix-hostsim fault add NetstackInstanceImpl::Enable --key faultTolerance --message "out of kernel memory" --count 1
6

$ orvixcli network ip netstack set -N faultTolerance -e true
! Error setting configuration for the netstack instance faultTolerance. Error was : out of kernel memory
[1]

$ orvixcli network ip netstack list --formatter=json
[
  {
    "Key": "defaultTcpipStack",
    "Name": "defaultTcpipStack",
    "State": 4660
  },
  {
    "Key": "migrix",
    "Name": "Migration",
    "State": 4660
  },
  {
    "Key": "faultTolerance",
    "Name": "faultTolerance",
    "State": 2
  }
]

$ orvixcli network ip netstack get -N migrix --formatter=json
[
  {
    "Key": "migrix",
    "Name": "Migration",
    "Enabled": true,
    "Max Connections": 11000,
    "Current Max Connections": 11000,
    "Congestion Control Algorithm": "cubic",
    "IPv6 Enabled": true,
    "Current IPv6 Enabled": true,
    "State": 4660
  }
]
