## network nic cso, tso and sg get and set on the default host. Without
## --hwnic every NIC is listed in the host's order; hwnic3 has TCP
## segmentation offload off, hwnic5 only checksums what it receives, and the
## driver of the pseudo NIC hwnic6 cannot report offloads ("N/A").
$ orvixcli network nic cso get
NIC     RX Checksum Offload  TX Checksum Offload
------  -------------------  -------------------
hwnic0  on                   on
hwnic1  on                   on
hwnic2  on                   on
hwnic3  on                   on
hwnic4  on                   on
hwnic5  on                   off
hwnic6  N/A                  N/A
hwnic7  on                   on

$ orvixcli network nic tso get
NIC     Value
------  -----
hwnic0  on
hwnic1  on
hwnic2  on
hwnic3  off
hwnic4  on
hwnic5  off
hwnic6  N/A
hwnic7  on

$ orvixcli network nic sg get
NIC     Value
------  -----
hwnic0  on
hwnic1  on
hwnic2  on
hwnic3  on
hwnic4  on
hwnic5  off
hwnic6  N/A
hwnic7  on

## One NIC, in the other formatters.
$ orvixcli network nic cso get --hwnic=hwnic5 --formatter=json
[
  {
    "NIC": "hwnic5",
    "RX Checksum Offload": "on",
    "TX Checksum Offload": "off"
  }
]

$ orvixcli network nic tso get -n hwnic3 --formatter=simple
   NIC: hwnic3
   Value: off

$ orvixcli network nic sg get -n hwnic5 --formatter=json
[
  {
    "NIC": "hwnic5",
    "Value": "off"
  }
]

$ orvixcli network nic sg get -n hwnic9
! Pnic with name hwnic9 not found
[1]

## cso set switches both directions together: there is no way to set one
## alone. TCP segmentation offload and scatter-gather stay as they were.
$ orvixcli network nic cso set -n hwnic5 -e 1

$ orvixcli network nic cso get -n hwnic5
NIC     RX Checksum Offload  TX Checksum Offload
------  -------------------  -------------------
hwnic5  on                   on

$ orvixcli network nic cso set --hwnic hwnic0 --enable 0 --formatter=json

$ orvixcli network nic cso get -n hwnic0 --formatter=json
[
  {
    "NIC": "hwnic0",
    "RX Checksum Offload": "off",
    "TX Checksum Offload": "off"
  }
]

$ orvixcli network nic tso get -n hwnic0
NIC     Value
------  -----
hwnic0  on

$ orvixcli network nic sg get -n hwnic0
NIC     Value
------  -----
hwnic0  on

## tso set and sg set change only their own offload.
$ orvixcli network nic tso set -n hwnic3 -e 1

$ orvixcli network nic sg set -n hwnic1 -e 0

$ orvixcli network nic tso get --formatter=simple
   NIC: hwnic0
   Value: on

   NIC: hwnic1
   Value: on

   NIC: hwnic2
   Value: on

   NIC: hwnic3
   Value: on

   NIC: hwnic4
   Value: on

   NIC: hwnic5
   Value: off

   NIC: hwnic6
   Value: N/A

   NIC: hwnic7
   Value: on

$ orvixcli network nic sg get
NIC     Value
------  -----
hwnic0  on
hwnic1  off
hwnic2  on
hwnic3  on
hwnic4  on
hwnic5  off
hwnic6  N/A
hwnic7  on

$ orvixcli network nic cso get
NIC     RX Checksum Offload  TX Checksum Offload
------  -------------------  -------------------
hwnic0  off                  off
hwnic1  on                   on
hwnic2  on                   on
hwnic3  on                   on
hwnic4  on                   on
hwnic5  on                   on
hwnic6  N/A                  N/A
hwnic7  on                   on

## The enable value is 0 or 1, and both options are required.
$ orvixcli network nic tso set -n hwnic0 -e 2
! orvixcli: Value 2 for --enable is out of range: it must be between 0 and 1
! Run 'orvixcli network nic tso set --help' for its options.
[2]

$ orvixcli network nic cso set -n hwnic0
! orvixcli: Missing required option --enable
! Run 'orvixcli network nic cso set --help' for its options.
[2]

$ orvixcli network nic sg set -n hwnic9 -e 1
! Pnic with name hwnic9 not found
[1]
