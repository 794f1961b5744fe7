## The library's failures: ipv4 get names what it was reading, ipv4 set the
## interface it was changing; a failed change changes nothing.
$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNics --message "interface table busy" --count 1
1

$ orvixcli network ip interface ipv4 get
! Error getting IPv4 configuration. Unable to read the interfaces. Error was : interface table busy
[1]

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicsByInstanceKey --key migrix --message "netstack busy" --count 1
2

$ orvixcli network ip interface ipv4 get -N migrix
! Error getting IPv4 configuration. Unable to read the interfaces of netstack instance migrix. Error was : netstack busy
[1]

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicByInterface --key pld2 --message "pld2 is locked" --count 2
3

$ orvixcli network ip interface ipv4 get -i pld2 -N migrix
! Error getting IPv4 configuration. Unable to read interface pld2. Error was : pld2 is locked
[1]

$ orvixcli network ip interface ipv4 set -i pld2 -t none
! Error changing IPv4 configuration for the interface pld2. Error was : pld2 is locked
[1]

$ orvix-hostsim fault add PldNicImpl::SetIpConfig --key pld0 --message "configuration is read-only" --count 1
4

$ orvixcli network ip interface ipv4 set -i pld0 -t dhcp --peer-dns true
! Error changing IPv4 configuration for the interface pld0. Error was : configuration is read-only
[1]

$ orvixcli network ip interface ipv4 get --formatter=csv
Name,IPv4 Address,IPv4 Netmask,IPv4 Broadcast,Address Type,DHCP DNS
pld0,192.0.2.21,255.255.255.0,192.0.2.255,STATIC,false
pld1,198.51.100.21,255.255.255.0,198.51.100.255,DHCP,true
pld2,203.0.113.21,255.255.255.0,203.0.113.255,STATIC,false
