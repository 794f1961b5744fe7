## Names that are not printable UTF-8 are refused with the command's own
## message, exit status 1, and nothing is stored.
$ orvixcli network vswitch standard portgroup add -v vSwitch0 -p 'pg√'
! Invalid port group name 'pg\xc3': use 1 to 64 printable characters, not beginning or ending with a blank
[1]

## U+009B, a control character of its own in UTF-8 (bytes c2 9b).
$ orvixcli network vswitch standard portgroup add -v vSwitch0 -p 'pg¬õ'
! Invalid port group name 'pg\u009b': use 1 to 64 printable characters, not beginning or ending with a blank
[1]

$ orvixcli network vswitch standard add -v 'sw√'
! Invalid virtual switch name 'sw\xc3': use 1 to 32 letters, digits, '.', '-' or '_'
[1]

$ orvixcli network vswitch standard portgroup list --formatter=csv
Name,Virtual Switch,Active Clients,VLAN ID
Management Network,vSwitch0,1,0
VM Network,vSwitch0,2,0
Storage,vSwitch0,2,20
Migration,vSwitch0,1,30
Lab Isolated,vSwitch1,0,100
