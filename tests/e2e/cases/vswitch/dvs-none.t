## A host without distributed switches: the listing is empty and no error;
## the LACP readers say that LACP needs one; naming a switch is an error of
## its own in every LACP command.
@profile fixtures/dvs/no-dvs.json
$ orvixcli network vswitch dvs orvix list
$ orvixcli network vswitch dvs orvix list --formatter=json
[]
$ orvixcli network vswitch dvs orvix lacp config get
! LACP is supported on Orvix DVSwitch only, and there is no DVSwitch configured on host.
[1]
$ orvixcli network vswitch dvs orvix lacp status get
! LACP is supported on Orvix DVSwitch only, and there is no DVSwitch configured on host.
[1]
$ orvixcli network vswitch dvs orvix lacp stats get
! LACP is supported on Orvix DVSwitch only, and there is no DVSwitch configured on host.
[1]
$ orvixcli network vswitch dvs orvix lacp config get --dvs dvSwitch0
! Unable to find a DVSwitch with the name dvSwitch0
[1]
$ orvixcli network vswitch dvs orvix lacp status get -s dvSwitch0
! Unable to find a DVSwitch with the name dvSwitch0
[1]
$ orvixcli network vswitch dvs orvix lacp stats get -s dvSwitch0
! Unable to find a DVSwitch with the name dvSwitch0
[1]
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvSwitch0 -l 1 -t true
! Unable to find a DVSwitch with the name dvSwitch0
[1]
