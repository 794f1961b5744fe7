## A NIC whose driver cannot report coalescing (hwnic1) shows "N/A" in
## its seven value columns; the listing goes on and succeeds.
@profile fixtures/nic/offload-drivers.json
$ orvixcli network nic coalesce get
NIC     RX microseconds  RX maximum frames  TX microseconds  TX Maximum frames  Adaptive RX  Adaptive TX  Sample interval seconds
------  ---------------  -----------------  ---------------  -----------------  -----------  -----------  -----------------------
hwnic0  4294967295       0                  25               32                 On           Off          4
hwnic1  N/A              N/A                N/A              N/A                N/A          N/A          N/A
hwnic2  8                16                 8                16                 Off          On           1

$ orvixcli network nic coalesce get -n hwnic1 --formatter=json
[
  {
    "NIC": "hwnic1",
    "RX microseconds": "N/A",
    "RX maximum frames": "N/A",
    "TX microseconds": "N/A",
    "TX Maximum frames": "N/A",
    "Adaptive RX": "N/A",
    "Adaptive TX": "N/A",
    "Sample interval seconds": "N/A"
  }
]

$ orvixcli network nic coalesce set -n hwnic1 -r 10
! The driver of NIC hwnic1 does not support coalesce parameters
[1]
