## Switching rulesets on and off and between allowing all addresses and
## their list: the rules in their order and their messages.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall ruleset set -r nosuch
! Need parameter --enabled or --allowed-all
[1]

$ orvixcli network firewall ruleset set -r nosuch -e true
! Invalid Ruleset Id.
[1]

$ orvixcli network firewall ruleset set -e true
! orvixcli: Missing required option --ruleset-id
! Run 'orvixcli network firewall ruleset set --help' for its options.
[2]

$ orvixcli network firewall ruleset set -r webAccess --allowed-all=true
! Already allowed all ip
[1]

$ orvixcli network firewall ruleset set -r sshServer --allowed-all=false
! Already use allowed ip list
[1]

## A refused flag leaves the enabled state as it was.
$ orvixcli network firewall ruleset set -r ntpClient --allowed-all=false --enabled=true
! Already use allowed ip list
[1]

$ orvixcli network firewall ruleset list -r ntpClient
Name       Enabled
---------  -------
ntpClient  false

## An equal enabled state is accepted.
$ orvixcli network firewall ruleset set -r sshServer -e true

## The flag first, then the enabled state.
$ orvixcli network firewall ruleset set -r ntpClient --allowed-all=true --enabled=true

$ orvixcli network firewall ruleset list
Name       Enabled
---------  -------
sshServer  true
webAccess  true
ntpClient  true
dnsClient  false
syslog     true

$ orvixcli network firewall ruleset allowedip list -r ntpClient
Ruleset    Allowed IP Addresses
---------  --------------------
ntpClient  All

$ orvixcli network firewall ruleset set -r sshServer -a true -e false --formatter=json
true

$ orvixcli network firewall ruleset allowedip list -r sshServer
Ruleset    Allowed IP Addresses
---------  --------------------
sshServer  All

$ orvixcli network firewall ruleset set -r sshServer -a false

## The list was kept while every address was allowed.
$ orvixcli network firewall ruleset allowedip list -r sshServer
Ruleset    Allowed IP Addresses
---------  ----------------------------------------------------------
sshServer  198.51.100.77, 2001:db8::5, 192.0.2.0/24, 2001:db8:10::/64

$ orvixcli network firewall ruleset list --formatter=json
[
  {
    "Name": "sshServer",
    "Enabled": false
  },
  {
    "Name": "webAccess",
    "Enabled": true
  },
  {
    "Name": "ntpClient",
    "Enabled": true
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
