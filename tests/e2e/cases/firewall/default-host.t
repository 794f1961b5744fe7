## The default host's firewall: loaded, enabled, dropping by default, with a
## dozen rulesets.
$ orvixcli network firewall get

$ orvixcli network firewall ruleset list

$ orvixcli network firewall ruleset rule list

$ orvixcli network firewall ruleset allowedip list
