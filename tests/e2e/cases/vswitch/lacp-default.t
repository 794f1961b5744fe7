## The default host's two LAGs in all three readers.
$ orvixcli network vswitch dvs orvix lacp config get
DVS Name   LAG Name  LAG ID  NICs           Enabled  Mode     Load balance
---------  --------  ------  -------------  -------  -------  --------------------
dvSwitch0  lag1      1       hwnic2,hwnic3  true     Active   Src and dst ip, port
dvSwitch0  lag2      2       hwnic5,hwnic7  true     Passive  Src portID
$ orvixcli network vswitch dvs orvix lacp status get
dvSwitch0
   DVSwitch: dvSwitch0
   LAG ID: 1
   Mode: Active
   Flags: S - Device is sending Slow LACPDUs, F - Device is sending fast LACPDUs, A - Device is in active mode, P - Device is in passive mode
   Nic List:
      Nic: hwnic2
      State: Bundled
      Local Information:
         Port State: ACT,AGG,SYN,COL,DIST,
         Flags: SA
         Admin Key: 9
         Oper Key: 9
         Port Priority: 255
         Port Number: 1
      Partner Information:
         Device ID: 02:a1:fe:00:00:01
         Port State: ACT,AGG,SYN,COL,DIST,
         Flags: SA
         Age: 01:02:05
         Oper Key: 16
         Port Priority: 32768
         Port Number: 17

      Nic: hwnic3
      State: Bundled
      Local Information:
         Port State: ACT,AGG,SYN,COL,DIST,
         Flags: SA
         Admin Key: 9
         Oper Key: 9
         Port Priority: 255
         Port Number: 2
      Partner Information:
         Device ID: 02:a1:fe:00:00:01
         Port State: ACT,AGG,SYN,COL,DIST,
         Flags: SA
         Age: 01:02:05
         Oper Key: 16
         Port Priority: 32768
         Port Number: 18

dvSwitch0
   DVSwitch: dvSwitch0
   LAG ID: 2
   Mode: Passive
   Flags: S - Device is sending Slow LACPDUs, F - Device is sending fast LACPDUs, A - Device is in active mode, P - Device is in passive mode
   Nic List:
      Nic: hwnic5
      State: Down
      Local Information:
         Port State: FTO,AGG,DEF,
         Flags: FP
         Admin Key: 10
         Oper Key: 10
         Port Priority: 255
         Port Number: 3
      Partner Information:
         Device ID: 00:00:00:00:00:00
         Port State: 
         Flags: 
         Age: 00:00:00
         Oper Key: 0
         Port Priority: 0
         Port Number: 0

      Nic: hwnic7
      State: Independent
      Local Information:
         Port State: AGG,SYN,COL,DIST,
         Flags: SP
         Admin Key: 10
         Oper Key: 10
         Port Priority: 255
         Port Number: 4
      Partner Information:
         Device ID: 02:a1:fe:00:00:02
         Port State: ACT,SYN,COL,DIST,
         Flags: SA
         Age: 00:00:27
         Oper Key: 33
         Port Priority: 32768
         Port Number: 9
$ orvixcli network vswitch dvs orvix lacp stats get
DVSwitch   NIC     LAG ID  Tx LACPDUs  Tx Errors  Rx LACPDUs  Rx Errors
---------  ------  ------  ----------  ---------  ----------  ---------
dvSwitch0  hwnic2  1       112044      0          112039      0
dvSwitch0  hwnic3  1       112041      0          112035      2
dvSwitch0  hwnic5  2       3120        14         0           0
dvSwitch0  hwnic7  2       8406        0          8411        1
$ orvixcli network vswitch dvs orvix lacp stats get --formatter=json
[
  {
    "DVSwitch": "dvSwitch0",
    "NIC": "hwnic2",
    "LAG ID": 1,
    "Tx LACPDUs": 112044,
    "Tx Errors": 0,
    "Rx LACPDUs": 112039,
    "Rx Errors": 0
  },
  {
    "DVSwitch": "dvSwitch0",
    "NIC": "hwnic3",
    "LAG ID": 1,
    "Tx LACPDUs": 112041,
    "Tx Errors": 0,
    "Rx LACPDUs": 112035,
    "Rx Errors": 2
  },
  {
    "DVSwitch": "dvSwitch0",
    "NIC": "hwnic5",
    "LAG ID": 2,
    "Tx LACPDUs": 3120,
    "Tx Errors": 14,
    "Rx LACPDUs": 0,
    "Rx Errors": 0
  },
  {
    "DVSwitch": "dvSwitch0",
    "NIC": "hwnic7",
    "LAG ID": 2,
    "Tx LACPDUs": 8406,
    "Tx Errors": 0,
    "Rx LACPDUs": 8411,
    "Rx Errors": 1
  }
]
