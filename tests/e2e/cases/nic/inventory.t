## network nic list: one row a NIC in the host's order. A NIC without a PCI
## device reads "Pseudo" with the description "Unknown Unknown"; the admin
## state and the link status are columns of their own (hwnic2 has a link
## but is administratively down, so its link status is Down).
@profile fixtures/nic/inventory.json
$ orvixcli network nic list

## In JSON the speed and the MTU are numbers, and the "Link" field the table
## leaves out follows the hinted ones.
$ orvixcli network nic list --formatter=json

## network nic get: the generic settings in their order. Wake-on modes are
## shown in the NIC's order, a mode no word names as "None"; only modes of
## the NIC that supports wake-on are listed.
$ orvixcli network nic get -n hwnic0

## A NIC without pause support leaves the three pause fields out; without
## wake-on support "Wakeon" is "None"; without a message level it reads -1.
## A port code no word names is "UNKNOWN" among the supported ports and an
## empty cable type; an advertised mode of duplex auto ends in "Auto".
$ orvixcli network nic get --nic-name=hwnic1

$ orvixcli network nic get -n hwnic1 --formatter=json

$ orvixcli network nic get -n hwnic0 --formatter=json

## The name is shown as it was typed.
$ orvixcli network nic get -n hwnic9
