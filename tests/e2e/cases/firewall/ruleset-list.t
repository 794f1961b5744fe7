## The ruleset listings: every ruleset or one by label, in table (their
## default), simple and json; the rule code words; the allowed addresses by
## family and kind, and "All" for a ruleset that allows every address.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall ruleset list
Name       Enabled
---------  -------
sshServer  true
webAccess  true
ntpClient  false
dnsClient  false
syslog     true

$ orvixcli network firewall ruleset list --formatter=simple
   Name: sshServer
   Enabled: true

   Name: webAccess
   Enabled: true

   Name: ntpClient
   Enabled: false

   Name: dnsClient
   Enabled: false

   Name: syslog
   Enabled: true

$ orvixcli network firewall ruleset list --formatter=json
[
  {
    "Name": "sshServer",
    "Enabled": true
  },
  {
    "Name": "webAccess",
    "Enabled": true
  },
  {
    "Name": "ntpClient",
    "Enabled": false
  },
  {
    "Name": "dnsClient",
    "Enabled": false
  },
  {
    "Name": "syslog",
    "Enabled": true
  }
]

$ orvixcli network firewall ruleset list -r ntpClient
Name       Enabled
---------  -------
ntpClient  false

$ orvixcli network firewall ruleset list --ruleset-id=nosuch
! Ruleset Not Found: nosuch
[1]

$ orvixcli network firewall ruleset list --ruleset-id=
! Ruleset Not Found: 
[1]

## Rules: table wins over simple as the default.
$ orvixcli network firewall ruleset rule list
Ruleset    Direction  Protocol  Port Type  Port Begin  Port End
---------  ---------  --------  ---------  ----------  --------
sshServer  Inbound    TCP       Dst        22          22
webAccess  Inbound    TCP       Dst        443         443
webAccess  Inbound    TCP       Dst        80          80
ntpClient  Outbound   UDP       Dst        123         123
dnsClient  Inbound    UDP       Dst        53          53
dnsClient  Inbound    UDP       Src        53          53
dnsClient  Outbound   TCP       Src        1024        65535

$ orvixcli network firewall ruleset rule list --formatter=simple
   Ruleset: sshServer
   Direction: Inbound
   Protocol: TCP
   Port Type: Dst
   Port Begin: 22
   Port End: 22

   Ruleset: webAccess
   Direction: Inbound
   Protocol: TCP
   Port Type: Dst
   Port Begin: 443
   Port End: 443

   Ruleset: webAccess
   Direction: Inbound
   Protocol: TCP
   Port Type: Dst
   Port Begin: 80
   Port End: 80

   Ruleset: ntpClient
   Direction: Outbound
   Protocol: UDP
   Port Type: Dst
   Port Begin: 123
   Port End: 123

   Ruleset: dnsClient
   Direction: Inbound
   Protocol: UDP
   Port Type: Dst
   Port Begin: 53
   Port End: 53

   Ruleset: dnsClient
   Direction: Inbound
   Protocol: UDP
   Port Type: Src
   Port Begin: 53
   Port End: 53

   Ruleset: dnsClient
   Direction: Outbound
   Protocol: TCP
   Port Type: Src
   Port Begin: 1024
   Port End: 65535

$ orvixcli network firewall ruleset rule list -r dnsClient --formatter=json
[
  {
    "Ruleset": "dnsClient",
    "Direction": "Inbound",
    "Protocol": "UDP",
    "Port Type": "Dst",
    "Port Begin": 53,
    "Port End": 53
  },
  {
    "Ruleset": "dnsClient",
    "Direction": "Inbound",
    "Protocol": "UDP",
    "Port Type": "Src",
    "Port Begin": 53,
    "Port End": 53
  },
  {
    "Ruleset": "dnsClient",
    "Direction": "Outbound",
    "Protocol": "TCP",
    "Port Type": "Src",
    "Port Begin": 1024,
    "Port End": 65535
  }
]

## A ruleset without rules shows no row.
$ orvixcli network firewall ruleset rule list -r syslog
Ruleset  Direction  Protocol  Port Type  Port Begin  Port End
-------  ---------  --------  ---------  ----------  --------

$ orvixcli network firewall ruleset rule list -r nosuch
! Ruleset Not Found: nosuch
[1]

## IPv4 addresses, IPv6 addresses, IPv4 networks, IPv6 networks.
$ orvixcli network firewall ruleset allowedip list
Ruleset    Allowed IP Addresses
---------  ----------------------------------------------------------
sshServer  198.51.100.77, 2001:db8::5, 192.0.2.0/24, 2001:db8:10::/64
webAccess  All
ntpClient
dnsClient  All
syslog     203.0.113.0/24

$ orvixcli network firewall ruleset allowedip list --formatter=json
[
  {
    "Ruleset": "sshServer",
    "Allowed IP Addresses": [
      "198.51.100.77",
      "2001:db8::5",
      "192.0.2.0/24",
      "2001:db8:10::/64"
    ]
  },
  {
    "Ruleset": "webAccess",
    "Allowed IP Addresses": [
      "All"
    ]
  },
  {
    "Ruleset": "ntpClient",
    "Allowed IP Addresses": []
  },
  {
    "Ruleset": "dnsClient",
    "Allowed IP Addresses": [
      "All"
    ]
  },
  {
    "Ruleset": "syslog",
    "Allowed IP Addresses": [
      "203.0.113.0/24"
    ]
  }
]

$ orvixcli network firewall ruleset allowedip list -r webAccess --formatter=simple
   Ruleset: webAccess
   Allowed IP Addresses: All

$ orvixcli network firewall ruleset allowedip list -r nosuch
! Ruleset Not Found: nosuch
[1]

$ orvixcli network firewall ruleset allowedip list -r ntpClient --formatter=json
[
  {
    "Ruleset": "ntpClient",
    "Allowed IP Addresses": []
  }
]
