## network sriovnic list: the SR-IOV capable NICs as nic list shows them,
## with fewer columns; a NIC without a PCI device reads "Pseudo".
@profile fixtures/nic/sriov.json
$ orvixcli network sriovnic list

$ orvixcli network sriovnic list --formatter=json

## network sriovnic vf list: the VFs of one SR-IOV NIC in id order.
$ orvixcli network sriovnic vf list -n hwnic4

$ orvixcli network sriovnic vf list -n hwnic4 --formatter=json

$ orvixcli network sriovnic vf list -n hwnic5

$ orvixcli network sriovnic vf list -n hwnic0

$ orvixcli network sriovnic vf list -n hwnic9

## network sriovnic vf stats: the name as typed and the VF ID, then the
## twenty counters.
$ orvixcli network sriovnic vf stats -n hwnic4 -v 3

$ orvixcli network sriovnic vf stats -n hwnic4 -v 0 --formatter=json

## An ID beyond 32 bits is not wrapped onto VF 3: the library does not know
## it. Nor a VF the NIC does not have, nor a negative ID.
$ orvixcli network sriovnic vf stats -n hwnic4 -v 4294967299

$ orvixcli network sriovnic vf stats -n hwnic4 -v 2

$ orvixcli network sriovnic vf stats -n hwnic4 -v -253

$ orvixcli network sriovnic vf stats -n hwnic5 -v 0

$ orvixcli network sriovnic vf stats -n hwnic0 -v 0
