## The default host's distributed switch with its DV ports: those in use
## name their clients, free ones show an empty client list.
$ orvixcli network vswitch dvs orvix list
dvSwitch0
   Name: dvSwitch0
   VDS ID: 6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4
   Class: dvswitch
   Num Ports: 512
   Used Ports: 9
   Configured Ports: 9
   MTU: 9000
   CDP Status: listen
   Beacon Timeout: -1
   Uplinks: hwnic2, hwnic3, hwnic5, hwnic7
   Orvix Branded: true
   DVPort:
      Port ID: 0
      In Use: true
      DVPortgroup ID: dvpg-30
      Client: hwnic2

      Port ID: 1
      In Use: true
      DVPortgroup ID: dvpg-30
      Client: hwnic3

      Port ID: 2
      In Use: true
      DVPortgroup ID: dvpg-30
      Client: hwnic5

      Port ID: 3
      In Use: true
      DVPortgroup ID: dvpg-30
      Client: hwnic7

      Port ID: 10
      In Use: true
      DVPortgroup ID: dvpg-32
      Client: pld1

      Port ID: 11
      In Use: false
      DVPortgroup ID: dvpg-32
      Client: 

      Port ID: 20
      In Use: true
      DVPortgroup ID: dvpg-31
      Client: build01.eth0

      Port ID: 21
      In Use: true
      DVPortgroup ID: dvpg-31
      Client: web01.eth1

      Port ID: 22
      In Use: false
      DVPortgroup ID: dvpg-31
      Client: 

      Port ID: 23
      In Use: true
      DVPortgroup ID: dvpg-31
      Client: app01.eth0

      Port ID: 24
      In Use: true
      DVPortgroup ID: dvpg-31
      Client: lab01.eth0
$ orvixcli network vswitch dvs orvix list --formatter=json
[
  {
    "Name": "dvSwitch0",
    "VDS ID": "6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4",
    "Class": "dvswitch",
    "Num Ports": 512,
    "Used Ports": 9,
    "Configured Ports": 9,
    "MTU": 9000,
    "CDP Status": "listen",
    "Beacon Timeout": -1,
    "Uplinks": [
      "hwnic2",
      "hwnic3",
      "hwnic5",
      "hwnic7"
    ],
    "Orvix Branded": true,
    "DVPort": [
      {
        "Port ID": "0",
        "In Use": true,
        "DVPortgroup ID": "dvpg-30",
        "Client": [
          "hwnic2"
        ]
      },
      {
        "Port ID": "1",
        "In Use": true,
        "DVPortgroup ID": "dvpg-30",
        "Client": [
          "hwnic3"
        ]
      },
      {
        "Port ID": "2",
        "In Use": true,
        "DVPortgroup ID": "dvpg-30",
        "Client": [
          "hwnic5"
        ]
      },
      {
        "Port ID": "3",
        "In Use": true,
        "DVPortgroup ID": "dvpg-30",
        "Client": [
          "hwnic7"
        ]
      },
      {
        "Port ID": "10",
        "In Use": true,
        "DVPortgroup ID": "dvpg-32",
        "Client": [
          "pld1"
        ]
      },
      {
        "Port ID": "11",
        "In Use": false,
        "DVPortgroup ID": "dvpg-32",
        "Client": []
      },
      {
        "Port ID": "20",
        "In Use": true,
        "DVPortgroup ID": "dvpg-31",
        "Client": [
          "build01.eth0"
        ]
      },
      {
        "Port ID": "21",
        "In Use": true,
        "DVPortgroup ID": "dvpg-31",
        "Client": [
          "web01.eth1"
        ]
      },
      {
        "Port ID": "22",
        "In Use": false,
        "DVPortgroup ID": "dvpg-31",
        "Client": []
      },
      {
        "Port ID": "23",
        "In Use": true,
        "DVPortgroup ID": "dvpg-31",
        "Client": [
          "app01.eth0"
        ]
      },
      {
        "Port ID": "24",
        "In Use": true,
        "DVPortgroup ID": "dvpg-31",
        "Client": [
          "lab01.eth0"
        ]
      }
    ]
  }
]
## One switch by name; a name no switch has ends the walk at once: the error
## and an empty list.
$ orvixcli network vswitch dvs orvix list -v dvSwitch0 --formatter=table
Name       VDS ID                                Class     Num Ports  Used Ports  Configured Ports  MTU   CDP Status  Beacon Timeout  Uplinks                         Orvix Branded  DVPort
---------  ------------------------------------  --------  ---------  ----------  ----------------  ----  ----------  --------------  ------------------------------  -------------  --------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------------
dvSwitch0  6f3c2a10-4b7e-4d21-9c5a-0e8d7f61b2a4  dvswitch  512        9           9                 9000  listen      -1              hwnic2, hwnic3, hwnic5, hwnic7  true           {Port ID: 0, In Use: true, DVPortgroup ID: dvpg-30, Client: hwnic2}, {Port ID: 1, In Use: true, DVPortgroup ID: dvpg-30, Client: hwnic3}, {Port ID: 2, In Use: true, DVPortgroup ID: dvpg-30, Client: hwnic5}, {Port ID: 3, In Use: true, DVPortgroup ID: dvpg-30, Client: hwnic7}, {Port ID: 10, In Use: true, DVPortgroup ID: dvpg-32, Client: pld1}, {Port ID: 11, In Use: false, DVPortgroup ID: dvpg-32, Client: }, {Port ID: 20, In Use: true, DVPortgroup ID: dvpg-31, Client: build01.eth0}, {Port ID: 21, In Use: true, DVPortgroup ID: dvpg-31, Client: web01.eth1}, {Port ID: 22, In Use: false, DVPortgroup ID: dvpg-31, Client: }, {Port ID: 23, In Use: true, DVPortgroup ID: dvpg-31, Client: app01.eth0}, {Port ID: 24, In Use: true, DVPortgroup ID: dvpg-31, Client: lab01.eth0}
$ orvixcli network vswitch dvs orvix list --vds-name=nosuch
! Unable to access all vDS
[1]
$ orvixcli network vswitch dvs orvix list --vds-name=nosuch --formatter=json
[]
! Unable to access all vDS
[1]
