## A failure while config get derives the rows of a switch without LAGs
## (a DV port that cannot be read) is reported with its message alone.
@profile fixtures/dvs/lacp.json
$ orvix-hostsim fault add NetworkFactory::GetDVPort --key 0 --message "DV port 0 is locked" --count 1
$ orvixcli network vswitch dvs orvix lacp config get -s dvsUplinkPg
$ orvixcli network vswitch dvs orvix lacp config get -s dvsUplinkPg --formatter=csv
