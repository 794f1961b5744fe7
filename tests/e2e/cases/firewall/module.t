## Unloading and loading the firewall module: the state shown while it is
## not loaded, the commands that need it, and the library's refusals of a
## module already in the state asked for.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall unload

## Unloading dropped the dynamic rules and the loaded rulesets.
$ orvix-hostsim dump

$ orvixcli network firewall get

$ orvixcli network firewall get --formatter=json

$ orvixcli network firewall set --enabled=false

$ orvixcli network firewall set

$ orvixcli network firewall unload

$ orvixcli network firewall refresh

## The rulesets are configuration: they are listed and changed while the
## module is not loaded.
$ orvixcli network firewall ruleset list

$ orvixcli network firewall ruleset set -r ntpClient -e true

## Loading applies the saved rulesets; the firewall's own settings were kept.
$ orvixcli network firewall load

$ orvixcli network firewall get

$ orvixcli network firewall load

$ orvix-hostsim dump
