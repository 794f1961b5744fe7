## network nic list on the default host, whose NICs all have a PCI device.
$ orvixcli network nic list

$ orvixcli network nic get -n hwnic2
