## Packet counters of one port; unicast counts are what remains after
## broadcast and multicast, negative when those exceed the total.
@profile fixtures/port/counters.json
$ orvixcli network port stats get --portid 100
Packet statistics for port 100
   Packets received: 10
   Packets sent: 4
   Bytes received: 15000
   Bytes sent: 2400
   Broadcast packets received: 3
   Broadcast packets sent: 3
   Multicast packets received: 2
   Multicast packets sent: 5
   Unicast packets received: 5
   Unicast packets sent: -4
   Receive packets dropped: 1
   Transmit packets dropped: 2
$ orvixcli network port stats get -p 100 --formatter=json
[
  {
    "Packets received": 10,
    "Packets sent": 4,
    "Bytes received": 15000,
    "Bytes sent": 2400,
    "Broadcast packets received": 3,
    "Broadcast packets sent": 3,
    "Multicast packets received": 2,
    "Multicast packets sent": 5,
    "Unicast packets received": 5,
    "Unicast packets sent": -4,
    "Receive packets dropped": 1,
    "Transmit packets dropped": 2,
    "Port ID": 100
  }
]
## Counters past 2^62 on an uplink port, and the largest port id.
$ orvixcli network port stats get -p 101 --formatter=keyvalue
Port[0].Packets received=9000000000000000000
Port[0].Packets sent=0
Port[0].Bytes received=9100000000000000000
Port[0].Bytes sent=0
Port[0].Broadcast packets received=1
Port[0].Broadcast packets sent=1
Port[0].Multicast packets received=1
Port[0].Multicast packets sent=0
Port[0].Unicast packets received=8999999999999999998
Port[0].Unicast packets sent=-1
Port[0].Receive packets dropped=0
Port[0].Transmit packets dropped=0
Port[0].Port ID=101
$ orvixcli network port stats get -p 4294967295
Packet statistics for port 4294967295
   Packets received: 77
   Packets sent: 66
   Bytes received: 0
   Bytes sent: 0
   Broadcast packets received: 0
   Broadcast packets sent: 0
   Multicast packets received: 0
   Multicast packets sent: 0
   Unicast packets received: 77
   Unicast packets sent: 66
   Receive packets dropped: 0
   Transmit packets dropped: 0
## Ids no port has: 2^32 + 100 and -(2^32) + 100 do not reach port 100, nor
## does a negative id any port.
$ orvixcli network port stats get -p 4294967396
! Couldn't find requested port
[1]
$ orvixcli network port stats get -p -4294967196
! Couldn't find requested port
[1]
$ orvixcli network port stats get -p -1
! Couldn't find requested port
[1]
$ orvixcli network port stats get -p 103
! Couldn't find requested port
[1]
## Text that is no number is refused before the command runs.
$ orvixcli network port stats get -p abc
! orvixcli: Invalid value 'abc' for --portid: expected an integer
! Run 'orvixcli network port stats get --help' for its options.
[2]
