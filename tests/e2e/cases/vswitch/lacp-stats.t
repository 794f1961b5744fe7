## One row per NIC of every LAG, with 64-bit counters.
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix lacp stats get
DVSwitch  NIC     LAG ID  Tx LACPDUs     Tx Errors  Rx LACPDUs     Rx Errors
--------  ------  ------  -------------  ---------  -------------  ---------
dvsLag    hwnic0  1       9000000000000  1          8999999999990  2
dvsLag    hwnic1  1       310            0          0              0
dvsLag    hwnic2  7       5              7          6              8
$ orvixcli network vswitch dvs orvix lacp stats get -s dvsLag --formatter=csv
DVSwitch,NIC,LAG ID,Tx LACPDUs,Tx Errors,Rx LACPDUs,Rx Errors
dvsLag,hwnic0,1,9000000000000,1,8999999999990,2
dvsLag,hwnic1,1,310,0,0,0
dvsLag,hwnic2,7,5,7,6,8
## A LAG without members: there is a group but no NIC in it.
$ orvixcli network vswitch dvs orvix lacp stats get -s dvsEmptyLag
! No pnic is connected to DVSwitch.
[1]
## No LAG at all.
$ orvixcli network vswitch dvs orvix lacp stats get -s dvsUplinkPg
! No running LACP group on the host.
[1]
$ orvixcli network vswitch dvs orvix lacp stats get -s nosuch
! Unable to find a DVSwitch with the name nosuch
[1]
