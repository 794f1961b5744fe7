## network ip interface ipv6 get: the IPv6 switches of every interface, of
## one netstack's, or of the one named with -n; the DNS-from-DHCP flag shows
## only with DHCPv6 on.
$ orvixcli network ip interface ipv6 get
Name  DHCPv6 Enabled  Router Adv Enabled  DHCP DNS
----  --------------  ------------------  --------
pld0  false           true                false
pld1  true            false               true
pld2  false           false               false

$ orvixcli network ip interface ipv6 get --formatter=json
[
  {
    "Name": "pld0",
    "DHCPv6 Enabled": false,
    "Router Adv Enabled": true,
    "DHCP DNS": false
  },
  {
    "Name": "pld1",
    "DHCPv6 Enabled": true,
    "Router Adv Enabled": false,
    "DHCP DNS": true
  },
  {
    "Name": "pld2",
    "DHCPv6 Enabled": false,
    "Router Adv Enabled": false,
    "DHCP DNS": false
  }
]

$ orvixcli network ip interface ipv6 get -N migrix --formatter=simple
   Name: pld2
   DHCPv6 Enabled: false
   Router Adv Enabled: false
   DHCP DNS: false

$ orvixcli network ip interface ipv6 get -n pld1 --netstack migrix
Name  DHCPv6 Enabled  Router Adv Enabled  DHCP DNS
----  --------------  ------------------  --------
pld1  true            false               true

$ orvixcli network ip interface ipv6 get -i pld1
! orvixcli: Unknown option -i
! Run 'orvixcli network ip interface ipv6 get --help' for its options.
[2]

$ orvixcli network ip interface ipv6 get --interface-name pld9
! Unable to find a Pallad interface with the name pld9
[1]

## network ip interface ipv6 set changes only the switches given.
$ orvixcli network ip interface ipv6 set -i pld9 -d true
! Unable to find a Pallad interface with the name pld9
[1]

$ orvixcli network ip interface ipv6 set -i pld0

$ orvixcli network ip interface ipv6 set -i pld0 --enable-dhcpv6 true --formatter=json
true

## DHCPv6 on, the flag as it was (off).
$ orvixcli network ip interface ipv6 get -n pld0 --formatter=csv
Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS
pld0,true,true,false

$ orvixcli network ip interface ipv6 set -i pld0 -P true -r false

$ orvixcli network ip interface ipv6 get -n pld0 --formatter=csv
Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS
pld0,true,false,true

## The flag is shared with IPv4: pld0 is static, so it does not show there,
## and an IPv6 change without -P keeps it.
$ orvixcli network ip interface ipv6 set -i pld0 -d false

$ orvixcli network ip interface ipv6 set -i pld0 -d true -r true

$ orvixcli network ip interface ipv6 get -n pld0 --formatter=csv
Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS
pld0,true,true,true

## network ip interface ipv6 address list: one row per address, the type
## and status in words; an interface without addresses shows nothing.
$ orvixcli network ip interface ipv6 address list
Interface  Address                      Netmask  Type      Status
---------  ---------------------------  -------  --------  ----------
pld0       2001:db8:10::21              64       STATIC    PREFERRED
pld0       2001:db8:10:0:a1:1ff:fe00:1  64       AUTOCONF  PREFERRED
pld0       2001:db8:11:0:a1:1ff:fe00:1  64       AUTOCONF  DEPRECATED
pld0       2001:db8:10::22              64       STATIC    DUPLICATED
pld1       2001:db8:20::21              128      DHCP      PREFERRED
pld2       2001:db8:30::21              64       STATIC    TENTATIVE

$ orvixcli network ip interface ipv6 address list -i pld1 --formatter=csv
Interface,Address,Netmask,Type,Status
pld1,2001:db8:20::21,128,DHCP,PREFERRED

$ orvixcli network ip interface ipv6 address list -i pld9
! Unable to find a Pallad interface with the name pld9
[1]

## network ip interface ipv6 address add: the text is checked before the
## interface is looked up.
$ orvixcli network ip interface ipv6 address add -i pld9 -I 2001:db8:40::1
! Invalid format for IPv6 address. Address must be in the format <ipv6-address>/<prefix-length>   Example: 1:2:3:4::/64
[1]

$ orvixcli network ip interface ipv6 address add -i pld0 -I 2001:db8:40::1/129
! Invalid format for IPv6 address. Address must be in the format <ipv6-address>/<prefix-length>   Example: 1:2:3:4::/64
[1]

$ orvixcli network ip interface ipv6 address add -i pld9 -I 2001:db8:40::1/64
! Unable to find a Pallad interface with the name pld9
[1]

$ orvixcli network ip interface ipv6 address add -i pld2 -I 2001:DB8:40:0::1/64

$ orvixcli network ip interface ipv6 address add -i pld2 --ipv6 2001:db8:40::1/64 --formatter=json
! Error adding IPv6 address for the interface pld2. Error was : The IPv6 address 2001:db8:40::1/64 is already configured
[1]

## The DNS flag of pld1 stays on when an address is added or removed.
$ orvixcli network ip interface ipv6 address add -i pld1 -I 2001:db8:20::99/64

$ orvixcli network ip interface ipv6 address list -i pld2
Interface  Address          Netmask  Type    Status
---------  ---------------  -------  ------  ---------
pld2       2001:db8:30::21  64       STATIC  TENTATIVE
pld2       2001:db8:40::1   64       STATIC  PREFERRED

$ orvixcli network ip interface ipv6 get -n pld1 --formatter=csv
Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS
pld1,true,false,true

## network ip interface ipv6 address remove: the address with its prefix.
$ orvixcli network ip interface ipv6 address remove -i pld9 -I 2001:db8:40::1
! Invalid format for IPv6 address. Address must be in the format <ipv6-address>/<prefix-length>   Example: 1:2:3:4::/64
[1]

$ orvixcli network ip interface ipv6 address remove -i pld9 -I 2001:db8:40::1/64
! Unable to find a Pallad interface with the name pld9
[1]

$ orvixcli network ip interface ipv6 address remove -i pld2 -I 2001:db8:40::1/48
! Error removing IPv6 address from the interface pld2. Error was : The IPv6 address 2001:db8:40::1/48 is not configured
[1]

$ orvixcli network ip interface ipv6 address remove -i pld2 -I 2001:db8:40::1/64

$ orvixcli network ip interface ipv6 address remove -i pld1 -I 2001:db8:20::21/128 --formatter=json
true

$ orvixcli network ip interface ipv6 address list --formatter=csv
Interface,Address,Netmask,Type,Status
pld0,2001:db8:10::21,64,STATIC,PREFERRED
pld0,2001:db8:10:0:a1:1ff:fe00:1,64,AUTOCONF,PREFERRED
pld0,2001:db8:11:0:a1:1ff:fe00:1,64,AUTOCONF,DEPRECATED
pld0,2001:db8:10::22,64,STATIC,DUPLICATED
pld1,2001:db8:20::99,64,STATIC,PREFERRED
pld2,2001:db8:30::21,64,STATIC,TENTATIVE

$ orvixcli network ip interface ipv6 get -n pld1 --formatter=csv
Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS
pld1,true,false,true

## -P false turns it off.
$ orvixcli network ip interface ipv6 set -i pld1 --peer-dns false --enable-router-adv true

$ orvixcli network ip interface ipv6 get
Name  DHCPv6 Enabled  Router Adv Enabled  DHCP DNS
----  --------------  ------------------  --------
pld0  true            true                true
pld1  true            true                false
pld2  false           false               false
