## The library's failures reach the user behind each command's own words.
$ orvix-hostsim fault add PnicImpl::GetPnicStats --key hwnic0 --message "driver not responding" --count 1
1
$ orvixcli network nic stats get -n hwnic0
! Unable to get stats for NIC: driver not responding
[1]
$ orvixcli network nic stats get -n hwnic0 --formatter=csv
Packets received,Packets sent,Bytes received,Bytes sent,Receive packets dropped,Transmit packets dropped,Multicast packets received,Broadcast packets received,Multicast packets sent,Broadcast packets sent,Total receive errors,Receive length errors,Receive over errors,Receive CRC errors,Receive frame errors,Receive FIFO errors,Receive missed errors,Total transmit errors,Transmit aborted errors,Transmit carrier errors,Transmit FIFO errors,Transmit heartbeat errors,Transmit window errors
48211934,31877602,39148094818,20879830600,535,0,229580,507494,39847,21251,3,0,0,3,0,0,0,0,0,0,0,0,0

$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetAllSwitches --message "portset table busy" --count 2
2
$ orvixcli network nic vlan stats get -n hwnic0
! Unable to get VLAN stats: portset table busy
[1]
$ orvixcli network nic vlan stats set -n hwnic0 -e false
! Unable to set VLAN stats: portset table busy
[1]

$ orvix-hostsim fault add PortsetImpl::GetUplinkVlanStats --key vSwitch0 --message "uplink port gone" --count 1
3
$ orvixcli network nic vlan stats get -n hwnic0
! Unable to get VLAN stats: uplink port gone
[1]

## A failed switch-off keeps the counters.
$ orvix-hostsim fault add PortsetImpl::SetUplinkVlanStatsEnabled --key vSwitch0 --message "host is read-only" --count 1
4
$ orvixcli network nic vlan stats set -n hwnic0 -e false
! Unable to set VLAN stats: host is read-only
[1]
$ orvixcli network nic vlan stats get -n hwnic0 --formatter=csv
Packets received,Packets sent
39120877,25511934
7734008,5120770
1357049,1244898
