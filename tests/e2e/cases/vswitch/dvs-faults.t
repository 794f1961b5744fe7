## The library's failures reach the user as they are; after them the walk
## sets no result.
$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetDVSwitches --message "switch table busy" --count 1
1
$ orvixcli network vswitch dvs orvix list
! switch table busy
[1]
$ orvix-hostsim fault add DVSwitchImpl::GetDVPorts --key dvSwitch0 --message "DV port table busy" --count 1
2
$ orvixcli network vswitch dvs orvix list -v dvSwitch0
! DV port table busy
[1]
## The listing works again once the faults are spent.
$ orvixcli network vswitch dvs orvix list --formatter=csv
Name,VDS ID,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Timeout,Uplinks,Orvix Branded,DVPort
dvSwitch0,6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4,dvswitch,512,9,9,9000,listen,-1,"hwnic2,hwnic3,hwnic5,hwnic7",true,"{Port ID: 0, In Use: true, DVPortgroup ID: dvpg-30, Client: hwnic2}, {Port ID: 1, In Use: true, DVPortgroup ID: dvpg-30, Client: hwnic3}, {Port ID: 2, In Use: true, DVPortgroup ID: dvpg-30, Client: hwnic5}, {Port ID: 3, In Use: true, DVPortgroup ID: dvpg-30, Client: hwnic7}, {Port ID: 10, In Use: true, DVPortgroup ID: dvpg-32, Client: pld1}, {Port ID: 11, In Use: false, DVPortgroup ID: dvpg-32, Client: }, {Port ID: 20, In Use: true, DVPortgroup ID: dvpg-31, Client: build01.eth0}, {Port ID: 21, In Use: true, DVPortgroup ID: dvpg-31, Client: web01.eth1}, {Port ID: 22, In Use: false, DVPortgroup ID: dvpg-31, Client: }, {Port ID: 23, In Use: true, DVPortgroup ID: dvpg-31, Client: app01.eth0}, {Port ID: 24, In Use: true, DVPortgroup ID: dvpg-31, Client: lab01.eth0}"
