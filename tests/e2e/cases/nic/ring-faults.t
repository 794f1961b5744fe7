## The library's failures in the ring commands.
$ orvix-hostsim fault add PnicImpl::GetRingParams --key hwnic0 --message "Driver of hwnic0 timed out" --count 2
1

$ orvixcli network nic ring preset get -n hwnic0
! Driver of hwnic0 timed out
[1]

$ orvixcli network nic ring current get -n hwnic0 --formatter=json
! Driver of hwnic0 timed out
[1]

## A set with no size sends nothing, so a fault on the write is not
## reached; with a size it is, and nothing changes.
$ orvix-hostsim fault add PnicImpl::SetRingParams --key hwnic0 --message "Unable to write the rings of hwnic0" --count 1
2

$ orvixcli network nic ring current set -n hwnic0

$ orvixcli network nic ring current set -n hwnic0 -r 2048
! Unable to write the rings of hwnic0
[1]

$ orvixcli network nic ring current get -n hwnic0
   RX: 1024
   RX Mini: 0
   RX Jumbo: 0
   TX: 1024

$ orvix-hostsim fault add NetworkInfoImpl::GetPnicByName --key hwnic1 --message "Unable to read NIC hwnic1" --count 1
3

$ orvixcli network nic ring current set -n hwnic1 -r 2048
! Unable to read NIC hwnic1
[1]
