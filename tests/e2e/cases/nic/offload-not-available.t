## A NIC whose driver cannot report its offloads (hwnic1) reads "N/A" in
## every value column; the other NICs are still shown and the listing
## succeeds. Changing its offloads is refused by the library.
@profile fixtures/nic/offload-drivers.json
$ orvixcli network nic cso get
NIC     RX Checksum Offload  TX Checksum Offload
------  -------------------  -------------------
hwnic0  on                   off
hwnic1  N/A                  N/A
hwnic2  off                  on

$ orvixcli network nic tso get --formatter=json
[
  {
    "NIC": "hwnic0",
    "Value": "on"
  },
  {
    "NIC": "hwnic1",
    "Value": "N/A"
  },
  {
    "NIC": "hwnic2",
    "Value": "off"
  }
]

$ orvixcli network nic sg get -n hwnic1 --formatter=simple
   NIC: hwnic1
   Value: N/A

$ orvixcli network nic tso set -n hwnic1 -e 1
! The driver of NIC hwnic1 does not support offload settings
[1]

## Each set marks only its own members: the mixed values of hwnic0 and
## hwnic2 keep what the other families hold.
$ orvixcli network nic sg set -n hwnic0 -e 1

$ orvixcli network nic tso set -n hwnic2 -e 1

$ orvixcli network nic cso get
NIC     RX Checksum Offload  TX Checksum Offload
------  -------------------  -------------------
hwnic0  on                   off
hwnic1  N/A                  N/A
hwnic2  off                  on

$ orvixcli network nic sg get
NIC     Value
------  -----
hwnic0  on
hwnic1  N/A
hwnic2  on

$ orvixcli network nic tso get
NIC     Value
------  -----
hwnic0  on
hwnic1  N/A
hwnic2  on
