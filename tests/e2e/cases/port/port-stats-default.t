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
