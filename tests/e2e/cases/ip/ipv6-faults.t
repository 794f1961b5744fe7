## The library's failures reach the user behind each command's own words;
## a failed change changes nothing.
$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNics --message "interface table busy" --count 2
1

$ orvixcli network ip interface ipv6 get
! Error getting IPv6 configuration. Unable to read the interfaces. Error was : interface table busy
[1]

$ orvixcli network ip interface ipv6 address list
! Unable to list IPv6 Addresses. Error was: interface table busy
[1]

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicsByInstanceKey --key defaultTcpipStack --message "netstack busy" --count 1
2

$ orvixcli network ip interface ipv6 get -N defaultTcpipStack
! Error getting IPv6 configuration. Unable to read the interfaces of netstack instance defaultTcpipStack. Error was : netstack busy
[1]

$ orvix-hostsim fault add PalladNicInfoImpl::GetPalladNicByInterface --key pld1 --message "pld1 is locked" --count 2
3

$ orvixcli network ip interface ipv6 get -n pld1
! Error getting IPv6 configuration. Unable to read interface pld1. Error was : pld1 is locked
[1]

$ orvixcli network ip interface ipv6 address list -i pld1
! Unable to list IPv6 Addresses. Error was: pld1 is locked
[1]

$ orvix-hostsim fault add PldNicImpl::SetIpConfig --key pld0 --message "configuration is read-only" --count 3
4

$ orvixcli network ip interface ipv6 set -i pld0 -d true
! Error changing IPv6 configuration for the interface pld0. Error was : configuration is read-only
[1]

$ orvixcli network ip interface ipv6 address add -i pld0 -I 2001:db8:10::99/64
! Error adding IPv6 address for the interface pld0. Error was : configuration is read-only
[1]

$ orvixcli network ip interface ipv6 address remove -i pld0 -I 2001:db8:10::21/64
! Error removing IPv6 address from the interface pld0. Error was : configuration is read-only
[1]

$ orvixcli network ip interface ipv6 get -n pld0
Name  DHCPv6 Enabled  Router Adv Enabled  DHCP DNS
----  --------------  ------------------  --------
pld0  false           true                false

$ orvixcli network ip interface ipv6 address list -i pld0
Interface  Address                      Netmask  Type      Status
---------  ---------------------------  -------  --------  ----------
pld0       2001:db8:10::21              64       STATIC    PREFERRED
pld0       2001:db8:10:0:a1:1ff:fe00:1  64       AUTOCONF  PREFERRED
pld0       2001:db8:11:0:a1:1ff:fe00:1  64       AUTOCONF  DEPRECATED
pld0       2001:db8:10::22              64       STATIC    DUPLICATED
