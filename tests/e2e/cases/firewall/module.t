## Unloading and loading the firewall module: the state shown while it is
## not loaded, the commands that need it, and the library's refusals of a
## module already in the state asked for.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall unload

## Unloading dropped the dynamic rules and the loaded rulesets.
$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "system": {
    "hostname": "fw.example.test",
    "modules": [
      {
        "loaded": false,
        "name": "tovrinfw",
        "options": ""
      }
    ]
  },
  "firewall": {
    "defaultAction": "DROP",
    "dynamicRules": [],
    "enabled": true,
    "rulesetsLoaded": false
  },
  "firewallRulesets": [
    {
      "allowedAll": false,
      "allowedIps": [
        "2001:db8:10::/64",
        "192.0.2.0/24",
        "198.51.100.77",
        "2001:db8::5"
      ],
      "enabled": true,
      "name": "sshServer",
      "rules": [
        {
          "direction": "inbound",
          "portBegin": 22,
          "portEnd": 22,
          "portType": "dst",
          "protocol": "tcp"
        }
      ]
    },
    {
      "allowedAll": true,
      "enabled": true,
      "name": "webAccess",
      "rules": [
        {
          "direction": "inbound",
          "portBegin": 443,
          "portType": "dst",
          "protocol": "tcp"
        },
        {
          "direction": "inbound",
          "portBegin": 80,
          "portEnd": 80,
          "portType": "dst",
          "protocol": "tcp"
        }
      ]
    },
    {
      "allowedAll": false,
      "allowedIps": [],
      "enabled": false,
      "name": "ntpClient",
      "rules": [
        {
          "direction": "outbound",
          "portBegin": 123,
          "portEnd": 123,
          "portType": "dst",
          "protocol": "udp"
        }
      ]
    },
    {
      "allowedAll": true,
      "enabled": false,
      "name": "dnsClient",
      "rules": [
        {
          "direction": "inbound",
          "portBegin": 53,
          "portEnd": 53,
          "portType": "dst",
          "protocol": "udp"
        },
        {
          "direction": "inbound",
          "portBegin": 53,
          "portEnd": 53,
          "portType": "src",
          "protocol": "udp"
        },
        {
          "direction": "outbound",
          "portBegin": 1024,
          "portEnd": 65535,
          "portType": "src",
          "protocol": "tcp"
        }
      ]
    },
    {
      "allowedAll": false,
      "allowedIps": [
        "203.0.113.0/24"
      ],
      "enabled": true,
      "name": "syslog"
    }
  ]
}

$ orvixcli network firewall get
   Loaded: false
   Enabled: false
   DefaultAction: PASS

$ orvixcli network firewall get --formatter=json
{
  "Loaded": false,
  "Enabled": false,
  "DefaultAction": "PASS"
}

$ orvixcli network firewall set --enabled=false
! Firewall module is not loaded
[1]

$ orvixcli network firewall set
! Need parameter --enabled or --default-action
[1]

$ orvixcli network firewall unload
! Module tovrinfw is not loaded
[1]

$ orvixcli network firewall refresh
! The firewall module tovrinfw is not loaded
[1]

## The rulesets are configuration: they are listed and changed while the
## module is not loaded.
$ orvixcli network firewall ruleset list
Name       Enabled
---------  -------
sshServer  true
webAccess  true
ntpClient  false
dnsClient  false
syslog     true

$ orvixcli network firewall ruleset set -r ntpClient -e true

## Loading applies the saved rulesets; the firewall's own settings were kept.
$ orvixcli network firewall load

$ orvixcli network firewall get
   Loaded: true
   Enabled: true
   DefaultAction: DROP

$ orvixcli network firewall load
! Module tovrinfw is already loaded
[1]

$ orvix-hostsim dump
{
  "format": "orvix-host-profile",
  "version": 1,
  "system": {
    "hostname": "fw.example.test",
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
  },
  "firewallRulesets": [
    {
      "allowedAll": false,
      "allowedIps": [
        "2001:db8:10::/64",
        "192.0.2.0/24",
        "198.51.100.77",
        "2001:db8::5"
      ],
      "enabled": true,
      "name": "sshServer",
      "rules": [
        {
          "direction": "inbound",
          "portBegin": 22,
          "portEnd": 22,
          "portType": "dst",
          "protocol": "tcp"
        }
      ]
    },
    {
      "allowedAll": true,
      "enabled": true,
      "name": "webAccess",
      "rules": [
        {
          "direction": "inbound",
          "portBegin": 443,
          "portType": "dst",
          "protocol": "tcp"
        },
        {
          "direction": "inbound",
          "portBegin": 80,
          "portEnd": 80,
          "portType": "dst",
          "protocol": "tcp"
        }
      ]
    },
    {
      "allowedAll": false,
      "allowedIps": [],
      "enabled": true,
      "name": "ntpClient",
      "rules": [
        {
          "direction": "outbound",
          "portBegin": 123,
          "portEnd": 123,
          "portType": "dst",
          "protocol": "udp"
        }
      ]
    },
    {
      "allowedAll": true,
      "enabled": false,
      "name": "dnsClient",
      "rules": [
        {
          "direction": "inbound",
          "portBegin": 53,
          "portEnd": 53,
          "portType": "dst",
          "protocol": "udp"
        },
        {
          "direction": "inbound",
          "portBegin": 53,
          "portEnd": 53,
          "portType": "src",
          "protocol": "udp"
        },
        {
          "direction": "outbound",
          "portBegin": 1024,
          "portEnd": 65535,
          "portType": "src",
          "protocol": "tcp"
        }
      ]
    },
    {
      "allowedAll": false,
      "allowedIps": [
        "203.0.113.0/24"
      ],
      "enabled": true,
      "name": "syslog"
    }
  ]
}
