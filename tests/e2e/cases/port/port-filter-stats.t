## Filters listed by direction and ordering key, whatever their names:
## receive filters by ascending key (a, ab, b), transmit filters by
## descending key (d, cc, c); a detached filter is left out; only filters
## keeping the extended counters show them.
@profile fixtures/port/counters.json
$ orvixcli network port filter stats get --portid 100
$ orvixcli network port filter stats get -p 100 --formatter=json
## On an uplink port the direction words are swapped.
$ orvixcli network port filter stats get -p 101
## A port without filters gives an empty list, not an error.
$ orvixcli network port filter stats get -p 102
$ orvixcli network port filter stats get -p 102 --formatter=json
$ orvixcli network port filter stats get -p 4294967396
