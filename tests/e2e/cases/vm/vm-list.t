## Worlds by ascending id whatever the switch order, with one network per
## port (a port group on a standard switch, the distributed port group on a
## distributed one), repeats kept. Names lose their first five characters;
## a name of exactly five becomes empty, a shorter one stays as it is. A
## world without ports is not listed.
@profile fixtures/vm/worlds.json
$ orvixcli network vm list
World ID  Name    Num Ports  Networks
--------  ------  ---------  -------------------------------
1000      alpha   3          VM Network, VM Network, dvpg-50
1500      abc     1          Lab
1700              1          Lab
2000      zulu01  3          VM Network, Lab, dvpg-51
$ orvixcli network vm list --formatter=json
[
  {
    "World ID": 1000,
    "Name": "alpha",
    "Num Ports": 3,
    "Networks": [
      "VM Network",
      "VM Network",
      "dvpg-50"
    ]
  },
  {
    "World ID": 1500,
    "Name": "abc",
    "Num Ports": 1,
    "Networks": [
      "Lab"
    ]
  },
  {
    "World ID": 1700,
    "Name": "",
    "Num Ports": 1,
    "Networks": [
      "Lab"
    ]
  },
  {
    "World ID": 2000,
    "Name": "zulu01",
    "Num Ports": 3,
    "Networks": [
      "VM Network",
      "Lab",
      "dvpg-51"
    ]
  }
]
$ orvixcli network vm list --formatter=simple
   World ID: 1000
   Name: alpha
   Num Ports: 3
   Networks: VM Network, VM Network, dvpg-50

   World ID: 1500
   Name: abc
   Num Ports: 1
   Networks: Lab

   World ID: 1700
   Name: 
   Num Ports: 1
   Networks: Lab

   World ID: 2000
   Name: zulu01
   Num Ports: 3
   Networks: VM Network, Lab, dvpg-51
