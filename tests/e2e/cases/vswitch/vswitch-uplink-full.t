## A switch with no free port takes no further uplink.
@profile fixtures/vswitch/switches-bare.json
$ orvixcli network vswitch standard add -v tiny -P 1

$ orvixcli network vswitch standard uplink add -v tiny -u hwnic0

$ orvixcli network vswitch standard uplink add -v tiny -u hwnic1
! Unable to add uplink hwnic1: virtual switch tiny has no free port
[1]

$ orvixcli network vswitch standard list --formatter=json
[
  {
    "Name": "tiny",
    "Class": "stdswitch",
    "Num Ports": 1,
    "Used Ports": 1,
    "Configured Ports": 1,
    "MTU": 1500,
    "CDP Status": "listen",
    "Beacon Enabled": false,
    "Beacon Interval": 1,
    "Beacon Threshold": 3,
    "Beacon Required By": [],
    "Uplinks": [
      "hwnic0"
    ],
    "Portgroups": []
  }
]
