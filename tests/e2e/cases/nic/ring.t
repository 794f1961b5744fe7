## network nic ring preset get, current get and current set on the
## default host. Both gets make the same read and show its preset (maximum)
## or its current record.
$ orvixcli network nic ring preset get -n hwnic2
   RX: 8192
   RX Mini: 0
   RX Jumbo: 2048
   TX: 8192

$ orvixcli network nic ring current get -n hwnic2
   RX: 2048
   RX Mini: 0
   RX Jumbo: 512
   TX: 2048

$ orvixcli network nic ring current get --nic-name=hwnic4 --formatter=json
{
  "RX": 4096,
  "RX Mini": 0,
  "RX Jumbo": 0,
  "TX": 4096
}

$ orvixcli network nic ring preset get -n hwnic4 --formatter=json
{
  "RX": 8192,
  "RX Mini": 0,
  "RX Jumbo": 0,
  "TX": 8192
}

$ orvixcli network nic ring preset get -n hwnic9
! NIC with name hwnic9 not found
[1]

$ orvixcli network nic ring current get
! orvixcli: Missing required option --nic-name
! Run 'orvixcli network nic ring current get --help' for its options.
[2]

## No size sends nothing and still succeeds.
$ orvixcli network nic ring current set -n hwnic2

$ orvixcli network nic ring current get -n hwnic2
   RX: 2048
   RX Mini: 0
   RX Jumbo: 512
   TX: 2048

## The sizes given are set, up to the preset; the others stay.
$ orvixcli network nic ring current set -n hwnic2 -r 8192 --tx=4096

$ orvixcli network nic ring current get -n hwnic2 --formatter=json
{
  "RX": 8192,
  "RX Mini": 0,
  "RX Jumbo": 512,
  "TX": 4096
}

$ orvixcli network nic ring current set --nic-name hwnic2 -j 0 --formatter=json

$ orvixcli network nic ring current get -n hwnic2
   RX: 8192
   RX Mini: 0
   RX Jumbo: 0
   TX: 4096

## A size above the preset, or one that is no ring size at all, is refused
## by the library and nothing is written.
$ orvixcli network nic ring current set -n hwnic2 -m 1 -r 1024
! Invalid RX mini ring size value 1 for NIC hwnic2: must be between 0 and 0
[1]

$ orvixcli network nic ring current set -n hwnic2 -t 8193
! Invalid TX ring size value 8193 for NIC hwnic2: must be between 0 and 8192
[1]

$ orvixcli network nic ring current set -n hwnic2 --rx-jumbo=-1
! Invalid RX jumbo ring size value -1 for NIC hwnic2: must be between 0 and 2048
[1]

$ orvixcli network nic ring current get -n hwnic2
   RX: 8192
   RX Mini: 0
   RX Jumbo: 0
   TX: 4096

$ orvixcli network nic ring preset get -n hwnic2
   RX: 8192
   RX Mini: 0
   RX Jumbo: 2048
   TX: 8192

$ orvixcli network nic ring current set -n hwnic9 -r 1
! NIC with name hwnic9 not found
[1]
