## network ip interface list: every kind of connection point, an interface
## without one, and the netstack filter.
@profile fixtures/ip/interface-points.json

$ orvixcli network ip interface list
pld0
   Name: pld0
   MAC Address: 02:a1:01:00:00:01
   Enabled: true
   Portset: vSwitch0
   Portgroup: Management Network
   Netstack Instance: defaultTcpipStack
   VDS Name: N/A
   VDS UUID: N/A
   VDS Port: N/A
   VDS Connection: -1
   Opaque Network ID: N/A
   Opaque Network Type: N/A
   External ID: N/A
   MTU: 1500
   TSO MSS: 65535
   Port ID: 33554434

pld1
   Name: pld1
   MAC Address: 02:a1:01:00:00:02
   Enabled: true
   Portset: dvSwitch1
   Portgroup: N/A
   Netstack Instance: defaultTcpipStack
   VDS Name: dvSwitch1
   VDS UUID: 50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18
   VDS Port: 5
   VDS Connection: 1700000005
   Opaque Network ID: N/A
   Opaque Network Type: N/A
   External ID: N/A
   MTU: 9000
   TSO MSS: 65535
   Port ID: 67108866

pld2
   Name: pld2
   MAC Address: 02:a1:01:00:00:03
   Enabled: true
   Portset: vSwitch0
   Portgroup: Migration
   Netstack Instance: migrix
   VDS Name: N/A
   VDS UUID: N/A
   VDS Port: N/A
   VDS Connection: -1
   Opaque Network ID: N/A
   Opaque Network Type: N/A
   External ID: N/A
   MTU: 1500
   TSO MSS: 65535
   Port ID: 33554435

pld3
   Name: pld3
   MAC Address: 02:a1:01:00:00:04
   Enabled: false
   Portset: vSwitch0
   Portgroup: Lab
   Netstack Instance: lab
   VDS Name: N/A
   VDS UUID: N/A
   VDS Port: N/A
   VDS Connection: -1
   Opaque Network ID: N/A
   Opaque Network Type: N/A
   External ID: N/A
   MTU: 1500
   TSO MSS: 65535
   Port ID: 33554436

pld4
   Name: pld4
   MAC Address: 02:a1:01:00:00:05
   Enabled: true
   Portset: N/A
   Portgroup: N/A
   Netstack Instance: N/A
   VDS Name: N/A
   VDS UUID: N/A
   VDS Port: N/A
   VDS Connection: -1
   Opaque Network ID: N/A
   Opaque Network Type: N/A
   External ID: N/A
   MTU: 1500
   TSO MSS: 1460
   Port ID: 0

pld5
   Name: pld5
   MAC Address: 02:a1:01:00:00:06
   Enabled: true
   Portset: ovSwitch0
   Portgroup: N/A
   Netstack Instance: defaultTcpipStack
   VDS Name: N/A
   VDS UUID: N/A
   VDS Port: N/A
   VDS Connection: -1
   Opaque Network ID: seg-7f3a
   Opaque Network Type: overlay
   External ID: ext-0042
   MTU: 1500
   TSO MSS: 65535
   Port ID: 83886082

pld7
   Name: pld7
   MAC Address: 02:a1:01:00:00:07
   Enabled: true
   Portset: N/A
   Portgroup: N/A
   Netstack Instance: N/A
   VDS Name: N/A
   VDS UUID: N/A
   VDS Port: N/A
   VDS Connection: -1
   Opaque Network ID: N/A
   Opaque Network Type: N/A
   External ID: N/A
   MTU: 1500
   TSO MSS: 65535
   Port ID: 0

## Only the interfaces of one netstack instance.
$ orvixcli network ip interface list --netstack migrix
pld2
   Name: pld2
   MAC Address: 02:a1:01:00:00:03
   Enabled: true
   Portset: vSwitch0
   Portgroup: Migration
   Netstack Instance: migrix
   VDS Name: N/A
   VDS UUID: N/A
   VDS Port: N/A
   VDS Connection: -1
   Opaque Network ID: N/A
   Opaque Network Type: N/A
   External ID: N/A
   MTU: 1500
   TSO MSS: 65535
   Port ID: 33554435

