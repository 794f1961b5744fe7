## network ip interface ipv4 get shows every interface, those of one
## netstack, or the one named; the address type decides whether the
## DNS-from-DHCP flag is shown.
$ orvixcli network ip interface ipv4 get

$ orvixcli network ip interface ipv4 get --formatter=json

$ orvixcli network ip interface ipv4 get -N migrix --formatter=simple

## A netstack without interfaces gives an empty list.
$ orvixcli network ip interface ipv4 get --netstack faultTolerance --formatter=json

## A name wins over a netstack.
$ orvixcli network ip interface ipv4 get -i pld1 -N migrix

$ orvixcli network ip interface ipv4 get -i pld9 --formatter=json
! Unable to find a Pallad interface with the name pld9
[1]

## network ip interface ipv4 set --type static: the three checks all run,
## in their order, and nothing changes when one fails.
$ orvixcli network ip interface ipv4 set -i pld0 -t static
! The --type=static requires the --ipv4 and --netmask options.
! Invalid --ipv4 option provided. This address is not a valid IPv4 address
! Invalid --netmask option provided. This address is not a valid IPv4 address
[1]

$ orvixcli network ip interface ipv4 set -i pld0 -t static --ipv4 192.0.2.300 --netmask 255.255.255.0
! Invalid --ipv4 option provided. This address is not a valid IPv4 address
[1]

$ orvixcli network ip interface ipv4 set -i pld0 -t static --ipv4 192.0.2.30
! The --type=static requires the --ipv4 and --netmask options.
! Invalid --netmask option provided. This address is not a valid IPv4 address
[1]

## The interface is looked up before the options are checked.
$ orvixcli network ip interface ipv4 set -i pld9 -t static
! Unable to find a Pallad interface with the name pld9
[1]

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=simple

## A netmask need only be an IPv4 address; its bits need not be contiguous.
$ orvixcli network ip interface ipv4 set -i pld0 -t static -I 192.0.2.30 -N 255.0.255.0

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=simple

## --type must be one of its three words.
$ orvixcli network ip interface ipv4 set -i pld0 -t bootp
[2]

## dhcp: without --peer-dns the flag stays as it was (off for pld0) ...
$ orvixcli network ip interface ipv4 set -i pld0 -t dhcp

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=json

## ... and with it the flag is set.
$ orvixcli network ip interface ipv4 set -i pld0 -t dhcp --peer-dns true

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=json

## A static address keeps the flag in force although it is not shown, and
## ignores --peer-dns: going back to DHCP shows the flag still on.
$ orvixcli network ip interface ipv4 set -i pld0 -t static -I 192.0.2.31 -N 255.255.255.0 -P false

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=json

$ orvixcli network ip interface ipv4 set -i pld0 -t dhcp

$ orvixcli network ip interface ipv4 get -i pld0 --formatter=json

## The flag is shared with IPv6: pld1 uses DNS from DHCP, and an IPv4 change
## that does not name it keeps it for DHCPv6 too.
$ orvixcli network ip interface ipv6 get -n pld1 --formatter=json

$ orvixcli network ip interface ipv4 set -i pld1 -t none

$ orvixcli network ip interface ipv4 get -i pld1 --formatter=json

$ orvixcli network ip interface ipv6 get -n pld1 --formatter=json

$ orvixcli network ip interface ipv4 set --interface-name pld1 --type dhcp --formatter=json

$ orvixcli network ip interface ipv4 get -i pld1
