## A host without port groups lists none, and that is no error.
@profile fixtures/vswitch/switches-bare.json
$ orvixcli network vswitch standard portgroup list --formatter=json
[]

$ orvixcli network vswitch standard portgroup list --formatter=simple

## A new switch has no port group either, until one is added.
$ orvixcli network vswitch standard add -v vSwitch0

$ orvixcli network vswitch standard portgroup list --formatter=json
[]

$ orvixcli network vswitch standard portgroup add -p "Management Network" -v vSwitch0

$ orvixcli network vswitch standard portgroup list
Name                Virtual Switch  Active Clients  VLAN ID
------------------  --------------  --------------  -------
Management Network  vSwitch0        0               0
