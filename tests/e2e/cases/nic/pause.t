## network nic pauseParams list and set on the default host. hwnic1 has a
## negotiated result for RX only, so no resolution is available at all;
## hwnic5 and hwnic6 do not support pause parameters and list every bool
## false.
$ orvixcli network nic pauseParams list
NIC     Pause Params Supported  Pause RX  Pause TX  Auto Negotiation  Auto Negotiation Resolution Avail  RX Auto Negotiation Resolution  TX Auto Negotiation Resolution
------  ----------------------  --------  --------  ----------------  ---------------------------------  ------------------------------  ------------------------------
hwnic0  true                    true      true      true              true                               true                            true
hwnic1  true                    true      false     true              false                              false                           false
hwnic2  true                    false     false     false             false                              false                           false
hwnic3  true                    false     false     false             false                              false                           false
hwnic4  true                    true      true      true              true                               true                            true
hwnic5  false                   false     false     false             false                              false                           false
hwnic6  false                   false     false     false             false                              false                           false
hwnic7  true                    false     false     false             false                              false                           false

$ orvixcli network nic pauseParams list -n hwnic1 --formatter=json
[
  {
    "NIC": "hwnic1",
    "Pause Params Supported": true,
    "Pause RX": true,
    "Pause TX": false,
    "Auto Negotiation": true,
    "Auto Negotiation Resolution Avail": false,
    "RX Auto Negotiation Resolution": false,
    "TX Auto Negotiation Resolution": false
  }
]

$ orvixcli network nic pauseParams list --nic-name=hwnic0 --formatter=simple
   NIC: hwnic0
   Pause Params Supported: true
   Pause RX: true
   Pause TX: true
   Auto Negotiation: true
   Auto Negotiation Resolution Avail: true
   RX Auto Negotiation Resolution: true
   TX Auto Negotiation Resolution: true

$ orvixcli network nic pauseParams list -n hwnic9
! NIC with name hwnic9 not found
[1]

## Each option given replaces its switch; the others and the resolutions
## stay as read.
$ orvixcli network nic pauseParams set -n hwnic1 --tx true

$ orvixcli network nic pauseParams set --nic-name hwnic0 -a false -r false --formatter=json

$ orvixcli network nic pauseParams list --formatter=json
[
  {
    "NIC": "hwnic0",
    "Pause Params Supported": true,
    "Pause RX": false,
    "Pause TX": true,
    "Auto Negotiation": false,
    "Auto Negotiation Resolution Avail": true,
    "RX Auto Negotiation Resolution": true,
    "TX Auto Negotiation Resolution": true
  },
  {
    "NIC": "hwnic1",
    "Pause Params Supported": true,
    "Pause RX": true,
    "Pause TX": true,
    "Auto Negotiation": true,
    "Auto Negotiation Resolution Avail": false,
    "RX Auto Negotiation Resolution": false,
    "TX Auto Negotiation Resolution": false
  },
  {
    "NIC": "hwnic2",
    "Pause Params Supported": true,
    "Pause RX": false,
    "Pause TX": false,
    "Auto Negotiation": false,
    "Auto Negotiation Resolution Avail": false,
    "RX Auto Negotiation Resolution": false,
    "TX Auto Negotiation Resolution": false
  },
  {
    "NIC": "hwnic3",
    "Pause Params Supported": true,
    "Pause RX": false,
    "Pause TX": false,
    "Auto Negotiation": false,
    "Auto Negotiation Resolution Avail": false,
    "RX Auto Negotiation Resolution": false,
    "TX Auto Negotiation Resolution": false
  },
  {
    "NIC": "hwnic4",
    "Pause Params Supported": true,
    "Pause RX": true,
    "Pause TX": true,
    "Auto Negotiation": true,
    "Auto Negotiation Resolution Avail": true,
    "RX Auto Negotiation Resolution": true,
    "TX Auto Negotiation Resolution": true
  },
  {
    "NIC": "hwnic5",
    "Pause Params Supported": false,
    "Pause RX": false,
    "Pause TX": false,
    "Auto Negotiation": false,
    "Auto Negotiation Resolution Avail": false,
    "RX Auto Negotiation Resolution": false,
    "TX Auto Negotiation Resolution": false
  },
  {
    "NIC": "hwnic6",
    "Pause Params Supported": false,
    "Pause RX": false,
    "Pause TX": false,
    "Auto Negotiation": false,
    "Auto Negotiation Resolution Avail": false,
    "RX Auto Negotiation Resolution": false,
    "TX Auto Negotiation Resolution": false
  },
  {
    "NIC": "hwnic7",
    "Pause Params Supported": true,
    "Pause RX": false,
    "Pause TX": false,
    "Auto Negotiation": false,
    "Auto Negotiation Resolution Avail": false,
    "RX Auto Negotiation Resolution": false,
    "TX Auto Negotiation Resolution": false
  }
]

## No option still writes back the record just read.
$ orvixcli network nic pauseParams set -n hwnic2

$ orvixcli network nic pauseParams list -n hwnic2
NIC     Pause Params Supported  Pause RX  Pause TX  Auto Negotiation  Auto Negotiation Resolution Avail  RX Auto Negotiation Resolution  TX Auto Negotiation Resolution
------  ----------------------  --------  --------  ----------------  ---------------------------------  ------------------------------  ------------------------------
hwnic2  true                    false     false     false             false                              false                           false

$ orvixcli network nic pauseParams set -n hwnic9 -r true
! NIC with name hwnic9 not found
[1]
