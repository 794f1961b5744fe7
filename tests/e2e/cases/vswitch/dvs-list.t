## The default host's distributed switch with its DV ports: those in use
## name their clients, free ones show an empty client list.
$ orvixcli network vswitch dvs orvix list
$ orvixcli network vswitch dvs orvix list --formatter=json
## One switch by name; a name no switch has ends the walk at once: the error
## and an empty list.
$ orvixcli network vswitch dvs orvix list -v dvSwitch0 --formatter=table
$ orvixcli network vswitch dvs orvix list --vds-name=nosuch
$ orvixcli network vswitch dvs orvix list --vds-name=nosuch --formatter=json
