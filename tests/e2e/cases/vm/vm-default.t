## The default host's five virtual machines.
$ orvixcli network vm list
World ID  Name     Num Ports  Networks
--------  -------  ---------  -------------------
1049601   web01    2          VM Network, dvpg-31
1049777   db01     2          VM Network, Storage
1050310   build01  1          dvpg-31
1050512   app01    2          Storage, dvpg-31
1051022   lab01    1          dvpg-31
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
## lab01's one port on the distributed switch leaves by no uplink now: no team
## uplink (its port id -1), and the VM's address is not known.
$ orvixcli network vm port list -w 1051022
   Port ID: 67108873
   vSwitch: dvSwitch0
   Portgroup: dvpg-31
   DVPort ID: 24
   MAC Address: 02:a1:02:00:00:08
   IP Address: 0.0.0.0
   Team Uplink: 
   Uplink Port ID: -1
   Active Filters: 
## app01 has a port on each kind of switch; the one on Storage is VLAN-tagged.
$ orvixcli network vm port list -w 1050512
   Port ID: 33554442
   vSwitch: vSwitch0
   Portgroup: Storage
   DVPort ID: 
   MAC Address: 02:a1:02:00:00:07
   IP Address: 198.51.100.160
   Team Uplink: hwnic0
   Uplink Port ID: 33554433
   Active Filters: 

   Port ID: 67108872
   vSwitch: dvSwitch0
   Portgroup: dvpg-31
   DVPort ID: 23
   MAC Address: 02:a1:02:00:00:06
   IP Address: 192.0.2.160
   Team Uplink: hwnic3
   Uplink Port ID: 67108866
   Active Filters: vm-firewall, packet-capture
