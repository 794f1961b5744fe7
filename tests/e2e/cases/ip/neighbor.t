## network ip neighbor list on the default host: IPv4 entries before IPv6
## entries, each in the host's order; IPv4 entries have no state.
$ orvixcli network ip neighbor list

$ orvixcli network ip neighbor list --formatter=simple

$ orvixcli network ip neighbor list --formatter=json

## One family, one interface, another netstack.
$ orvixcli network ip neighbor list -v 4

$ orvixcli network ip neighbor list --version 6 --formatter=json

$ orvixcli network ip neighbor list -i pld1

$ orvixcli network ip neighbor list -N migrix --formatter=simple

## An interface the host does not have stops the command before any table
## is read; so does a netstack it does not have, with the library's words.
$ orvixcli network ip neighbor list -i pld9

$ orvixcli network ip neighbor list -N nosuch

## The version is one of three words.
$ orvixcli network ip neighbor list -v 5

## With IPv6 off, IPv6 entries are not listed, and asking for them alone
## gives an empty list rather than an error.
$ orvixcli network ip set --ipv6-enabled=false

$ orvixcli network ip neighbor list

$ orvixcli network ip neighbor list -v 6 --formatter=json

$ orvixcli network ip neighbor list -v 6
