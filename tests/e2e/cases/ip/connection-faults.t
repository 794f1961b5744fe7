## The library's failures in connection list come behind the command's own
## sentence, on a line of their own.
$ orvix-hostsim fault add NetworkInfoImpl::GetCurrentUdpPalladConnections --key defaultTcpipStack --message "UDP table of defaultTcpipStack is busy" --count 1

$ orvixcli network ip connection list

## The TCP table alone does not reach the UDP fault; the next list does not
## fail again.
$ orvixcli network ip connection list -t tcp -N migrix

$ orvixcli network ip connection list -t udp --formatter=json

$ orvix-hostsim fault add ResourceInfoImpl::GetWorldName --key 1000021 --message "World table is being rebuilt" --count 1

$ orvixcli network ip connection list -t ip

$ orvixcli network ip connection list -t ip
