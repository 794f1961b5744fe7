## Setting the timeout of one NIC of a LAG changes its FTO bit and nothing
## else; without a NIC every NIC of the LAG changes. The result is a boolean
## without a value.
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix lacp timeout set --vds dvsLag --lag-id 1 --nic-name hwnic1 --timeout true
$ orvixcli network vswitch dvs orvix lacp timeout set --vds dvsLag --lag-id 1 --nic-name hwnic1 --timeout true --formatter=json
$ orvixcli network vswitch dvs orvix lacp status get -s dvsLag --formatter=csv
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 1 -t false
$ orvixcli network vswitch dvs orvix lacp status get -s dvsLag --formatter=csv
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 7 -t 1
$ orvixcli network vswitch dvs orvix lacp status get -s dvsLag --formatter=csv
## Refusals: a LAG the switch does not have, a NIC that is not in the LAG, a
## switch the host does not have, and options left out.
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 3 -t true
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 1 -n hwnic2 -t true
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsNone -l 1 -t true
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 1
$ orvixcli network vswitch dvs orvix lacp timeout set -l 1 -t true
$ orvixcli network vswitch dvs orvix lacp timeout set --help
