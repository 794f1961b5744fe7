## A host that never had the firewall module: it reads as not loaded, and
## loading it adds it with the firewall's defaults.
@profile fixtures/firewall/empty.json

$ orvixcli network firewall get
   Loaded: false
   Enabled: false
   DefaultAction: PASS

$ orvixcli network firewall unload
! Module tovrinfw is not loaded
[1]

$ orvixcli network firewall load

$ orvixcli network firewall get
   Loaded: true
   Enabled: true
   DefaultAction: DROP

$ orvixcli network firewall ruleset list
Name  Enabled
----  -------

$ orvixcli network firewall ruleset list --formatter=json
[]

$ orvixcli network firewall ruleset rule list
Ruleset  Direction  Protocol  Port Type  Port Begin  Port End
-------  ---------  --------  ---------  ----------  --------

$ orvixcli network firewall ruleset allowedip list --formatter=json
[]

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
  "firewall": {}
}
