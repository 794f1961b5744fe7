## Packet counters of one port; unicast counts are what remains after
## broadcast and multicast, negative when those exceed the total.
@profile fixtures/port/counters.json
$ orvixcli network port stats get --portid 100
$ orvixcli network port stats get -p 100 --formatter=json
## Counters past 2^62 on an uplink port, and the largest port id.
$ orvixcli network port stats get -p 101 --formatter=keyvalue
$ orvixcli network port stats get -p 4294967295
## Ids no port has: 2^32 + 100 and -(2^32) + 100 do not reach port 100, nor
## does a negative id any port.
$ orvixcli network port stats get -p 4294967396
$ orvixcli network port stats get -p -4294967196
$ orvixcli network port stats get -p -1
$ orvixcli network port stats get -p 103
$ orvixcli network port stats get -p abc
