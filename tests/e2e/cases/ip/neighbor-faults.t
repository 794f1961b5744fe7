## The library's failures in the neighbor commands reach the user as the
## library's message alone, and nothing changes.
$ orvix-hostsim fault add RoutingInfoImpl::GetCurrentIpv4PalladNeighbors --key defaultTcpipStack --message "ARP table of defaultTcpipStack is busy" --count 1

$ orvixcli network ip neighbor list

## Only the IPv6 table is read with -v 6, so that fault is not reached
## again.
$ orvix-hostsim fault add RoutingInfoImpl::GetCurrentIpv6PalladNeighbors --message "Neighbor discovery table is busy" --count 1

$ orvixcli network ip neighbor list -v 4 -i pld1

$ orvixcli network ip neighbor list -v 6 --formatter=json

$ orvix-hostsim fault add NetworkInfoImpl::IsPldIpv6Enabled --message "Unable to query the IPv6 state" --count 2

$ orvixcli network ip neighbor list

$ orvixcli network ip neighbor remove -v 6 -a 2001:db8:10::1

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicByInterface --message "Interface table is locked" --count 2

$ orvixcli network ip neighbor list -i pld0

$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.1 -i pld0

$ orvix-hostsim fault add RoutingInfoImpl::RemoveIpv4Neighbor --key defaultTcpipStack --message "Unable to change the ARP table" --count 1

$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.1

$ orvixcli network ip neighbor list -v 4 -i pld0
