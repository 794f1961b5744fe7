## network ip ipsec sa remove: a unique SA by name, an automatic SA by its
## addresses and SPI, or all of them; any other mix is refused with the
## three forms explained, and nothing is removed.
$ orvixcli network ip ipsec sa remove -n sa-web-in

$ orvixcli network ip ipsec sa remove -n sa-web-in
! SA sa-web-in does not exist
[1]

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90 -p 0x2710

$ orvixcli network ip ipsec sa list --formatter=simple
   Name: sa-web-out
   Source Address: 2001:db8:10::21
   Destination Address: 2001:db8:10::80
   State: mature
   SPI: 0x1f4
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: 1h 

   Name: sa-lab
   Source Address: 2001:db8:20::21
   Destination Address: 2001:db8:20::99
   State: mature
   SPI: 0x1000
   Mode: tunnel
   Encryption Algorithm: null
   Integrity Algorithm: hmac-sha1
   Lifetime: infinite

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90 -p 2710
! No automatic SA from 2001:db8:10::21 to 2001:db8:10::90 with SPI 0x2710
[1]

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90 --sa-spi=-2710
! Check the input value for '--sa-spi'. Should be hex integer. Got -2710
[1]

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90
! Can not figure out which operation you want to perform.
! Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.
! Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' and '--sa-spi' and omit '--remove-all' when removing an auto SA.
! Remove all SAs: You should only set the flag '--remove-all' to remove all SAs.
[1]

$ orvixcli network ip ipsec sa remove -n sa-lab --remove-all
! Can not figure out which operation you want to perform.
! Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.
! Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' and '--sa-spi' and omit '--remove-all' when removing an auto SA.
! Remove all SAs: You should only set the flag '--remove-all' to remove all SAs.
[1]

$ orvixcli network ip ipsec sa remove -n sa-lab -p 1000
! Can not figure out which operation you want to perform.
! Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.
! Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' and '--sa-spi' and omit '--remove-all' when removing an auto SA.
! Remove all SAs: You should only set the flag '--remove-all' to remove all SAs.
[1]

$ orvixcli network ip ipsec sa remove -a -s any
! Can not figure out which operation you want to perform.
! Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.
! Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' and '--sa-spi' and omit '--remove-all' when removing an auto SA.
! Remove all SAs: You should only set the flag '--remove-all' to remove all SAs.
[1]

$ orvixcli network ip ipsec sa remove
! Can not figure out which operation you want to perform.
! Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.
! Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' and '--sa-spi' and omit '--remove-all' when removing an auto SA.
! Remove all SAs: You should only set the flag '--remove-all' to remove all SAs.
[1]

$ orvixcli network ip ipsec sa list --formatter=json
[
  {
    "Name": "sa-web-out",
    "Source Address": "2001:db8:10::21",
    "Destination Address": "2001:db8:10::80",
    "State": "mature",
    "SPI": "0x1f4",
    "Mode": "transport",
    "Encryption Algorithm": "aes128-cbc",
    "Integrity Algorithm": "hmac-sha2-256",
    "Lifetime": "1h "
  },
  {
    "Name": "sa-lab",
    "Source Address": "2001:db8:20::21",
    "Destination Address": "2001:db8:20::99",
    "State": "mature",
    "SPI": "0x1000",
    "Mode": "tunnel",
    "Encryption Algorithm": "null",
    "Integrity Algorithm": "hmac-sha1",
    "Lifetime": "infinite"
  }
]

$ orvixcli network ip ipsec sa remove --remove-all

$ orvixcli network ip ipsec sa list --formatter=json
[]
