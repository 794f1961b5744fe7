## network ip interface list: every kind of connection point, an interface
## without one, and the netstack filter.
@profile fixtures/ip/interface-points.json

$ orvixcli network ip interface list

$ orvixcli network ip interface list --formatter=json

## Only the interfaces of one netstack instance.
$ orvixcli network ip interface list --netstack migrix

$ orvixcli network ip interface list -N lab --formatter=json

## An empty value means every netstack.
$ orvixcli network ip interface list --netstack "" --formatter=csv

$ orvixcli network ip interface list --netstack faultTolerance --formatter=json

$ orvixcli network ip interface list --formatter=table
