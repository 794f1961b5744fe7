## On a host without switches the whole 4608-port budget is free: the
## largest switch fits, and the host-wide limit is reached exactly.
@profile fixtures/vswitch/switches-bare.json
$ orvixcli network vswitch standard add --vswitch-name=big --ports=4096

$ orvixcli network vswitch standard add --vswitch-name=rest --ports=512 --formatter=json
true

$ orvixcli network vswitch standard add --vswitch-name=one --ports=1
! Unable to create virtual switch one with 1 port: 4608 of the host's 4608 ports are allocated already
[1]

## The refused switch was not created.
$ orvixcli network vswitch standard list -v one --formatter=keyvalue
! Unable to access all portsets
[1]

## Removing a switch gives its ports back to the host.
$ orvixcli network vswitch standard remove --vswitch-name=rest

$ orvixcli network vswitch standard add --vswitch-name=one --ports=1
