## Every state bit decoded, in bit order: 63 (ACT FTO AGG SYN COL DIST), 197
## (ACT AGG DEF EXP), 60, 255 and 0; a partner that is present and one that
## is not; ages of 3725 seconds, none and 100 hours. A LAG in mode none shows
## "Active"; a LAG without members has an empty NIC list.
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix lacp status get
$ orvixcli network vswitch dvs orvix lacp status get -s dvsLag --formatter=json
## The table formatter with the command's own column lists.
$ orvixcli network vswitch dvs orvix lacp status get -s dvsEmptyLag --formatter=table
## Switches without LAGs have no running group.
$ orvixcli network vswitch dvs orvix lacp status get -s dvsPlain
$ orvixcli network vswitch dvs orvix lacp status get --dvs nosuch
