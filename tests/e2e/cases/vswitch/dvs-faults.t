## The library's failures reach the user as they are; after them the walk
## sets no result.
$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetDVSwitches --message "switch table busy" --count 1
$ orvixcli network vswitch dvs orvix list
$ orvix-hostsim fault add DVSwitchImpl::GetDVPorts --key dvSwitch0 --message "DV port table busy" --count 1
$ orvixcli network vswitch dvs orvix list -v dvSwitch0
## The listing works again once the faults are spent.
$ orvixcli network vswitch dvs orvix list --formatter=csv
