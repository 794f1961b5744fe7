## DNS servers of a netstack: order after add and remove, both families, the
## invalid-address message and the --all / --server rule.
$ orvixcli network ip dns server list
   DNS Servers: 192.0.2.53, 198.51.100.53, 2001:db8:10::53

$ orvixcli network ip dns server list --formatter=json
{
  "DNS Servers": [
    "192.0.2.53",
    "198.51.100.53",
    "2001:db8:10::53"
  ]
}

$ orvixcli network ip dns server list -N migrix
   DNS Servers: 203.0.113.53

$ orvixcli network ip dns server list -N faultTolerance --formatter=json
{
  "DNS Servers": []
}

$ orvixcli network ip dns server list --netstack=
   DNS Servers: 192.0.2.53, 198.51.100.53, 2001:db8:10::53

$ orvixcli network ip dns server list -N nowhere
! Netstack instance nowhere does not exist
[1]

## New servers go to the end, in canonical text.
$ orvixcli network ip dns server add --server 10.0.0.1

$ orvixcli network ip dns server add -s FE80:0:0::1

$ orvixcli network ip dns server list
   DNS Servers: 192.0.2.53, 198.51.100.53, 2001:db8:10::53, 10.0.0.1, fe80::1

$ orvixcli network ip dns server add -s 10.0.0.1
! DNS server 10.0.0.1 is already configured
[1]

$ orvixcli network ip dns server add -s 10.0.0.256
! The specified address '10.0.0.256' is not recognised as a valid IP address
[1]

$ orvixcli network ip dns server add -s dns.example.test
! The specified address 'dns.example.test' is not recognised as a valid IP address
[1]

$ orvixcli network ip dns server add -s ""
! The specified address '' is not recognised as a valid IP address
[1]

$ orvixcli network ip dns server list
   DNS Servers: 192.0.2.53, 198.51.100.53, 2001:db8:10::53, 10.0.0.1, fe80::1

$ orvixcli network ip dns server remove -s 198.51.100.53

$ orvixcli network ip dns server remove --server fe80::1

$ orvixcli network ip dns server list
   DNS Servers: 192.0.2.53, 2001:db8:10::53, 10.0.0.1

$ orvixcli network ip dns server remove -s 198.51.100.53
! DNS server 198.51.100.53 is not configured
[1]

$ orvixcli network ip dns server remove -s not-an-address
! The specified address 'not-an-address' is not recognised as a valid IP address
[1]

## Exactly one of --all and --server; nothing is removed otherwise.
$ orvixcli network ip dns server remove --all --server 10.0.0.1
! You must specify exactly one of: --all, --server
[1]

$ orvixcli network ip dns server remove
! You must specify exactly one of: --all, --server
[1]

$ orvixcli network ip dns server list --formatter=json
{
  "DNS Servers": [
    "192.0.2.53",
    "2001:db8:10::53",
    "10.0.0.1"
  ]
}

## Another netstack has its own list; --all empties it alone.
$ orvixcli network ip dns server add -s 2001:db8:30::53 -N migrix

$ orvixcli network ip dns server list -N migrix
   DNS Servers: 203.0.113.53, 2001:db8:30::53

$ orvixcli network ip dns server remove --all -N migrix

$ orvixcli network ip dns server list -N migrix --formatter=json
{
  "DNS Servers": []
}

$ orvixcli network ip dns server list
   DNS Servers: 192.0.2.53, 2001:db8:10::53, 10.0.0.1

$ orvixcli network ip dns server remove -a

$ orvixcli network ip dns server list
   DNS Servers: 

$ orvixcli network ip dns server add -s 192.0.2.53 -N nowhere
! Netstack instance nowhere does not exist
[1]
