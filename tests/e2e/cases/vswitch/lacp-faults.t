## The library's failures in the LACP commands. A failure while a reader
## holds a switch's LACP data is reported with its message alone, after the
## data went back to the switch.
$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetDVSwitches --message "switch table busy" --count 3
$ orvixcli network vswitch dvs orvix lacp config get
$ orvixcli network vswitch dvs orvix lacp status get
$ orvixcli network vswitch dvs orvix lacp stats get
$ orvix-hostsim fault add DVSwitchImpl::GetLacpConfig --key dvSwitch0 --message "LACP daemon not answering" --count 1
$ orvixcli network vswitch dvs orvix lacp config get
$ orvix-hostsim fault add DVSwitchImpl::GetLacpInfo --key dvSwitch0 --message "LACP daemon not answering" --count 2
$ orvixcli network vswitch dvs orvix lacp status get -s dvSwitch0
$ orvixcli network vswitch dvs orvix lacp stats get
$ orvix-hostsim fault add DVSwitchImpl::SetLacpTimeout --key dvSwitch0 --message "host is read-only" --count 1
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvSwitch0 -l 2 -t false
## The failed change left the timeout as it was.
$ orvixcli network vswitch dvs orvix lacp status get --formatter=csv
