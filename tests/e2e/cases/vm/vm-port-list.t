## The ports of one world in switch and port order: on a standard switch
## with an empty "DVPort ID", on a distributed one with the DV port and its
## port group. Filters attached in both directions are named once.
@profile fixtures/vm/worlds.json
$ orvixcli network vm port list --world-id 1000
$ orvixcli network vm port list -w 1000 --formatter=json
## A team uplink the host cannot follow shows as "" with uplink port -1:
## none at all (world 1500), a NIC the host does not have (1700), a NIC that
## is no uplink (the second port of 2000). The world's other ports are
## still shown.
$ orvixcli network vm port list -w 1500
$ orvixcli network vm port list -w 1700 --formatter=json
$ orvixcli network vm port list -w 2000
## Worlds without ports, and ids that name no world: a running world with no
## port, negative ids, 0, and 2^32 + 1000, which is not world 1000.
$ orvixcli network vm port list -w 3000
$ orvixcli network vm port list -w -5
$ orvixcli network vm port list -w 0
$ orvixcli network vm port list -w 4294968296
