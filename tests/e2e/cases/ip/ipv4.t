## network ip interface ipv4 get shows every interface, those of one
## netstack, or the one named; the address type decides whether the
## DNS-from-DHCP flag is shown.
$ orvixcli network ip interface ipv4 get
Name  IPv4 Address   IPv4 Netmask   IPv4 Broadcast  Address Type  DHCP DNS
----  -------------  -------------  --------------  ------------  --------
pld0  192.0.2.21     255.255.255.0  192.0.2.255     STATIC        false
pld1  198.51.100.21  255.255.255.0  198.51.100.255  DHCP          true
pld2  203.0.113.21   255.255.255.0  203.0.113.255   STATIC        false

$ orvixcli network ip interface ipv4 get --formatter=json
[
  {
    "Name": "pld0",
    "IPv4 Address": "192.0.2.21",
    "IPv4 Netmask": "255.255.255.0",
    "IPv4 Broadcast": "192.0.2.255",
    "Address Type": "STATIC",
    "DHCP DNS": false
  },
  {
    "Name": "pld1",
    "IPv4 Address": "198.51.100.21",
    "IPv4 Netmask": "255.255.255.0",
    "IPv4 Broadcast": "198.51.100.255",
    "Address Type": "DHCP",
    "DHCP DNS": true
  },
  {
    "Name": "pld2",
    "IPv4 Address": "203.0.113.21",
    "IPv4 Netmask": "255.255.255.0",
    "IPv4 Broadcast": "203.0.113.255",
    "Address Type": "STATIC",
    "DHCP DNS": false
  }
]

$ orvixcli network ip interface ipv4 get -N migrix --formatter=simple
   Name: pld2
   IPv4 Address: 203.0.113.21
   IPv4 Netmask: 255.255.255.0
   IPv4 Broadcast: 203.0.113.255
   Address Type: STATIC
   DHCP DNS: false

## A netstack without interfaces gives an empty list.
$ orvixcli network ip interface ipv4 get --netstack faultTolerance --formatter=json
[]

## A name wins over a netstack.
$ orvixcli network ip interface ipv4 get -i pld1 -N migrix
Name  IPv4 Address   IPv4 Netmask   IPv4 Broadcast  Address Type  DHCP DNS
----  -------------  -------------  --------------  ------------  --------
pld1  198.51.100.21  255.255.255.0  198.51.100.255  DHCP          true

$ orvixcli network ip interface ipv4 get -i pld9 --formatter=json
! Unable to find a Pallad interface with the name pld9
[1]

## network ip interface ipv4 set --type static: the three checks all run,
## in their order, and nothing changes when one fails.
$ orvixcli network ip interface ipv4 set -i pld0 -t static
! The --type=static requires the --ipv4 and --netmask options.
! Invalid --ipv4 option provided. This address is not a valid IPv4 address
! Invalid --netmask option provided. This address is not a valid IPv4 address
[1]

$ orvixcli network ip interface ipv4 set -i pld0 -t static --ipv4 192.0.2.300 --netmask 255.255.255.0
! Invalid --ipv4 option provided. This address is not a valid IPv4 address
[1]

$ orvixcli network ip interface ipv4 set -i pld0 -t static --ipv4 192.0.2.30
! The --type=static requires the --ipv4 and --netmask options.
! Invalid --netmask option provided. This address is not a valid IPv4 address
[1]

## The interface is looked up before the options are checked.
$ orvixcli network ip interface ipv4 set -i pld9 -t static
! Unable to find a Pallad interface with the name pld9
[1]

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=simple
   Name: pld0
   IPv4 Address: 192.0.2.21
   IPv4 Netmask: 255.255.255.0
   IPv4 Broadcast: 192.0.2.255
   Address Type: STATIC
   DHCP DNS: false

## A netmask need only be an IPv4 address; its bits need not be contiguous.
$ orvixcli network ip interface ipv4 set -i pld0 -t static -I 192.0.2.30 -N 255.0.255.0

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=simple
   Name: pld0
   IPv4 Address: 192.0.2.30
   IPv4 Netmask: 255.0.255.0
   IPv4 Broadcast: 192.255.2.255
   Address Type: STATIC
   DHCP DNS: false

## --type must be one of its three words.
$ orvixcli network ip interface ipv4 set -i pld0 -t bootp
! orvixcli: Invalid value 'bootp' for --type: it must be one of static, dhcp, none
! Run 'orvixcli network ip interface ipv4 set --help' for its options.
[2]

## dhcp: without --peer-dns the flag stays as it was (off for pld0) ...
$ orvixcli network ip interface ipv4 set -i pld0 -t dhcp

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=csv
Name,IPv4 Address,IPv4 Netmask,IPv4 Broadcast,Address Type,DHCP DNS
pld0,192.0.2.30,255.0.255.0,192.255.2.255,DHCP,false

## ... and with it the flag is set.
$ orvixcli network ip interface ipv4 set -i pld0 -t dhcp --peer-dns true

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=csv
Name,IPv4 Address,IPv4 Netmask,IPv4 Broadcast,Address Type,DHCP DNS
pld0,192.0.2.30,255.0.255.0,192.255.2.255,DHCP,true

## A static address keeps the flag in force although it is not shown, and
## ignores --peer-dns: going back to DHCP shows the flag still on.
$ orvixcli network ip interface ipv4 set -i pld0 -t static -I 192.0.2.31 -N 255.255.255.0 -P false

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=csv
Name,IPv4 Address,IPv4 Netmask,IPv4 Broadcast,Address Type,DHCP DNS
pld0,192.0.2.31,255.255.255.0,192.0.2.255,STATIC,false

$ orvixcli network ip interface ipv4 set -i pld0 -t dhcp

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=csv
Name,IPv4 Address,IPv4 Netmask,IPv4 Broadcast,Address Type,DHCP DNS
pld0,192.0.2.31,255.255.255.0,192.0.2.255,DHCP,true

## The flag is shared with IPv6: pld1 uses DNS from DHCP, and an IPv4 change
## that does not name it keeps it for DHCPv6 too.
$ orvixcli network ip interface ipv6 get -n pld1 --formatter=csv
Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS
pld1,true,false,true

$ orvixcli network ip interface ipv4 set -i pld1 -t none

$ orvixcli network ip interface ipv4 get -i pld1 --formatter=csv
Name,IPv4 Address,IPv4 Netmask,IPv4 Broadcast,Address Type,DHCP DNS
pld1,0.0.0.0,0.0.0.0,255.255.255.255,NONE,false

$ orvixcli network ip interface ipv6 get -n pld1 --formatter=csv
Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS
pld1,true,false,true

$ orvixcli network ip interface ipv4 set --interface-name pld1 --type dhcp --formatter=json
true

$ orvixcli network ip interface ipv4 get -i pld1
Name  IPv4 Address  IPv4 Netmask  IPv4 Broadcast   Address Type  DHCP DNS
----  ------------  ------------  ---------------  ------------  --------
pld1  0.0.0.0       0.0.0.0       255.255.255.255  DHCP          true
