## Switching rulesets on and off and between allowing all addresses and
## their list: the rules in their order and their messages.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall ruleset set -r nosuch

$ orvixcli network firewall ruleset set -r nosuch -e true

$ orvixcli network firewall ruleset set -e true

$ orvixcli network firewall ruleset set -r webAccess --allowed-all=true

$ orvixcli network firewall ruleset set -r sshServer --allowed-all=false

## A refused flag leaves the enabled state as it was.
$ orvixcli network firewall ruleset set -r ntpClient --allowed-all=false --enabled=true

$ orvixcli network firewall ruleset list -r ntpClient

## An equal enabled state is accepted.
$ orvixcli network firewall ruleset set -r sshServer -e true

## The flag first, then the enabled state.
$ orvixcli network firewall ruleset set -r ntpClient --allowed-all=true --enabled=true

$ orvixcli network firewall ruleset list

$ orvixcli network firewall ruleset allowedip list -r ntpClient

$ orvixcli network firewall ruleset set -r sshServer -a true -e false --formatter=json

$ orvixcli network firewall ruleset allowedip list -r sshServer

$ orvixcli network firewall ruleset set -r sshServer -a false

## The list was kept while every address was allowed.
$ orvixcli network firewall ruleset allowedip list -r sshServer

$ orvixcli network firewall ruleset list --formatter=json
