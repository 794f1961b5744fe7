## LAGs in the table the command shows by default: modes active, passive and
## none; load balancing "None" (0), "Src portID" (20), "Src and dst port"
## (13) and "Vlan" (7); a LAG without members has no NICs. (The host refuses
## a value the table has no word for, which would show as its number.) A
## switch without LAGs shows its LACP uplink port groups instead, by
## ascending port group id, the first port of each group deciding the mode.
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix lacp config get
DVS Name     LAG Name               LAG ID  NICs           Enabled  Mode     Load balance
-----------  ---------------------  ------  -------------  -------  -------  ----------------
dvsLag       lag-fast               1       hwnic0,hwnic1  true     Active   None
dvsLag       lag-slow               7       hwnic2         true     Passive  Src portID
dvsLag       lag-spare              9                      true     None     Src and dst port
dvsUplinkPg  default_uplink_pg_lag  0                      true     None     ---
dvsUplinkPg  default_uplink_pg_lag  0                      true     Passive  ---
dvsEmptyLag  lag-unused             3                      true     Active   Vlan
$ orvixcli network vswitch dvs orvix lacp config get --formatter=json
[
  {
    "DVS Name": "dvsLag",
    "LAG Name": "lag-fast",
    "LAG ID": 1,
    "NICs": "hwnic0,hwnic1",
    "Enabled": true,
    "Mode": "Active",
    "Load balance": "None"
  },
  {
    "DVS Name": "dvsLag",
    "LAG Name": "lag-slow",
    "LAG ID": 7,
    "NICs": "hwnic2",
    "Enabled": true,
    "Mode": "Passive",
    "Load balance": "Src portID"
  },
  {
    "DVS Name": "dvsLag",
    "LAG Name": "lag-spare",
    "LAG ID": 9,
    "NICs": "",
    "Enabled": true,
    "Mode": "None",
    "Load balance": "Src and dst port"
  },
  {
    "DVS Name": "dvsUplinkPg",
    "LAG Name": "default_uplink_pg_lag",
    "LAG ID": 0,
    "Enabled": true,
    "Mode": "None",
    "Load balance": "---"
  },
  {
    "DVS Name": "dvsUplinkPg",
    "LAG Name": "default_uplink_pg_lag",
    "LAG ID": 0,
    "Enabled": true,
    "Mode": "Passive",
    "Load balance": "---"
  },
  {
    "DVS Name": "dvsEmptyLag",
    "LAG Name": "lag-unused",
    "LAG ID": 3,
    "NICs": "",
    "Enabled": true,
    "Mode": "Active",
    "Load balance": "Vlan"
  }
]
$ orvixcli network vswitch dvs orvix lacp config get -s dvsUplinkPg --formatter=simple
   DVS Name: dvsUplinkPg
   LAG Name: default_uplink_pg_lag
   LAG ID: 0
   Enabled: true
   Mode: None
   Load balance: ---

   DVS Name: dvsUplinkPg
   LAG Name: default_uplink_pg_lag
   LAG ID: 0
   Enabled: true
   Mode: Passive
   Load balance: ---
## A switch with neither LAGs nor LACP uplink ports.
$ orvixcli network vswitch dvs orvix lacp config get -s dvsPlain
! LACP is disabled on DVSwitch.
[1]
## A name the host does not know.
$ orvixcli network vswitch dvs orvix lacp config get -s dvsNone
! Unable to find a DVSwitch with the name dvsNone
[1]
