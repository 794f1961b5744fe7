## The ruleset listings: every ruleset or one by label, in table (their
## default), simple and json; the rule code words; the allowed addresses by
## family and kind, and "All" for a ruleset that allows every address.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall ruleset list

$ orvixcli network firewall ruleset list --formatter=simple

$ orvixcli network firewall ruleset list --formatter=json

$ orvixcli network firewall ruleset list -r ntpClient

$ orvixcli network firewall ruleset list --ruleset-id=nosuch

$ orvixcli network firewall ruleset list --ruleset-id=

## Rules: table wins over simple as the default.
$ orvixcli network firewall ruleset rule list

$ orvixcli network firewall ruleset rule list --formatter=simple

$ orvixcli network firewall ruleset rule list -r dnsClient --formatter=json

## A ruleset without rules shows no row.
$ orvixcli network firewall ruleset rule list -r syslog

$ orvixcli network firewall ruleset rule list -r nosuch

## IPv4 addresses, IPv6 addresses, IPv4 networks, IPv6 networks.
$ orvixcli network firewall ruleset allowedip list

$ orvixcli network firewall ruleset allowedip list --formatter=json

$ orvixcli network firewall ruleset allowedip list -r webAccess --formatter=simple

$ orvixcli network firewall ruleset allowedip list -r nosuch

$ orvixcli network firewall ruleset allowedip list -r ntpClient --formatter=json
