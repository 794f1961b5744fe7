## Refresh reloads the rulesets and keeps every dynamic rule, in order; a
## rule that cannot be added again does not cost the others.
@profile fixtures/firewall/dynamic-rules.json

$ orvixcli network firewall refresh

$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "system": {
    "modules": [
      {
        "loaded": true,
        "name": "tovrinfw",
        "options": ""
      }
    ]
  },
  "firewall": {
    "defaultAction": "DROP",
    "dynamicRules": [
      {
        "direction": "inbound",
        "label": "migration-4411",
        "portBegin": 8100,
        "portEnd": 8103,
        "portType": "dst",
        "protocol": "tcp"
      },
      {
        "direction": "outbound",
        "label": "console-web01",
        "portBegin": 902,
        "portEnd": 902,
        "portType": "src",
        "protocol": "udp"
      },
      {
        "direction": "inbound",
        "label": "nfc-copy-77",
        "portBegin": 902,
        "portEnd": 902,
        "portType": "dst",
        "protocol": "tcp"
      }
    ],
    "enabled": true,
    "rulesetsLoaded": true
  }
}

## The second rule fails once: the first and third are added again, and the
## failure is reported.
$ orvix-hostsim fault add SystemInfoImpl::AddFirewallDynamicRule --key console-web01 --message "Unable to add rule console-web01" --count 1
1

$ orvixcli network firewall refresh
! Unable to add rule console-web01
[1]

$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "system": {
    "modules": [
      {
        "loaded": true,
        "name": "tovrinfw",
        "options": ""
      }
    ]
  },
  "firewall": {
    "defaultAction": "DROP",
    "dynamicRules": [
      {
        "direction": "inbound",
        "label": "migration-4411",
        "portBegin": 8100,
        "portEnd": 8103,
        "portType": "dst",
        "protocol": "tcp"
      },
      {
        "direction": "inbound",
        "label": "nfc-copy-77",
        "portBegin": 902,
        "portEnd": 902,
        "portType": "dst",
        "protocol": "tcp"
      }
    ],
    "enabled": true,
    "rulesetsLoaded": true
  }
}

## Every rule failing: each is tried, the first message is reported.
$ orvix-hostsim fault add SystemInfoImpl::AddFirewallDynamicRule --message "Unable to add a dynamic rule" --count 2
2

$ orvixcli network firewall refresh
! Unable to add a dynamic rule
[1]

$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "system": {
    "modules": [
      {
        "loaded": true,
        "name": "tovrinfw",
        "options": ""
      }
    ]
  },
  "firewall": {
    "defaultAction": "DROP",
    "dynamicRules": [],
    "enabled": true,
    "rulesetsLoaded": true
  }
}

## With no dynamic rules left, refresh reloads and succeeds.
$ orvixcli network firewall refresh --formatter=json
true
