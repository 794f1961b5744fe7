## Setting the timeout of one NIC of a LAG changes its FTO bit and nothing
## else; without a NIC every NIC of the LAG changes. The result is a boolean
## without a value.
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix lacp timeout set --vds dvsLag --lag-id 1 --nic-name hwnic1 --timeout true
$ orvixcli network vswitch dvs orvix lacp timeout set --vds dvsLag --lag-id 1 --nic-name hwnic1 --timeout true --formatter=json
$ orvixcli network vswitch dvs orvix lacp status get -s dvsLag --formatter=csv
DVSwitch,LAG ID,Mode,Age,Flags,Nic List
dvsLag,1,Active,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode","{Nic: hwnic0, State: Bundled, Local Information: {Port State: ACT,FTO,AGG,SYN,COL,DIST,, Flags: FA, Admin Key: 9, Oper Key: 9, Port Priority: 255, Port Number: 1}, Partner Information: {Device ID: 02:a1:fe:00:00:01, Port State: ACT,AGG,SYN,COL,DIST,, Flags: FA, Age: 01:02:05, Oper Key: 16, Port Priority: 32768, Port Number: 17}}, {Nic: hwnic1, State: Independent, Local Information: {Port State: ACT,FTO,AGG,DEF,EXP,, Flags: FA, Admin Key: 9, Oper Key: 65535, Port Priority: 65535, Port Number: 2}, Partner Information: {Device ID: 00:00:00:00:00:00, Port State: , Flags: , Age: 00:00:00, Oper Key: 0, Port Priority: 0, Port Number: 0}}"
dvsLag,7,Passive,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode","{Nic: hwnic2, State: Bundled, Local Information: {Port State: AGG,SYN,COL,DIST,, Flags: SP, Admin Key: 12, Oper Key: 12, Port Priority: 128, Port Number: 5}, Partner Information: {Device ID: 02:a1:fe:00:00:02, Port State: ACT,FTO,AGG,SYN,COL,DIST,DEF,EXP,, Flags: SP, Age: 100:00:00, Oper Key: 20, Port Priority: 1, Port Number: 40}}"
dvsLag,9,Active,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode",
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 1 -t false
$ orvixcli network vswitch dvs orvix lacp status get -s dvsLag --formatter=csv
DVSwitch,LAG ID,Mode,Age,Flags,Nic List
dvsLag,1,Active,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode","{Nic: hwnic0, State: Bundled, Local Information: {Port State: ACT,AGG,SYN,COL,DIST,, Flags: SA, Admin Key: 9, Oper Key: 9, Port Priority: 255, Port Number: 1}, Partner Information: {Device ID: 02:a1:fe:00:00:01, Port State: ACT,AGG,SYN,COL,DIST,, Flags: FA, Age: 01:02:05, Oper Key: 16, Port Priority: 32768, Port Number: 17}}, {Nic: hwnic1, State: Independent, Local Information: {Port State: ACT,AGG,DEF,EXP,, Flags: SA, Admin Key: 9, Oper Key: 65535, Port Priority: 65535, Port Number: 2}, Partner Information: {Device ID: 00:00:00:00:00:00, Port State: , Flags: , Age: 00:00:00, Oper Key: 0, Port Priority: 0, Port Number: 0}}"
dvsLag,7,Passive,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode","{Nic: hwnic2, State: Bundled, Local Information: {Port State: AGG,SYN,COL,DIST,, Flags: SP, Admin Key: 12, Oper Key: 12, Port Priority: 128, Port Number: 5}, Partner Information: {Device ID: 02:a1:fe:00:00:02, Port State: ACT,FTO,AGG,SYN,COL,DIST,DEF,EXP,, Flags: SP, Age: 100:00:00, Oper Key: 20, Port Priority: 1, Port Number: 40}}"
dvsLag,9,Active,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode",
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 7 -t 1
$ orvixcli network vswitch dvs orvix lacp status get -s dvsLag --formatter=csv
DVSwitch,LAG ID,Mode,Age,Flags,Nic List
dvsLag,1,Active,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode","{Nic: hwnic0, State: Bundled, Local Information: {Port State: ACT,AGG,SYN,COL,DIST,, Flags: SA, Admin Key: 9, Oper Key: 9, Port Priority: 255, Port Number: 1}, Partner Information: {Device ID: 02:a1:fe:00:00:01, Port State: ACT,AGG,SYN,COL,DIST,, Flags: FA, Age: 01:02:05, Oper Key: 16, Port Priority: 32768, Port Number: 17}}, {Nic: hwnic1, State: Independent, Local Information: {Port State: ACT,AGG,DEF,EXP,, Flags: SA, Admin Key: 9, Oper Key: 65535, Port Priority: 65535, Port Number: 2}, Partner Information: {Device ID: 00:00:00:00:00:00, Port State: , Flags: , Age: 00:00:00, Oper Key: 0, Port Priority: 0, Port Number: 0}}"
dvsLag,7,Passive,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode","{Nic: hwnic2, State: Bundled, Local Information: {Port State: FTO,AGG,SYN,COL,DIST,, Flags: FP, Admin Key: 12, Oper Key: 12, Port Priority: 128, Port Number: 5}, Partner Information: {Device ID: 02:a1:fe:00:00:02, Port State: ACT,FTO,AGG,SYN,COL,DIST,DEF,EXP,, Flags: SP, Age: 100:00:00, Oper Key: 20, Port Priority: 1, Port Number: 40}}"
dvsLag,9,Active,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode",
## Refusals: a LAG the switch does not have, a NIC that is not in the LAG, a
## switch the host does not have, and options left out.
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 3 -t true
! LAG 3 does not exist on DVSwitch dvsLag
[1]
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 1 -n hwnic2 -t true
! NIC hwnic2 is not in LAG 1 of DVSwitch dvsLag
[1]
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsNone -l 1 -t true
! Unable to find a DVSwitch with the name dvsNone
[1]
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvsLag -l 1
! orvixcli: Missing required option --timeout
! Run 'orvixcli network vswitch dvs orvix lacp timeout set --help' for its options.
[2]
$ orvixcli network vswitch dvs orvix lacp timeout set -l 1 -t true
! orvixcli: Missing required option --vds
! Run 'orvixcli network vswitch dvs orvix lacp timeout set --help' for its options.
[2]
$ orvixcli network vswitch dvs orvix lacp timeout set --help
Usage: orvixcli network vswitch dvs orvix lacp timeout set [cmd options]

Description:
  Set long/short timeout for hwnics in one LACP LAG

Cmd options:
  -t|--timeout=<bool>  (required)
      Set long or short timeout: 1 for short timeout and 0 for long timeout.
  -n|--nic-name=<str>
      The nic name. If it is set, then only this hwnic in the lag will be configured.
  -l|--lag-id=<long>  (required)
      The ID of LAG to be configured.
  -s|--vds=<str>  (required)
      The name of VDS.
