## network nic negotiate restart: the result is a boolean without a value.
$ orvixcli network nic negotiate restart -n hwnic0

$ orvixcli network nic negotiate restart --hwnic=hwnic0 --formatter=json

$ orvixcli network nic negotiate restart -n hwnic9
! Pnic with name hwnic9 not found
[1]
