## A host that never had the firewall module: it reads as not loaded, and
## loading it adds it with the firewall's defaults.
@profile fixtures/firewall/empty.json

$ orvixcli network firewall get

$ orvixcli network firewall unload

$ orvixcli network firewall load

$ orvixcli network firewall get

$ orvixcli network firewall ruleset list

$ orvixcli network firewall ruleset list --formatter=json

$ orvixcli network firewall ruleset rule list

$ orvixcli network firewall ruleset allowedip list --formatter=json

$ orvix-hostsim dump
