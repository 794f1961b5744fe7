## The default host's two LAGs in all three readers.
$ orvixcli network vswitch dvs orvix lacp config get
$ orvixcli network vswitch dvs orvix lacp status get
$ orvixcli network vswitch dvs orvix lacp stats get
$ orvixcli network vswitch dvs orvix lacp stats get --formatter=json
