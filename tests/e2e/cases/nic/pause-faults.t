## The library's failures in pauseParams list and set. A NIC the listing
## cannot read lists every bool false; the others are shown.
$ orvix-hostsim fault add PnicImpl::GetPauseParams --key hwnic0 --message "Driver of hwnic0 timed out" --count 2
1

$ orvixcli network nic pauseParams list
NIC     Pause Params Supported  Pause RX  Pause TX  Auto Negotiation  Auto Negotiation Resolution Avail  RX Auto Negotiation Resolution  TX Auto Negotiation Resolution
------  ----------------------  --------  --------  ----------------  ---------------------------------  ------------------------------  ------------------------------
hwnic0  false                   false     false     false             false                              false                           false
hwnic1  true                    true      false     true              false                              false                           false
hwnic2  true                    false     false     false             false                              false                           false
hwnic3  true                    false     false     false             false                              false                           false
hwnic4  true                    true      true      true              true                               true                            true
hwnic5  false                   false     false     false             false                              false                           false
hwnic6  false                   false     false     false             false                              false                           false
hwnic7  true                    false     false     false             false                              false                           false

$ orvixcli network nic pauseParams set -n hwnic0 -r false
! Driver of hwnic0 timed out
[1]

## A set with no option still sends the record, so a fault on the write is
## reached; nothing changes.
$ orvix-hostsim fault add PnicImpl::SetPauseParams --key hwnic4 --message "Unable to write the pause parameters of hwnic4" --count 1
2

$ orvixcli network nic pauseParams set -n hwnic4
! Unable to write the pause parameters of hwnic4
[1]

$ orvixcli network nic pauseParams list -n hwnic0 --formatter=json
[
  {
    "NIC": "hwnic0",
    "Pause Params Supported": true,
    "Pause RX": true,
    "Pause TX": true,
    "Auto Negotiation": true,
    "Auto Negotiation Resolution Avail": true,
    "RX Auto Negotiation Resolution": true,
    "TX Auto Negotiation Resolution": true
  }
]

$ orvix-hostsim fault add NetworkInfoImpl::GetPnics --message "Unable to list the NICs: store busy" --count 1
3

$ orvixcli network nic pauseParams list
! Unable to list the NICs: store busy
[1]
