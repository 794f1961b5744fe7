## A failure while config get derives the rows of a switch without LAGs
## (a DV port that cannot be read) is reported with its message alone.
@profile fixtures/dvs/lacp.json
$ orvix-hostsim fault add NetworkFactory::GetDVPort --key 0 --message "DV port 0 is locked" --count 1
1
$ orvixcli network vswitch dvs orvix lacp config get -s dvsUplinkPg
! DV port 0 is locked
[1]
$ orvixcli network vswitch dvs orvix lacp config get -s dvsUplinkPg --formatter=csv
DVS Name,LAG Name,LAG ID,NICs,Enabled,Mode,Load balance
dvsUplinkPg,default_uplink_pg_lag,0,,true,None,---
dvsUplinkPg,default_uplink_pg_lag,0,,true,Passive,---
