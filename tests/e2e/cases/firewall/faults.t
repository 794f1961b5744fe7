## The library's failures in every firewall command reach the user with its
## message (behind "Unable to get firewall status." for get); a failed
## lookup in a listing names the label instead.
@profile fixtures/firewall/firewall.json

$ orvix-hostsim fault add ModuleImpl::IsLoaded --key tovrinfw --message "Unable to query module tovrinfw" --count 2
1

$ orvixcli network firewall get
! Unable to get firewall status.
! Unable to query module tovrinfw
[1]

$ orvixcli network firewall set -e false
! Unable to query module tovrinfw
[1]

$ orvix-hostsim fault add SystemInfoImpl::GetFirewallDefaultAction --message "Unable to read the default action" --count 2
2

$ orvixcli network firewall get
! Unable to get firewall status.
! Unable to read the default action
[1]

$ orvixcli network firewall set -e false
! Unable to read the default action
[1]

## The refused read came before any change.
$ orvixcli network firewall get
   Loaded: true
   Enabled: true
   DefaultAction: DROP

$ orvix-hostsim fault add SystemInfoImpl::SetFirewallDefaultAction --message "Unable to set the default action" --count 1
3

$ orvixcli network firewall set -e false -d true
! Unable to set the default action
[1]

$ orvixcli network firewall get
   Loaded: true
   Enabled: false
   DefaultAction: DROP

$ orvix-hostsim fault add ModuleImpl::Load --key tovrinfw --message "Unable to load module tovrinfw" --count 1
4

$ orvixcli network firewall load
! Unable to load module tovrinfw
[1]

$ orvix-hostsim fault add SystemInfoImpl::DestroyFirewallFilters --message "Unable to destroy the filters" --count 1
5

$ orvixcli network firewall unload
! Unable to destroy the filters
[1]

$ orvixcli network firewall get
   Loaded: true
   Enabled: false
   DefaultAction: DROP

$ orvix-hostsim fault add SystemInfoImpl::LoadFirewallRulesets --message "Unable to load the rulesets" --count 2
6

$ orvixcli network firewall refresh
! Unable to load the rulesets
[1]

$ orvixcli network firewall unload

$ orvixcli network firewall load
! Unable to load the rulesets
[1]

$ orvixcli network firewall get
   Loaded: true
   Enabled: false
   DefaultAction: DROP

$ orvix-hostsim fault add SystemInfoImpl::GetFirewallRulesets --message "Unable to list the rulesets" --count 3
7

$ orvixcli network firewall ruleset list
! Unable to list the rulesets
[1]

$ orvixcli network firewall ruleset rule list
! Unable to list the rulesets
[1]

$ orvixcli network firewall ruleset allowedip list
! Unable to list the rulesets
[1]

$ orvix-hostsim fault add SystemInfoImpl::GetFirewallRulesetById --key sshServer --message "Unable to read ruleset sshServer" --count 6
8

$ orvixcli network firewall ruleset list -r sshServer
! Failed to check loaded status: sshServer
[1]

$ orvixcli network firewall ruleset rule list -r sshServer
! Failed to check loaded status: sshServer
[1]

$ orvixcli network firewall ruleset allowedip list -r sshServer
! Failed to check loaded status: sshServer
[1]

$ orvixcli network firewall ruleset set -r sshServer -e false
! Unable to read ruleset sshServer
[1]

$ orvixcli network firewall ruleset allowedip add -r sshServer -i 192.0.2.1
! Unable to read ruleset sshServer
[1]

$ orvixcli network firewall ruleset allowedip remove -r sshServer -i 192.0.2.0/24
! Unable to read ruleset sshServer
[1]

$ orvix-hostsim fault add FirewallRulesetImpl::GetRules --key dnsClient --message "Unable to read the rules of dnsClient" --count 1
9

$ orvixcli network firewall ruleset rule list
! Unable to read the rules of dnsClient
[1]

$ orvix-hostsim fault add FirewallRulesetImpl::GetAllowedIpList --key syslog --message "Unable to read the allowed list of syslog" --count 1
10

$ orvixcli network firewall ruleset allowedip list
! Unable to read the allowed list of syslog
[1]

$ orvix-hostsim fault add FirewallRulesetImpl::SetAllowedAll --key sshServer --message "Unable to change ruleset sshServer" --count 1
11

$ orvixcli network firewall ruleset set -r sshServer -a true -e false
! Unable to change ruleset sshServer
[1]

$ orvixcli network firewall ruleset list -r sshServer
Name       Enabled
---------  -------
sshServer  true

$ orvix-hostsim fault add FirewallRulesetImpl::AddAllowedIp --message "Unable to change an allowed list" --count 1
12

$ orvix-hostsim fault add FirewallRulesetImpl::RemoveAllowedIp --message "Unable to change an allowed list" --count 1
13

$ orvixcli network firewall ruleset allowedip add -r sshServer -i 192.0.2.1
! Unable to change an allowed list
[1]

$ orvixcli network firewall ruleset allowedip remove -r sshServer -i 192.0.2.0/24
! Unable to change an allowed list
[1]

$ orvixcli network firewall ruleset allowedip list -r sshServer
Ruleset    Allowed IP Addresses
---------  ----------------------------------------------------------
sshServer  198.51.100.77, 2001:db8::5, 192.0.2.0/24, 2001:db8:10::/64
