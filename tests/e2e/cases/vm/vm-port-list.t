## The ports of one world in switch and port order: on a standard switch
## with an empty "DVPort ID", on a distributed one with the DV port and its
## port group. Filters attached in both directions are named once.
@profile fixtures/vm/worlds.json
$ orvixcli network vm port list --world-id 1000
   Port ID: 33554441
   vSwitch: vSwitch0
   Portgroup: VM Network
   DVPort ID: 
   MAC Address: 02:a1:02:00:10:00
   IP Address: 192.0.2.10
   Team Uplink: hwnic0
   Uplink Port ID: 33554433
   Active Filters: vm-firewall, ids

   Port ID: 33554442
   vSwitch: vSwitch0
   Portgroup: VM Network
   DVPort ID: 
   MAC Address: 02:a1:02:00:10:01
   IP Address: 0.0.0.0
   Team Uplink: hwnic0
   Uplink Port ID: 33554433
   Active Filters: 

   Port ID: 67108866
   vSwitch: dvSwitch0
   Portgroup: dvpg-50
   DVPort ID: 5
   MAC Address: 02:a1:02:00:10:02
   IP Address: 203.0.113.10
   Team Uplink: hwnic1
   Uplink Port ID: 67108865
   Active Filters: 
$ orvixcli network vm port list -w 1000 --formatter=json
[
  {
    "Port ID": 33554441,
    "vSwitch": "vSwitch0",
    "Portgroup": "VM Network",
    "DVPort ID": "",
    "MAC Address": "02:a1:02:00:10:00",
    "IP Address": "192.0.2.10",
    "Team Uplink": "hwnic0",
    "Uplink Port ID": 33554433,
    "Active Filters": [
      "vm-firewall",
      "ids"
    ]
  },
  {
    "Port ID": 33554442,
    "vSwitch": "vSwitch0",
    "Portgroup": "VM Network",
    "DVPort ID": "",
    "MAC Address": "02:a1:02:00:10:01",
    "IP Address": "0.0.0.0",
    "Team Uplink": "hwnic0",
    "Uplink Port ID": 33554433,
    "Active Filters": []
  },
  {
    "Port ID": 67108866,
    "vSwitch": "dvSwitch0",
    "Portgroup": "dvpg-50",
    "DVPort ID": "5",
    "MAC Address": "02:a1:02:00:10:02",
    "IP Address": "203.0.113.10",
    "Team Uplink": "hwnic1",
    "Uplink Port ID": 67108865,
    "Active Filters": []
  }
]
## A team uplink the host cannot follow shows as "" with uplink port -1:
## none at all (world 1500), a NIC the host does not have (1700), a NIC that
## is no uplink (the second port of 2000). The world's other ports are
## still shown.
$ orvixcli network vm port list -w 1500
   Port ID: 33554443
   vSwitch: vSwitch0
   Portgroup: Lab
   DVPort ID: 
   MAC Address: 02:a1:02:00:15:00
   IP Address: 198.51.100.15
   Team Uplink: 
   Uplink Port ID: -1
   Active Filters: 
$ orvixcli network vm port list -w 1700 --formatter=json
[
  {
    "Port ID": 33554444,
    "vSwitch": "vSwitch0",
    "Portgroup": "Lab",
    "DVPort ID": "",
    "MAC Address": "02:a1:02:00:17:00",
    "IP Address": "198.51.100.17",
    "Team Uplink": "",
    "Uplink Port ID": -1,
    "Active Filters": []
  }
]
$ orvixcli network vm port list -w 2000
   Port ID: 33554440
   vSwitch: vSwitch0
   Portgroup: VM Network
   DVPort ID: 
   MAC Address: 02:a1:02:00:20:00
   IP Address: 192.0.2.20
   Team Uplink: hwnic0
   Uplink Port ID: 33554433
   Active Filters: 

   Port ID: 33554445
   vSwitch: vSwitch0
   Portgroup: Lab
   DVPort ID: 
   MAC Address: 02:a1:02:00:20:01
   IP Address: 198.51.100.20
   Team Uplink: 
   Uplink Port ID: -1
   Active Filters: 

   Port ID: 67108867
   vSwitch: dvSwitch0
   Portgroup: dvpg-51
   DVPort ID: 6
   MAC Address: 02:a1:02:00:20:02
   IP Address: 203.0.113.20
   Team Uplink: hwnic1
   Uplink Port ID: 67108865
   Active Filters: 
## Worlds without ports, and ids that name no world: a running world with no
## port, negative ids, 0, and 2^32 + 1000, which is not world 1000.
$ orvixcli network vm port list -w 3000
! Couldn't find VM with given world ID
[1]
$ orvixcli network vm port list -w -5
! Couldn't find VM with given world ID
[1]
$ orvixcli network vm port list -w 0
! Couldn't find VM with given world ID
[1]
$ orvixcli network vm port list -w 4294968296
! Couldn't find VM with given world ID
[1]
