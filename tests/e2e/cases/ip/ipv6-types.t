## IPv6 address types and states in words; an address stored without them is
## static and preferred. (The host stores no other type, so the empty word of
## an unknown type is left to the plug-in's unit tests.) An interface without
## addresses shows no rows, and without IPv4 all zeros.
@profile fixtures/ip/addressing.json
$ orvixcli network ip interface ipv6 address list
Interface  Address                       Netmask  Type      Status
---------  ----------------------------  -------  --------  ----------
pld3       2001:db8:50::40               64       DHCP      DUPLICATED
pld3       2001:db8:50:0:a1:1ff:fe00:40  64       AUTOCONF  TENTATIVE
pld3       2001:db8:52::40               48       STATIC    PREFERRED

$ orvixcli network ip interface ipv6 address list -i pld12 --formatter=json
[]

$ orvixcli network ip interface ipv4 get --formatter=simple
   Name: pld3
   IPv4 Address: 198.51.100.40
   IPv4 Netmask: 255.255.252.0
   IPv4 Broadcast: 198.51.103.255
   Address Type: DHCP
   DHCP DNS: false

   Name: pld12
   IPv4 Address: 0.0.0.0
   IPv4 Netmask: 0.0.0.0
   IPv4 Broadcast: 255.255.255.255
   Address Type: NONE
   DHCP DNS: false

$ orvixcli network ip interface ipv6 get -N backupStack --formatter=json
[
  {
    "Name": "pld12",
    "DHCPv6 Enabled": false,
    "Router Adv Enabled": false,
    "DHCP DNS": false
  }
]

## DHCPv6 is on, the flag in force off: DHCP DNS false.
$ orvixcli network ip interface ipv6 get -n pld3
Name  DHCPv6 Enabled  Router Adv Enabled  DHCP DNS
----  --------------  ------------------  --------
pld3  true            true                false

$ orvixcli network ip interface ipv6 address remove -i pld3 -I 2001:db8:50::40/64

$ orvixcli network ip interface ipv6 address list -i pld3 --formatter=csv
Interface,Address,Netmask,Type,Status
pld3,2001:db8:50:0:a1:1ff:fe00:40,64,AUTOCONF,TENTATIVE
pld3,2001:db8:52::40,48,STATIC,PREFERRED
