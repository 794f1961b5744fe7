## network ip neighbor remove: on an interface, on a whole netstack, and
## the interface's own netstack winning over --netstack.
$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.53 -i pld0

$ orvixcli network ip neighbor list -v 4 -i pld0 --formatter=simple

## pld2 is on migrix: its neighbor is found there although the default
## netstack is named.
$ orvixcli network ip neighbor remove -v 4 -a 203.0.113.22 -i pld2 -N defaultTcpipStack

$ orvixcli network ip neighbor list -N migrix

## Without an interface the named netstack is searched, all of it.
$ orvixcli network ip neighbor remove -v 4 -a 203.0.113.1 -N defaultTcpipStack

$ orvixcli network ip neighbor remove --version 4 --neighbor-addr 203.0.113.1 --netstack migrix

$ orvixcli network ip neighbor list -N migrix --formatter=json

$ orvixcli network ip neighbor remove -v 6 -a 2001:db8:20::1

$ orvixcli network ip neighbor list -v 6

## Refusals: an interface the host does not have, an address that is not
## one, an address that is not there, a version that is not 4 or 6, and a
## missing address.
$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.1 -i pld9

$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.300

$ orvixcli network ip neighbor remove -v 4 -a 192.0.2.99 -i pld0

$ orvixcli network ip neighbor remove -v all -a 192.0.2.1

$ orvixcli network ip neighbor remove -v 4

## With IPv6 off nothing is removed, and the answer is still true.
$ orvixcli network ip set --ipv6-enabled=false

$ orvixcli network ip neighbor remove -v 6 -a 2001:db8:10::1

$ orvixcli network ip set --ipv6-enabled=true

$ orvixcli network ip neighbor list -v 6 -i pld0
