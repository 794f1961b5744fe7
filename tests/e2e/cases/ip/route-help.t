## What help shows of the route commands: their descriptions and options.
$ orvixcli network ip route --help
Usage: orvixcli network ip route {namespace|cmd} [cmd options]

Operations pertaining to route configuration

Available Namespaces:
  ipv4  IPv4 route operations
  ipv6  IPv6 route operations

For help on a namespace or command: orvixcli network ip route <name> --help

$ orvixcli network ip route ipv4 --help
Usage: orvixcli network ip route ipv4 {namespace|cmd} [cmd options]

IPv4 route operations

Available Commands:
  add     Add IPv4 route to the Pallad.
  remove  Remove IPv4 route
  list    List configured IPv4 routes

For help on a namespace or command: orvixcli network ip route ipv4 <name> --help

$ orvixcli network ip route ipv4 add --help
Usage: orvixcli network ip route ipv4 add [cmd options]

Description:
  Add IPv4 route to the Pallad.

Cmd options:
  -n|--network=<str>  (required)
      The Ipv4 address and prefix length of the network to add the route to. Specify 'default' to indicate the default network.
  -g|--gateway=<str>  (required)
      The Ipv4 address of the gateway through which a route to be added.
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip route ipv4 remove --help
Usage: orvixcli network ip route ipv4 remove [cmd options]

Description:
  Remove IPv4 route

Cmd options:
  -n|--network=<str>  (required)
      The Ipv4 address and prefix length of the network to remove the route from. Specify 'default' to indicate the default network.
  -g|--gateway=<str>  (required)
      The Ipv4 address of the gateway through which a route to be removed
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip route ipv4 list --help
Usage: orvixcli network ip route ipv4 list [cmd options]

Description:
  List configured IPv4 routes

Cmd options:
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip route ipv6 add --help
Usage: orvixcli network ip route ipv6 add [cmd options]

Description:
  Add IPv6 route to the Pallad.

Cmd options:
  -n|--network=<str>  (required)
      The Ipv6 address and prefix length of the network to add the route to. Specify 'default' to indicate the default network.
  -g|--gateway=<str>  (required)
      The Ipv6 address of the gateway through which a route to be added.
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip route ipv6 remove --help
Usage: orvixcli network ip route ipv6 remove [cmd options]

Description:
  Remove IPv6 route from the Pallad

Cmd options:
  -n|--network=<str>  (required)
      The Ipv6 address and prefix length of the network to remove the route from. Specify 'default' to indicate the default network.
  -g|--gateway=<str>  (required)
      The Ipv6 address of the gateway through which a route to be removed
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

$ orvixcli network ip route ipv6 list --help
Usage: orvixcli network ip route ipv6 list [cmd options]

Description:
  List configured IPv6 routes

Cmd options:
  -N|--netstack=<str>
      The network stack instance; if unspecified, use the default netstack instance

## The network and the gateway are required.
$ orvixcli network ip route ipv4 add -n default
! orvixcli: Missing required option --gateway
! Run 'orvixcli network ip route ipv4 add --help' for its options.
[2]

$ orvixcli network ip route ipv6 remove -g 2001:db8:10::1
! orvixcli: Missing required option --network
! Run 'orvixcli network ip route ipv6 remove --help' for its options.
[2]
