## The library's failures behind each command's own words.
@profile fixtures/port/counters.json
$ orvix-hostsim fault add PortImpl::GetPortStats --key 100 --message "port counters unavailable" --count 1
1
$ orvixcli network port stats get -p 100
! Unable to get stats for port: port counters unavailable
[1]
$ orvix-hostsim fault add PortImpl::GetPacketCounters --key 100 --message "port counters unavailable" --count 1
2
$ orvixcli network port stats get -p 100
! Unable to get stats for port: port counters unavailable
[1]
$ orvix-hostsim fault add PortImpl::GetFilterStats --key 100 --message "filter module not loaded" --count 1
3
$ orvixcli network port filter stats get -p 100
! Unable to get filter stats for port: filter module not loaded
[1]
$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetPortById --key 101 --message "port table busy" --count 2
4
$ orvixcli network port stats get -p 101
! Unable to get stats for port: port table busy
[1]
$ orvixcli network port filter stats get -p 101
! Unable to get filter stats for port: port table busy
[1]
## A fault on another port leaves this one alone.
$ orvixcli network port stats get -p 102 --formatter=csv
Packets received,Packets sent,Bytes received,Bytes sent,Broadcast packets received,Broadcast packets sent,Multicast packets received,Multicast packets sent,Unicast packets received,Unicast packets sent,Receive packets dropped,Transmit packets dropped
0,0,0,0,0,0,0,0,0,0,0,0
