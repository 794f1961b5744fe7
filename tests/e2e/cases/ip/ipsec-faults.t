## The library's failures in the IPsec commands reach the user as the
## library's message alone, and nothing changes.
$ orvix-hostsim fault add IpSecConfigImpl::GetSADConfigList --message "SA database is locked" --count 1
1

$ orvixcli network ip ipsec sa list
! SA database is locked
[1]

$ orvix-hostsim fault add IpSecConfigImpl::AddSADConfig --key sa-new --message "Unable to add SA sa-new" --count 1
2

$ orvixcli network ip ipsec sa add -n sa-new -s any -d any -p 1 -e null -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567
! Unable to add SA sa-new
[1]

$ orvix-hostsim fault add IpSecConfigImpl::RemoveSADConfig --key sa-lab --message "Unable to remove SA sa-lab" --count 1
3

$ orvixcli network ip ipsec sa remove -n sa-lab
! Unable to remove SA sa-lab
[1]

$ orvix-hostsim fault add IpSecConfigImpl::RemoveAutoSADConfig --message "Unable to remove the automatic SA" --count 1
4

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90 -p 2710
! Unable to remove the automatic SA
[1]

$ orvix-hostsim fault add IpSecConfigImpl::FlushSADConfig --message "Unable to flush the SA database" --count 1
5

$ orvixcli network ip ipsec sa remove -a
! Unable to flush the SA database
[1]

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

   Name: sa-web-in
   Source Address: 2001:db8:10::80
   Destination Address: 2001:db8:10::21
   State: mature
   SPI: 0x1f5
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

   Name: auto-10000
   Source Address: 2001:db8:10::21
   Destination Address: 2001:db8:10::90
   State: dying
   SPI: 0x2710
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: 8h 

$ orvix-hostsim fault add IpSecConfigImpl::GetSPDConfigList --message "SP database is locked" --count 1
6

$ orvixcli network ip ipsec sp list --formatter=json
! SP database is locked
[1]

$ orvix-hostsim fault add IpSecConfigImpl::AddSPDConfig --key sp-new --message "Unable to add SP sp-new" --count 1
7

$ orvixcli network ip ipsec sp add -n sp-new -s any -d any -p 0 -P 0
! Unable to add SP sp-new
[1]

$ orvix-hostsim fault add IpSecConfigImpl::RemoveSPDConfig --key sp-lab --message "Unable to remove SP sp-lab" --count 1
8

$ orvixcli network ip ipsec sp remove -n sp-lab
! Unable to remove SP sp-lab
[1]

$ orvix-hostsim fault add IpSecConfigImpl::FlushSPDConfig --message "Unable to flush the SP database" --count 1
9

$ orvixcli network ip ipsec sp remove -a
! Unable to flush the SP database
[1]

$ orvixcli network ip ipsec sp list
Name          Source Address       Source Port  Destination Address  Destination Port  Protocol  Flow  Action   Mode       SA Name
------------  -------------------  -----------  -------------------  ----------------  --------  ----  -------  ---------  ----------
sp-web-out    2001:db8:10::21/128  0            2001:db8:10::80/128  443               tcp       out   ipsec    transport  sa-web-out
sp-web-in     2001:db8:10::80/128  443          2001:db8:10::21/128  0                 tcp       in    ipsec    transport  sa-web-in
sp-lab        2001:db8:20::/64     0            2001:db8:20::/64     0                 any       out   ipsec    tunnel
sp-no-telnet  ::/0                 0            ::/0                 23                tcp       in    discard  any
