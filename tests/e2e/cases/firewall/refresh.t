## Refresh reloads the rulesets and keeps every dynamic rule, in order; a
## rule that cannot be added again does not cost the others.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall refresh

$ orvix-hostsim dump

## The second rule fails once: the first and third are added again, and the
## failure is reported.
$ orvix-hostsim fault add SystemInfoImpl::AddFirewallDynamicRule --key console-web01 --message "Unable to add rule console-web01" --count 1
1

$ orvixcli network firewall refresh

$ orvix-hostsim dump

## Every rule failing: each is tried, the first message is reported.
$ orvix-hostsim fault add SystemInfoImpl::AddFirewallDynamicRule --message "Unable to add a dynamic rule" --count 2
2

$ orvixcli network firewall refresh

$ orvix-hostsim dump

## With no dynamic rules left, refresh reloads and succeeds.
$ orvixcli network firewall refresh --formatter=json
