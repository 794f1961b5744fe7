## The library's failures behind each command's own words.
@profile fixtures/port/counters.json
$ orvix-hostsim fault add PortImpl::GetPortStats --key 100 --message "port counters unavailable" --count 1
$ orvixcli network port stats get -p 100
$ orvix-hostsim fault add PortImpl::GetPacketCounters --key 100 --message "port counters unavailable" --count 1
$ orvixcli network port stats get -p 100
$ orvix-hostsim fault add PortImpl::GetFilterStats --key 100 --message "filter module not loaded" --count 1
$ orvixcli network port filter stats get -p 100
$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetPortById --key 101 --message "port table busy" --count 2
$ orvixcli network port stats get -p 101
$ orvixcli network port filter stats get -p 101
## A fault on another port leaves this one alone.
$ orvixcli network port stats get -p 102 --formatter=csv
