## A host without distributed switches: the listing is empty and no error;
## the LACP readers say that LACP needs one; naming a switch is an error of
## its own in every LACP command.
@profile fixtures/dvs/no-dvs.json
$ orvixcli network vswitch dvs orvix list
$ orvixcli network vswitch dvs orvix list --formatter=json
$ orvixcli network vswitch dvs orvix lacp config get
$ orvixcli network vswitch dvs orvix lacp status get
$ orvixcli network vswitch dvs orvix lacp stats get
$ orvixcli network vswitch dvs orvix lacp config get --dvs dvSwitch0
$ orvixcli network vswitch dvs orvix lacp status get -s dvSwitch0
$ orvixcli network vswitch dvs orvix lacp stats get -s dvSwitch0
$ orvixcli network vswitch dvs orvix lacp timeout set -s dvSwitch0 -l 1 -t true
