## A NIC whose driver cannot report its rings: both gets and the set
## report it.
@profile fixtures/nic/offload-drivers.json
$ orvixcli network nic ring preset get -n hwnic1
! The driver of NIC hwnic1 does not support ring parameters
[1]

$ orvixcli network nic ring current set -n hwnic1 -t 64
! The driver of NIC hwnic1 does not support ring parameters
[1]

$ orvixcli network nic ring current get -n hwnic0
   RX: 512
   RX Mini: 128
   RX Jumbo: 256
   TX: 1024
