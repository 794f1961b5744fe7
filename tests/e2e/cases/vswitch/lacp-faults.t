## The library's failures in the LACP commands. A failure while a reader
## holds a switch's LACP data is reported with its message alone, after the
## data went back to the switch.
$ orvix-hostsim fault add VirtualSwitchInfoImpl::GetDVSwitches --message "switch table busy" --count 3
1
$ orvixcli network vswitch dvs orvix lacp config get
! switch table busy
[1]
$ orvixcli network vswitch dvs orvix lacp status get
! switch table busy
[1]
$ orvixcli network vswitch dvs orvix lacp stats get
! switch table busy
[1]
$ orvix-hostsim fault add DVSwitchImpl::GetLacpConfig --key dvSwitch0 --message "LACP daemon not answering" --count 1
2
$ orvixcli network vswitch dvs orvix lacp config get
! LACP daemon not answering
[1]
$ orvix-hostsim fault add DVSwitchImpl::GetLacpInfo --key dvSwitch0 --message "LACP daemon not answering" --count 2
3
$ orvixcli network vswitch dvs orvix lacp status get -s dvSwitch0
! LACP daemon not answering
[1]
$ orvixcli network vswitch dvs orvix lacp stats get
! LACP daemon not answering
[1]
$ orvix-hostsim fault add DVSwitchImpl::SetLacpTimeout --key dvSwitch0 --message "host is read-only" --count 1
4
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvSwitch0 -l 2 -t false
! host is read-only
[1]
## The failed change left the timeout as it was.
$ orvixcli network vswitch dvs orvix lacp status get --formatter=csv
DVSwitch,LAG ID,Mode,Age,Flags,Nic List
dvSwitch0,1,Active,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode","{Nic: hwnic2, State: Bundled, Local Information: {Port State: ACT,AGG,SYN,COL,DIST,, Flags: SA, Admin Key: 9, Oper Key: 9, Port Priority: 255, Port Number: 1}, Partner Information: {Device ID: 02:a1:fe:00:00:01, Port State: ACT,AGG,SYN,COL,DIST,, Flags: SA, Age: 01:02:05, Oper Key: 16, Port Priority: 32768, Port Number: 17}}, {Nic: hwnic3, State: Bundled, Local Information: {Port State: ACT,AGG,SYN,COL,DIST,, Flags: SA, Admin Key: 9, Oper Key: 9, Port Priority: 255, Port Number: 2}, Partner Information: {Device ID: 02:a1:fe:00:00:01, Port State: ACT,AGG,SYN,COL,DIST,, Flags: SA, Age: 01:02:05, Oper Key: 16, Port Priority: 32768, Port Number: 18}}"
dvSwitch0,2,Passive,,"S - Device is sending Slow LACPDUs,F - Device is sending fast LACPDUs,A - Device is in active mode,P - Device is in passive mode","{Nic: hwnic5, State: Down, Local Information: {Port State: FTO,AGG,DEF,, Flags: FP, Admin Key: 10, Oper Key: 10, Port Priority: 255, Port Number: 3}, Partner Information: {Device ID: 00:00:00:00:00:00, Port State: , Flags: , Age: 00:00:00, Oper Key: 0, Port Priority: 0, Port Number: 0}}, {Nic: hwnic7, State: Independent, Local Information: {Port State: AGG,SYN,COL,DIST,, Flags: SP, Admin Key: 10, Oper Key: 10, Port Priority: 255, Port Number: 4}, Partner Information: {Device ID: 02:a1:fe:00:00:02, Port State: ACT,SYN,COL,DIST,, Flags: SA, Age: 00:00:27, Oper Key: 33, Port Priority: 32768, Port Number: 9}}"
