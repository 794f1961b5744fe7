## A host without SR-IOV NICs lists an empty table.
@profile fixtures/nic/inventory.json
$ orvixcli network sriovnic list
Name  PCI Device  Driver  Link  Speed  Duplex  MAC Address  MTU  Description
----  ----------  ------  ----  -----  ------  -----------  ---  -----------

$ orvixcli network sriovnic list --formatter=json
[]
