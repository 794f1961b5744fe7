## What help shows of the DNS commands: their descriptions and options.
$ orvixcli network ip dns --help
Usage: orvixcli network ip dns {namespace|cmd} [cmd options]

Operations pertaining to Domain Name Server configuration.

Available Namespaces:
  server  Operations pertaining to DNS server configuration.
  search  Operations pertaining to DNS search domain configuration.

For help on a namespace or command: orvixcli network ip dns <name> --help

$ orvixcli network ip dns server --help
Usage: orvixcli network ip dns server {namespace|cmd} [cmd options]

Operations pertaining to DNS server configuration.

Available Commands:
  list    Print a list of the DNS server currently configured on the system in the order in which they will be used.
  add     Add a new DNS server to the end of the list of DNS servers to use for this Tovrin host.
  remove  Remove a DNS server from the list of DNS servers to use for this Tovrin host.

For help on a namespace or command: orvixcli network ip dns server <name> --help

$ orvixcli network ip dns server add --help
Usage: orvixcli network ip dns server add [cmd options]

Description:
  Add a new DNS server to the end of the list of DNS servers to use for this Tovrin host.

Cmd options:
  -s|--server=<str>  (required)
      The IP address (v4 or v6) of the DNS server to add to the DNS server list.
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip dns server remove --help
Usage: orvixcli network ip dns server remove [cmd options]

Description:
  Remove a DNS server from the list of DNS servers to use for this Tovrin host.

Cmd options:
  -a|--all
       
  -s|--server=<str>
       
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip dns server list --help
Usage: orvixcli network ip dns server list [cmd options]

Description:
  Print a list of the DNS server currently configured on the system in the order in which they will be used.

Cmd options:
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip dns search --help
Usage: orvixcli network ip dns search {namespace|cmd} [cmd options]

Operations pertaining to DNS search domain configuration.

Available Commands:
  add     Add a search domain to the list of domains to be searched when trying to resolve an host name on the Tovrin host.
  remove  Remove a search domain from the list of domains to be searched when trying to resolve an host name on the Tovrin host.
  list    List the search domains currently configured on the Tovrin host in the order in which they will be used when searching.

For help on a namespace or command: orvixcli network ip dns search <name> --help

$ orvixcli network ip dns search add --help
Usage: orvixcli network ip dns search add [cmd options]

Description:
  Add a search domain to the list of domains to be searched when trying to resolve an host name on the Tovrin host.

Cmd options:
  -d|--domain=<str>  (required)
      The string name of a domain to add to the list of search domains.
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip dns search remove --help
Usage: orvixcli network ip dns search remove [cmd options]

Description:
  Remove a search domain from the list of domains to be searched when trying to resolve an host name on the Tovrin host.

Cmd options:
  -d|--domain=<str>  (required)
      The string name of a domain to remove from the list of search domains.
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip dns search list --help
Usage: orvixcli network ip dns search list [cmd options]

Description:
  List the search domains currently configured on the Tovrin host in the order in which they will be used when searching.

Cmd options:
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip dns search add
! orvixcli: Missing required option --domain
! Run 'orvixcli network ip dns search add --help' for its options.
[2]

$ orvixcli network ip dns server add -N migrix
! orvixcli: Missing required option --server
! Run 'orvixcli network ip dns server add --help' for its options.
[2]
