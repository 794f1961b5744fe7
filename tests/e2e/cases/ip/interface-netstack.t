## An interface made on a dedicated netstack gets that netstack's tag, which
## interfaces on the default netstack lose; those on other netstacks keep it.
@profile fixtures/ip/interface-points.json

$ orvixcli network ip interface tag get -i pld0

$ orvixcli network ip interface tag get -i pld2

$ orvixcli network ip interface tag get -i pld3

$ orvixcli network ip interface add -p Spare -N migrix

$ orvixcli network ip interface list --netstack migrix --formatter=csv

$ orvixcli network ip interface tag get -i pld6

$ orvixcli network ip interface tag get -i pld0

$ orvixcli network ip interface tag get -i pld2

$ orvixcli network ip interface tag get -i pld3 --formatter=json

## The netstack name is compared exactly: Migrix is no dedicated netstack.
$ orvixcli network ip interface add -s dvSwitch1 -P 6 -N Migrix

## On the fault-tolerance netstack.
$ orvixcli network ip interface add -s dvSwitch1 -P 6 -N faultTolerance

$ orvixcli network ip interface list --netstack faultTolerance --formatter=csv

$ orvixcli network ip interface tag get -i pld8 --formatter=json
