## IPv6 address types and states in words. A type or state the host does
## not know is stored as static and preferred; an interface without
## addresses and with IPv4 none shows all zeros and no rows.
@profile fixtures/ip/addressing.json
$ orvixcli network ip interface ipv6 address list

$ orvixcli network ip interface ipv6 address list -i pld12 --formatter=json

$ orvixcli network ip interface ipv4 get --formatter=simple

$ orvixcli network ip interface ipv6 get -N backupStack --formatter=json

## DHCPv6 is on, the flag in force off: DHCP DNS false.
$ orvixcli network ip interface ipv6 get -n pld3

$ orvixcli network ip interface ipv6 address remove -i pld3 -I 2001:db8:50::40/64

$ orvixcli network ip interface ipv6 address list -i pld3 --formatter=csv
