## Every TCP state word, a state no word names, long IPv6 endpoints shown
## whole, and world names: a virtual machine's in full, a world that ended
## and no world at all as empty.
@profile fixtures/ip/connections.json
$ orvixcli network ip connection list

$ orvixcli network ip connection list -t tcp --formatter=json

$ orvixcli network ip connection list -t udp --formatter=simple
