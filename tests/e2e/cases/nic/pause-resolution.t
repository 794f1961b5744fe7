## A NIC that does not support pause parameters lists every bool false,
## whatever else its record holds (hwnic1); resolution codes (1, 0) leave
## all three resolution fields false (hwnic2).
@profile fixtures/nic/offload-drivers.json
$ orvixcli network nic pauseParams list --formatter=simple
   NIC: hwnic0
   Pause Params Supported: true
   Pause RX: true
   Pause TX: true
   Auto Negotiation: true
   Auto Negotiation Resolution Avail: true
   RX Auto Negotiation Resolution: true
   TX Auto Negotiation Resolution: true

   NIC: hwnic1
   Pause Params Supported: false
   Pause RX: false
   Pause TX: false
   Auto Negotiation: false
   Auto Negotiation Resolution Avail: false
   RX Auto Negotiation Resolution: false
   TX Auto Negotiation Resolution: false

   NIC: hwnic2
   Pause Params Supported: true
   Pause RX: true
   Pause TX: false
   Auto Negotiation: false
   Auto Negotiation Resolution Avail: false
   RX Auto Negotiation Resolution: false
   TX Auto Negotiation Resolution: false
