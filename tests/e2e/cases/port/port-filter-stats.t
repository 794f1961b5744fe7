## Filters listed by direction and ordering key, whatever their names:
## receive filters by ascending key (a, ab, b), transmit filters by
## descending key (d, cc, c); a detached filter is left out; only filters
## keeping the extended counters show them.
@profile fixtures/port/counters.json
$ orvixcli network port filter stats get --portid 100
Filter statistics for alpha
   Filter direction: Receive
   Packets in: 7
   Packets out: 8
   Packets dropped: 9

Filter statistics for aardvark
   Filter direction: Receive
   Packets in: 18
   Packets out: 19
   Packets dropped: 20

Filter statistics for zeta
   Filter direction: Receive
   Packets in: 1
   Packets out: 2
   Packets dropped: 3

Filter statistics for beta
   Filter direction: Transmit
   Packets in: 10
   Packets out: 11
   Packets dropped: 12
   Packets filtered: 13
   Packets faulted: 14
   Packets queued: 15
   Packets injected: 16
   Packet errors: 17

Filter statistics for omega
   Filter direction: Transmit
   Packets in: 21
   Packets out: 22
   Packets dropped: 23

Filter statistics for mid
   Filter direction: Transmit
   Packets in: 4
   Packets out: 5
   Packets dropped: 6
$ orvixcli network port filter stats get -p 100 --formatter=json
[
  {
    "Filter direction": "Receive",
    "Packets in": 7,
    "Packets out": 8,
    "Packets dropped": 9,
    "Filter name": "alpha"
  },
  {
    "Filter direction": "Receive",
    "Packets in": 18,
    "Packets out": 19,
    "Packets dropped": 20,
    "Filter name": "aardvark"
  },
  {
    "Filter direction": "Receive",
    "Packets in": 1,
    "Packets out": 2,
    "Packets dropped": 3,
    "Filter name": "zeta"
  },
  {
    "Filter direction": "Transmit",
    "Packets in": 10,
    "Packets out": 11,
    "Packets dropped": 12,
    "Packets filtered": 13,
    "Packets faulted": 14,
    "Packets queued": 15,
    "Packets injected": 16,
    "Packet errors": 17,
    "Filter name": "beta"
  },
  {
    "Filter direction": "Transmit",
    "Packets in": 21,
    "Packets out": 22,
    "Packets dropped": 23,
    "Filter name": "omega"
  },
  {
    "Filter direction": "Transmit",
    "Packets in": 4,
    "Packets out": 5,
    "Packets dropped": 6,
    "Filter name": "mid"
  }
]
## On an uplink port the direction words are swapped.
$ orvixcli network port filter stats get -p 101
Filter statistics for wire-in
   Filter direction: Transmit
   Packets in: 40
   Packets out: 41
   Packets dropped: 42

Filter statistics for wire-out
   Filter direction: Receive
   Packets in: 30
   Packets out: 31
   Packets dropped: 32
   Packets filtered: 33
   Packets faulted: 34
   Packets queued: 35
   Packets injected: 36
   Packet errors: 37
## A port without filters gives an empty list, not an error.
$ orvixcli network port filter stats get -p 102
$ orvixcli network port filter stats get -p 102 --formatter=json
[]
$ orvixcli network port filter stats get -p 4294967396
! Couldn't find requested port
[1]
