## LAGs in the table the command shows by default: modes active, passive and
## none; load balancing "None" (0), "Src portID" (20) and a value the table
## has no word for (25), shown as its number; a LAG without members has no
## NICs. A switch without LAGs shows its LACP uplink port groups instead, by
## ascending port group id, the first port of each group deciding the mode.
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix lacp config get
$ orvixcli network vswitch dvs orvix lacp config get --formatter=json
$ orvixcli network vswitch dvs orvix lacp config get -s dvsUplinkPg --formatter=simple
## A switch with neither LAGs nor LACP uplink ports.
$ orvixcli network vswitch dvs orvix lacp config get -s dvsPlain
## A name the host does not know.
$ orvixcli network vswitch dvs orvix lacp config get -s dvsNone
