## The library's failures behind each command's own words.
$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetAllSwitches --message "portset table busy" --count 2
1
$ orvixcli network vm list
! Unable to list VM's: portset table busy
[1]
$ orvixcli network vm port list -w 1049601
! Unable to list ports for VM: portset table busy
[1]
$ orvix-hostsim fault add WorldImpl::GetWorldName --key 1049777 --message "world table busy" --count 1
2
$ orvixcli network vm list
! Unable to list VM's: world table busy
[1]
$ orvix-hostsim fault add PortImpl::GetFilterStats --key 33554438 --message "filter module not loaded" --count 1
3
$ orvixcli network vm port list -w 1049601
! Unable to list ports for VM: filter module not loaded
[1]
$ orvix-hostsim fault add PnicImpl::GetUplinkPort --key hwnic3 --message "uplink port gone" --count 1
4
$ orvixcli network vm port list -w 1049601
! Unable to list ports for VM: uplink port gone
[1]
$ orvix-hostsim fault add DVSwitchImpl::GetPorts --key dvSwitch0 --message "port table busy" --count 1
5
$ orvixcli network vm list
! Unable to list VM's: port table busy
[1]
## The listing works again once the faults are spent.
$ orvixcli network vm list
World ID  Name     Num Ports  Networks
--------  -------  ---------  -------------------
1049601   web01    2          VM Network, dvpg-31
1049777   db01     2          VM Network, Storage
1050310   build01  1          dvpg-31
1050512   app01    2          Storage, dvpg-31
1051022   lab01    1          dvpg-31
$ orvixcli network vm list --formatter=csv
World ID,Name,Num Ports,Networks
1049601,web01,2,"VM Network,dvpg-31"
1049777,db01,2,"VM Network,Storage"
1050310,build01,1,dvpg-31
1050512,app01,2,"Storage,dvpg-31"
1051022,lab01,1,dvpg-31
