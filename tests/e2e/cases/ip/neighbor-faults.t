## The library's failures in the neighbor commands reach the user as the
## library's message alone, and nothing changes.
$ orvix-hostsim fault add RoutingInfoImpl::GetCurrentIpv4PalladNeighbors --key defaultTcpipStack --message "ARP table of defaultTcpipStack is busy" --count 1
1

$ orvixcli network ip neighbor list
! ARP table of defaultTcpipStack is busy
[1]

## Only the IPv6 table is read with -v 6, so that fault is not reached
## again.
$ orvix-hostsim fault add RoutingInfoImpl::GetCurrentIpv6PalladNeighbors --message "Neighbor discovery table is busy" --count 1
2

$ orvixcli network ip neighbor list -v 4 -i pld1
Neighbor       Mac Address        Pldnic  Expiry    State  Type
-------------  -----------------  ------  --------  -----  -------
198.51.100.1   02:a1:fe:00:02:01  pld1    1044 sec         Dynamic
198.51.100.9   02:a1:fe:00:02:09  pld1    0 sec            Static
198.51.100.21  02:a1:01:00:00:02  pld1    -1 sec           Local

$ orvixcli network ip neighbor list -v 6 --formatter=json
! Neighbor discovery table is busy
[1]

$ orvix-hostsim fault add NetworkInfoImpl::IsPldIpv6Enabled --message "Unable to query the IPv6 state" --count 2
3

$ orvixcli network ip neighbor list
! Unable to query the IPv6 state
[1]

$ orvixcli network ip neighbor remove -v 6 -a 2001:db8:10::1
! Unable to query the IPv6 state
[1]

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicByInterface --message "Interface table is locked" --count 2
4

$ orvixcli network ip neighbor list -i pld0
! Interface table is locked
[1]

$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.1 -i pld0
! Interface table is locked
[1]

$ orvix-hostsim fault add RoutingInfoImpl::RemoveIpv4Neighbor --key defaultTcpipStack --message "Unable to change the ARP table" --count 1
5

$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.1
! Unable to change the ARP table
[1]

$ orvixcli network ip neighbor list -v 4 -i pld0
Neighbor     Mac Address        Pldnic  Expiry    State  Type
-----------  -----------------  ------  --------  -----  -------
192.0.2.1    02:a1:fe:00:01:01  pld0    1187 sec         Dynamic
192.0.2.53   02:a1:fe:00:01:35  pld0    902 sec          Dynamic
192.0.2.254  02:a1:fe:00:01:fe  pld0    0 sec            Static
192.0.2.21   02:a1:01:00:00:01  pld0    -1 sec           Local
192.0.2.80   02:a1:fe:00:01:50  pld0    1020 sec         Dynamic
192.0.2.90   02:a1:fe:00:01:5a  pld0    347 sec          Dynamic
192.0.2.200  02:a1:fe:00:01:c8  pld0    58 sec           Dynamic
