## network ip connection list on the default host: TCP, then UDP, then raw
## IP endpoints, each with the world that owns it.
$ orvixcli network ip connection list

$ orvixcli network ip connection list --formatter=json

## One protocol; all of them by name; another netstack.
$ orvixcli network ip connection list --type udp --formatter=simple

$ orvixcli network ip connection list -t ip --formatter=json

$ orvixcli network ip connection list -t all -N migrix

$ orvixcli network ip connection list -t tcp -N migrix --formatter=simple

## A netstack the host does not have, and a type that is not one of the
## four words.
$ orvixcli network ip connection list -N nosuch

$ orvixcli network ip connection list -t sctp
