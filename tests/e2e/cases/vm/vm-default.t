## The default host's three virtual machines.
$ orvixcli network vm list
World ID  Name     Num Ports  Networks
--------  -------  ---------  -------------------
1049601   web01    2          VM Network, dvpg-31
1049777   db01     2          VM Network, Storage
1050310   build01  1          dvpg-31
$ orvixcli network vm port list -w 1049601
   Port ID: 33554438
   vSwitch: vSwitch0
   Portgroup: VM Network
   DVPort ID: 
   MAC Address: 02:a1:02:00:00:01
   IP Address: 192.0.2.101
   Team Uplink: hwnic1
   Uplink Port ID: 33554434
   Active Filters: vm-firewall

   Port ID: 67108870
   vSwitch: dvSwitch0
   Portgroup: dvpg-31
   DVPort ID: 21
   MAC Address: 02:a1:02:00:00:05
   IP Address: 192.0.2.111
   Team Uplink: hwnic3
   Uplink Port ID: 67108866
   Active Filters: 
$ orvixcli network vm port list -w 1050310 --formatter=json
[
  {
    "Port ID": 67108869,
    "vSwitch": "dvSwitch0",
    "Portgroup": "dvpg-31",
    "DVPort ID": "20",
    "MAC Address": "02:a1:02:00:00:04",
    "IP Address": "192.0.2.150",
    "Team Uplink": "hwnic2",
    "Uplink Port ID": 67108865,
    "Active Filters": [
      "vm-firewall",
      "traffic-shaper"
    ]
  }
]
