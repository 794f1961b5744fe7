## The library's failures reach the user as its own message. A listing
## shows a NIC it cannot read as "N/A" and goes on; a failed change changes
## nothing.
$ orvix-hostsim fault add NetworkInfoImpl::GetPnics --message "Unable to list the NICs: store busy" --count 1
1

$ orvixcli network nic cso get
! Unable to list the NICs: store busy
[1]

$ orvix-hostsim fault add NetworkInfoImpl::GetPnicByName --key hwnic2 --message "Unable to read NIC hwnic2" --count 1
2

$ orvixcli network nic tso get -n hwnic2
! Unable to read NIC hwnic2
[1]

$ orvix-hostsim fault add PnicImpl::GetOffloadSettings --key hwnic1 --message "Driver of hwnic1 timed out" --count 3
3

$ orvixcli network nic sg get --formatter=simple
   NIC: hwnic0
   Value: on

   NIC: hwnic1
   Value: N/A

   NIC: hwnic2
   Value: on

   NIC: hwnic3
   Value: on

   NIC: hwnic4
   Value: on

   NIC: hwnic5
   Value: off

   NIC: hwnic6
   Value: N/A

   NIC: hwnic7
   Value: on

## A set reads the current record first: when that fails nothing is sent.
$ orvixcli network nic cso set -n hwnic1 -e 0
! Driver of hwnic1 timed out
[1]

$ orvixcli network nic tso get -n hwnic1
NIC     Value
------  -----
hwnic1  N/A

$ orvix-hostsim fault add PnicImpl::SetOffloadSettings --key hwnic0 --message "Unable to write the offloads of hwnic0" --count 1
4

$ orvixcli network nic sg set -n hwnic0 -e 0
! Unable to write the offloads of hwnic0
[1]

$ orvixcli network nic sg get -n hwnic0
NIC     Value
------  -----
hwnic0  on

$ orvixcli network nic cso get -n hwnic1
NIC     RX Checksum Offload  TX Checksum Offload
------  -------------------  -------------------
hwnic1  on                   on
