## A host whose ports no world uses: an empty list, and no port for any id.
@profile fixtures/dvs/no-dvs.json
$ orvixcli network vm list
World ID  Name  Num Ports  Networks
--------  ----  ---------  --------
$ orvixcli network vm list --formatter=json
[]
$ orvixcli network vm port list -w 1000012
! Couldn't find VM with given world ID
[1]
