## A host without SR-IOV NICs lists an empty table.
@profile fixtures/nic/inventory.json
$ orvixcli network sriovnic list

$ orvixcli network sriovnic list --formatter=json
