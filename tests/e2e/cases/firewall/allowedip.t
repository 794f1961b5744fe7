## Adding and removing allowed addresses: both families, networks, the
## canonical text, the checks in their order and the library's refusals.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 192.0.2.123

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 2001:DB8:0:0::7B

$ orvixcli network firewall ruleset allowedip add -r ntpClient --ip-address 198.51.100.0/255.255.255.0

$ orvixcli network firewall ruleset allowedip add -r ntpClient --ip-address 2001:db8:50::/48

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 203.0.113.123

$ orvixcli network firewall ruleset allowedip list -r ntpClient
Ruleset    Allowed IP Addresses
---------  ---------------------------------------------------------------------------
ntpClient  192.0.2.123, 203.0.113.123, 2001:db8::7b, 198.51.100.0/24, 2001:db8:50::/48

$ orvixcli network firewall ruleset allowedip list -r ntpClient --formatter=json
[
  {
    "Ruleset": "ntpClient",
    "Allowed IP Addresses": [
      "192.0.2.123",
      "203.0.113.123",
      "2001:db8::7b",
      "198.51.100.0/24",
      "2001:db8:50::/48"
    ]
  }
]

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 2001:db8::7b
! Allowed IP 2001:db8::7b is already in ruleset ntpClient
[1]

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 203.0.113.9/24
! Invalid allowed IP network '203.0.113.9/24': host bits are set, use 203.0.113.0/24
[1]

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i ntp.example.test
! Invalid allowed IP 'ntp.example.test': use an IPv4 or IPv6 address, or a network written address/prefix
[1]

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 192.0.2.1-192.0.2.9
! Invalid allowed IP '192.0.2.1-192.0.2.9': use an IPv4 or IPv6 address, or a network written address/prefix
[1]

## The order of the checks: the ruleset, its flag, then the address.
$ orvixcli network firewall ruleset allowedip add -r nosuch -i ""
! Invalid Ruleset Id.
[1]

$ orvixcli network firewall ruleset allowedip add -r webAccess -i ""
! Couldn't update allowed ip list when allowed-all flag is true.
[1]

$ orvixcli network firewall ruleset allowedip add -r webAccess -i 192.0.2.1
! Couldn't update allowed ip list when allowed-all flag is true.
[1]

$ orvixcli network firewall ruleset allowedip remove -r webAccess -i 192.0.2.1
! Couldn't update allowed ip list when allowed-all flag is true.
[1]

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i ""
! Invalid allowedip parameter.
[1]

$ orvixcli network firewall ruleset allowedip remove -r ntpClient --ip-address=
! Invalid allowedip parameter.
[1]

$ orvixcli network firewall ruleset allowedip add -i 192.0.2.1
! orvixcli: Missing required option --ruleset-id
! Run 'orvixcli network firewall ruleset allowedip add --help' for its options.
[2]

$ orvixcli network firewall ruleset allowedip remove -r ntpClient
! orvixcli: Missing required option --ip-address
! Run 'orvixcli network firewall ruleset allowedip remove --help' for its options.
[2]

$ orvixcli network firewall ruleset allowedip remove -r ntpClient -i 2001:db8:0::7b

$ orvixcli network firewall ruleset allowedip remove -r ntpClient -i 198.51.100.0/24 --formatter=json
true

$ orvixcli network firewall ruleset allowedip remove -r ntpClient -i 198.51.100.0/24
! Allowed IP 198.51.100.0/24 is not in ruleset ntpClient
[1]

$ orvixcli network firewall ruleset allowedip remove -r nosuch -i 192.0.2.123
! Invalid Ruleset Id.
[1]

$ orvixcli network firewall ruleset allowedip list -r ntpClient --formatter=simple
   Ruleset: ntpClient
   Allowed IP Addresses: 192.0.2.123, 203.0.113.123, 2001:db8:50::/48
