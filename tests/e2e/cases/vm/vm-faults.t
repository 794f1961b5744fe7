## The library's failures behind each command's own words.
$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetAllSwitches --message "portset table busy" --count 2
$ orvixcli network vm list
$ orvixcli network vm port list -w 1049601
$ orvix-hostsim fault add WorldImpl::GetWorldName --key 1049777 --message "world table busy" --count 1
$ orvixcli network vm list
$ orvix-hostsim fault add PortImpl::GetFilterStats --key 33554438 --message "filter module not loaded" --count 1
$ orvixcli network vm port list -w 1049601
$ orvix-hostsim fault add PnicImpl::GetUplinkPort --key hwnic3 --message "uplink port gone" --count 1
$ orvixcli network vm port list -w 1049601
$ orvix-hostsim fault add PortsetImpl::GetPorts --key dvSwitch0 --message "port table busy" --count 1
$ orvixcli network vm list
$ orvixcli network vm list --formatter=csv
