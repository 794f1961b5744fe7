## Every state bit decoded, in bit order: 63 (ACT FTO AGG SYN COL DIST), 197
## (ACT AGG DEF EXP), 60, 255 and 0; a partner that is present and one that
## is not; ages of 3725 seconds, none and 100 hours. A LAG in mode none shows
## "Active"; a LAG without members has an empty NIC list.
@profile fixtures/dvs/lacp.json
$ orvixcli network vswitch dvs orvix lacp status get
dvsLag
   DVSwitch: dvsLag
   LAG ID: 1
   Mode: Active
   Flags: S - Device is sending Slow LACPDUs, F - Device is sending fast LACPDUs, A - Device is in active mode, P - Device is in passive mode
   Nic List:
      Nic: hwnic0
      State: Bundled
      Local Information:
         Port State: ACT,FTO,AGG,SYN,COL,DIST,
         Flags: FA
         Admin Key: 9
         Oper Key: 9
         Port Priority: 255
         Port Number: 1
      Partner Information:
         Device ID: 02:a1:fe:00:00:01
         Port State: ACT,AGG,SYN,COL,DIST,
         Flags: FA
         Age: 01:02:05
         Oper Key: 16
         Port Priority: 32768
         Port Number: 17

      Nic: hwnic1
      State: Independent
      Local Information:
         Port State: ACT,AGG,DEF,EXP,
         Flags: SA
         Admin Key: 9
         Oper Key: 65535
         Port Priority: 65535
         Port Number: 2
      Partner Information:
         Device ID: 00:00:00:00:00:00
         Port State: 
         Flags: 
         Age: 00:00:00
         Oper Key: 0
         Port Priority: 0
         Port Number: 0

dvsLag
   DVSwitch: dvsLag
   LAG ID: 7
   Mode: Passive
   Flags: S - Device is sending Slow LACPDUs, F - Device is sending fast LACPDUs, A - Device is in active mode, P - Device is in passive mode
   Nic List:
      Nic: hwnic2
      State: Bundled
      Local Information:
         Port State: AGG,SYN,COL,DIST,
         Flags: SP
         Admin Key: 12
         Oper Key: 12
         Port Priority: 128
         Port Number: 5
      Partner Information:
         Device ID: 02:a1:fe:00:00:02
         Port State: ACT,FTO,AGG,SYN,COL,DIST,DEF,EXP,
         Flags: SP
         Age: 100:00:00
         Oper Key: 20
         Port Priority: 1
         Port Number: 40

dvsLag
   DVSwitch: dvsLag
   LAG ID: 9
   Mode: Active
   Flags: S - Device is sending Slow LACPDUs, F - Device is sending fast LACPDUs, A - Device is in active mode, P - Device is in passive mode
   Nic List:

dvsEmptyLag
   DVSwitch: dvsEmptyLag
   LAG ID: 3
   Mode: Active
   Flags: S - Device is sending Slow LACPDUs, F - Device is sending fast LACPDUs, A - Device is in active mode, P - Device is in passive mode
   Nic List:
$ orvixcli network vswitch dvs orvix lacp status get -s dvsLag --formatter=json
[
  {
    "DVSwitch": "dvsLag",
    "LAG ID": 1,
    "Mode": "Active",
    "Flags": [
      "S - Device is sending Slow LACPDUs",
      "F - Device is sending fast LACPDUs",
      "A - Device is in active mode",
      "P - Device is in passive mode"
    ],
    "Nic List": [
      {
        "Nic": "hwnic0",
        "State": "Bundled",
        "Local Information": {
          "Port State": "ACT,FTO,AGG,SYN,COL,DIST,",
          "Flags": "FA",
          "Admin Key": 9,
          "Oper Key": 9,
          "Port Priority": 255,
          "Port Number": 1
        },
        "Partner Information": {
          "Device ID": "02:a1:fe:00:00:01",
          "Port State": "ACT,AGG,SYN,COL,DIST,",
          "Flags": "FA",
          "Age": "01:02:05",
          "Oper Key": 16,
          "Port Priority": 32768,
          "Port Number": 17
        }
      },
      {
        "Nic": "hwnic1",
        "State": "Independent",
        "Local Information": {
          "Port State": "ACT,AGG,DEF,EXP,",
          "Flags": "SA",
          "Admin Key": 9,
          "Oper Key": 65535,
          "Port Priority": 65535,
          "Port Number": 2
        },
        "Partner Information": {
          "Device ID": "00:00:00:00:00:00",
          "Port State": "",
          "Flags": "",
          "Age": "00:00:00",
          "Oper Key": 0,
          "Port Priority": 0,
          "Port Number": 0
        }
      }
    ]
  },
  {
    "DVSwitch": "dvsLag",
    "LAG ID": 7,
    "Mode": "Passive",
    "Flags": [
      "S - Device is sending Slow LACPDUs",
      "F - Device is sending fast LACPDUs",
      "A - Device is in active mode",
      "P - Device is in passive mode"
    ],
    "Nic List": [
      {
        "Nic": "hwnic2",
        "State": "Bundled",
        "Local Information": {
          "Port State": "AGG,SYN,COL,DIST,",
          "Flags": "SP",
          "Admin Key": 12,
          "Oper Key": 12,
          "Port Priority": 128,
          "Port Number": 5
        },
        "Partner Information": {
          "Device ID": "02:a1:fe:00:00:02",
          "Port State": "ACT,FTO,AGG,SYN,COL,DIST,DEF,EXP,",
          "Flags": "SP",
          "Age": "100:00:00",
          "Oper Key": 20,
          "Port Priority": 1,
          "Port Number": 40
        }
      }
    ]
  },
  {
    "DVSwitch": "dvsLag",
    "LAG ID": 9,
    "Mode": "Active",
    "Flags": [
      "S - Device is sending Slow LACPDUs",
      "F - Device is sending fast LACPDUs",
      "A - Device is in active mode",
      "P - Device is in passive mode"
    ],
    "Nic List": []
  }
]
## The table formatter with the command's own column lists.
$ orvixcli network vswitch dvs orvix lacp status get -s dvsEmptyLag --formatter=table
DVSwitch     LAG ID  Mode    Age  Flags                                                                                                                                Nic List
-----------  ------  ------  ---  -----------------------------------------------------------------------------------------------------------------------------------  --------
dvsEmptyLag  3       Active       S - Device is sending Slow LACPDUs, F - Device is sending fast LACPDUs, A - Device is in active mode, P - Device is in passive mode
## Switches without LAGs have no running group.
$ orvixcli network vswitch dvs orvix lacp status get -s dvsPlain
! No running LACP group on the host.
[1]
$ orvixcli network vswitch dvs orvix lacp status get --dvs nosuch
! Unable to find a DVSwitch with the name nosuch
[1]