$ orvixcli network ip interface list -N lab --formatter=json
[
  {
    "Name": "pld3",
    "MAC Address": "02:a1:01:00:00:04",
    "Enabled": false,
    "Portset": "vSwitch0",
    "Portgroup": "Lab",
    "Netstack Instance": "lab",
    "VDS Name": "N/A",
    "VDS UUID": "N/A",
    "VDS Port": "N/A",
    "VDS Connection": -1,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 1500,
    "TSO MSS": 65535,
    "Port ID": 33554436
  }
]

## An empty value means every netstack.
$ orvixcli network ip interface list --netstack "" --formatter=csv
Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
pld0,02:a1:01:00:00:01,true,vSwitch0,Management Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554434
pld1,02:a1:01:00:00:02,true,dvSwitch1,N/A,defaultTcpipStack,dvSwitch1,50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18,5,1700000005,N/A,N/A,N/A,9000,65535,67108866
pld2,02:a1:01:00:00:03,true,vSwitch0,Migration,migrix,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554435
pld3,02:a1:01:00:00:04,false,vSwitch0,Lab,lab,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554436
pld4,02:a1:01:00:00:05,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,1460,0
pld5,02:a1:01:00:00:06,true,ovSwitch0,N/A,defaultTcpipStack,N/A,N/A,N/A,-1,seg-7f3a,overlay,ext-0042,1500,65535,83886082
pld7,02:a1:01:00:00:07,true,N/A,N/A,N/A,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,0

$ orvixcli network ip interface list --netstack faultTolerance --formatter=json
[
  {
    "Name": "pld7",
    "MAC Address": "02:a1:01:00:00:07",
    "Enabled": true,
    "Portset": "N/A",
    "Portgroup": "N/A",
    "Netstack Instance": "N/A",
    "VDS Name": "N/A",
    "VDS UUID": "N/A",
    "VDS Port": "N/A",
    "VDS Connection": -1,
    "Opaque Network ID": "N/A",
    "Opaque Network Type": "N/A",
    "External ID": "N/A",
    "MTU": 1500,
    "TSO MSS": 65535,
    "Port ID": 0
  }
]

$ orvixcli network ip interface list --formatter=table
Name  MAC Address        Enabled  Portset    Portgroup           Netstack Instance  VDS Name   VDS UUID                                         VDS Port  VDS Connection  Opaque Network ID  Opaque Network Type  External ID  MTU   TSO MSS  Port ID
----  -----------------  -------  ---------  ------------------  -----------------  ---------  -----------------------------------------------  --------  --------------  -----------------  -------------------  -----------  ----  -------  --------
pld0  02:a1:01:00:00:01  true     vSwitch0   Management Network  defaultTcpipStack  N/A        N/A                                              N/A       -1              N/A                N/A                  N/A          1500  65535    33554434
pld1  02:a1:01:00:00:02  true     dvSwitch1  N/A                 defaultTcpipStack  dvSwitch1  50 3c 8e 1a 44 0b 7d 2e-9f 61 a2 c4 05 d7 3b 18  5         1700000005      N/A                N/A                  N/A          9000  65535    67108866
pld2  02:a1:01:00:00:03  true     vSwitch0   Migration           migrix             N/A        N/A                                              N/A       -1              N/A                N/A                  N/A          1500  65535    33554435
pld3  02:a1:01:00:00:04  false    vSwitch0   Lab                 lab                N/A        N/A                                              N/A       -1              N/A                N/A                  N/A          1500  65535    33554436
pld4  02:a1:01:00:00:05  true     N/A        N/A                 N/A                N/A        N/A                                              N/A       -1              N/A                N/A                  N/A          1500  1460     0
pld5  02:a1:01:00:00:06  true     ovSwitch0  N/A                 defaultTcpipStack  N/A        N/A                                              N/A       -1              seg-7f3a           overlay              ext-0042     1500  65535    83886082
pld7  02:a1:01:00:00:07  true     N/A        N/A                 N/A                N/A        N/A                                              N/A       -1              N/A                N/A                  N/A          1500  65535    0

## A netstack the host does not have lists nothing.
$ orvixcli network ip interface list --netstack noSuchStack --formatter=json
[]
