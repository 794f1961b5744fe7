## The default host: a VM port on the distributed switch and a kernel port.
$ orvixcli network port stats get -p 67108870
Packet statistics for port 67108870
   Packets received: 5120344
   Packets sent: 4877102
   Bytes received: 3789054656
   Bytes sent: 3365200444
   Broadcast packets received: 20331
   Broadcast packets sent: 99
   Multicast packets received: 9120
   Multicast packets sent: 310
   Unicast packets received: 5090893
   Unicast packets sent: 4876693
   Receive packets dropped: 0
   Transmit packets dropped: 0
$ orvixcli network port stats get -p 33554436 --formatter=csv
Packets received,Packets sent,Bytes received,Bytes sent,Broadcast packets received,Broadcast packets sent,Multicast packets received,Multicast packets sent,Unicast packets received,Unicast packets sent,Receive packets dropped,Transmit packets dropped
6120455,5890112,4529136796,4064177344,40211,1022,18007,440,6062237,5888650,0,0
$ orvixcli network port filter stats get -p 67108869
Filter statistics for vm-firewall
   Filter direction: Receive
   Packets in: 22019002
   Packets out: 21963955
   Packets dropped: 55047
   Packets filtered: 440380
   Packets faulted: 0
   Packets queued: 2446
   Packets injected: 1100
   Packet errors: 0

Filter statistics for traffic-shaper
   Filter direction: Transmit
   Packets in: 19807733
   Packets out: 19758214
   Packets dropped: 49519

Filter statistics for vm-firewall
   Filter direction: Transmit
   Packets in: 19807733
   Packets out: 19758214
   Packets dropped: 49519
   Packets filtered: 396154
   Packets faulted: 0
   Packets queued: 2200
   Packets injected: 990
   Packet errors: 0
## lab01's port counts round numbers: 1000000 - 2500 - 1500 = 996000 unicast
## packets received, 800000 - 400 - 600 = 799000 sent.
$ orvixcli network port stats get -p 67108873
Packet statistics for port 67108873
   Packets received: 1000000
   Packets sent: 800000
   Bytes received: 640000000
   Bytes sent: 512000000
   Broadcast packets received: 2500
   Broadcast packets sent: 400
   Multicast packets received: 1500
   Multicast packets sent: 600
   Unicast packets received: 996000
   Unicast packets sent: 799000
   Receive packets dropped: 0
   Transmit packets dropped: 0
## hwnic7's uplink port on the distributed switch, which has no filters.
$ orvixcli network port stats get -p 67108871 --formatter=json
[
  {
    "Packets received": 120400000,
    "Packets sent": 98700000,
    "Bytes received": 89096000000,
    "Bytes sent": 64155000000,
    "Broadcast packets received": 400000,
    "Broadcast packets sent": 700,
    "Multicast packets received": 200000,
    "Multicast packets sent": 300,
    "Unicast packets received": 119800000,
    "Unicast packets sent": 98699000,
    "Receive packets dropped": 1200,
    "Transmit packets dropped": 0,
    "Port ID": 67108871
  }
]
$ orvixcli network port filter stats get -p 67108871
## app01's DV port: an extended receive filter and a plain transmit one.
$ orvixcli network port filter stats get -p 67108872
Filter statistics for vm-firewall
   Filter direction: Receive
   Packets in: 2500000
   Packets out: 2493750
   Packets dropped: 6250
   Packets filtered: 50000
   Packets faulted: 0
   Packets queued: 250
   Packets injected: 100
   Packet errors: 0

Filter statistics for packet-capture
   Filter direction: Transmit
   Packets in: 1800000
   Packets out: 1800000
   Packets dropped: 0
