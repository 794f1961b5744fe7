## One row per NIC of every LAG, with 64-bit counters.
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix lacp stats get
$ orvixcli network vswitch dvs orvix lacp stats get -s dvsLag --formatter=csv
## A LAG without members: there is a group but no NIC in it.
$ orvixcli network vswitch dvs orvix lacp stats get -s dvsEmptyLag
## No LAG at all.
$ orvixcli network vswitch dvs orvix lacp stats get -s dvsUplinkPg
$ orvixcli network vswitch dvs orvix lacp stats get -s nosuch
