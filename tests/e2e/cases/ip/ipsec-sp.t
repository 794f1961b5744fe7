## network ip ipsec sp list on the default host, and sp add: networks or
## "any", ports, and the mode kept only for the action ipsec.
$ orvixcli network ip ipsec sp list
Name          Source Address       Source Port  Destination Address  Destination Port  Protocol  Flow  Action   Mode       SA Name
------------  -------------------  -----------  -------------------  ----------------  --------  ----  -------  ---------  ----------
sp-web-out    2001:db8:10::21/128  0            2001:db8:10::80/128  443               tcp       out   ipsec    transport  sa-web-out
sp-web-in     2001:db8:10::80/128  443          2001:db8:10::21/128  0                 tcp       in    ipsec    transport  sa-web-in
sp-lab        2001:db8:20::/64     0            2001:db8:20::/64     0                 any       out   ipsec    tunnel
sp-no-telnet  ::/0                 0            ::/0                 23                tcp       in    discard  any

$ orvixcli network ip ipsec sp list --formatter=json
[
  {
    "Name": "sp-web-out",
    "Source Address": "2001:db8:10::21/128",
    "Source Port": 0,
    "Destination Address": "2001:db8:10::80/128",
    "Destination Port": 443,
    "Protocol": "tcp",
    "Flow": "out",
    "Action": "ipsec",
    "Mode": "transport",
    "SA Name": "sa-web-out"
  },
  {
    "Name": "sp-web-in",
    "Source Address": "2001:db8:10::80/128",
    "Source Port": 443,
    "Destination Address": "2001:db8:10::21/128",
    "Destination Port": 0,
    "Protocol": "tcp",
    "Flow": "in",
    "Action": "ipsec",
    "Mode": "transport",
    "SA Name": "sa-web-in"
  },
  {
    "Name": "sp-lab",
    "Source Address": "2001:db8:20::/64",
    "Source Port": 0,
    "Destination Address": "2001:db8:20::/64",
    "Destination Port": 0,
    "Protocol": "any",
    "Flow": "out",
    "Action": "ipsec",
    "Mode": "tunnel",
    "SA Name": ""
  },
  {
    "Name": "sp-no-telnet",
    "Source Address": "::/0",
    "Source Port": 0,
    "Destination Address": "::/0",
    "Destination Port": 23,
    "Protocol": "tcp",
    "Flow": "in",
    "Action": "discard",
    "Mode": "any",
    "SA Name": ""
  }
]

$ orvixcli network ip ipsec sp add -n sp-any -s any -d 2001:db8:30::/48 -p 0 -P 65535 -A ipsec -m tunnel -u udp -w in -a sa-lab

$ orvixcli network ip ipsec sp add --sp-name sp-drop --sp-source 2001:db8:40::/64 --sp-destination any --source-port 1024 --destination-port 0 --action discard --sp-mode tunnel

$ orvixcli network ip ipsec sp add -n sp-plain -s 2001:db8:50::1/128 -d 2001:db8:50::2/128 -p 80 -P 8080 -A none -u icmp6 -w out

$ orvixcli network ip ipsec sp add -n sp-transport -s 2001:db8:60::/64 -d 2001:db8:61::/64 -p 22 -P 0 -A ipsec -m transport -u tcp -w out -a sa-web-out

$ orvixcli network ip ipsec sp add -n sp-in-any -s any -d any -p 0 -P 0 -A ipsec -u any -w in

$ orvixcli network ip ipsec sp add -n sp-defaults -s any -d any -p 0 -P 0

$ orvixcli network ip ipsec sp list --formatter=simple
   Name: sp-web-out
   Source Address: 2001:db8:10::21/128
   Source Port: 0
   Destination Address: 2001:db8:10::80/128
   Destination Port: 443
   Protocol: tcp
   Flow: out
   Action: ipsec
   Mode: transport
   SA Name: sa-web-out

   Name: sp-web-in
   Source Address: 2001:db8:10::80/128
   Source Port: 443
   Destination Address: 2001:db8:10::21/128
   Destination Port: 0
   Protocol: tcp
   Flow: in
   Action: ipsec
   Mode: transport
   SA Name: sa-web-in

   Name: sp-lab
   Source Address: 2001:db8:20::/64
   Source Port: 0
   Destination Address: 2001:db8:20::/64
   Destination Port: 0
   Protocol: any
   Flow: out
   Action: ipsec
   Mode: tunnel
   SA Name: 

   Name: sp-no-telnet
   Source Address: ::/0
   Source Port: 0
   Destination Address: ::/0
   Destination Port: 23
   Protocol: tcp
   Flow: in
   Action: discard
   Mode: any
   SA Name: 

   Name: sp-any
   Source Address: ::/0
   Source Port: 0
   Destination Address: 2001:db8:30::/48
   Destination Port: 65535
   Protocol: udp
   Flow: in
   Action: ipsec
   Mode: tunnel
   SA Name: sa-lab

   Name: sp-drop
   Source Address: 2001:db8:40::/64
   Source Port: 1024
   Destination Address: ::/0
   Destination Port: 0
   Protocol: any
   Flow: out
   Action: discard
   Mode: any
   SA Name: 

   Name: sp-plain
   Source Address: 2001:db8:50::1/128
   Source Port: 80
   Destination Address: 2001:db8:50::2/128
   Destination Port: 8080
   Protocol: icmp6
   Flow: out
   Action: none
   Mode: any
   SA Name: 

   Name: sp-transport
   Source Address: 2001:db8:60::/64
   Source Port: 22
   Destination Address: 2001:db8:61::/64
   Destination Port: 0
   Protocol: tcp
   Flow: out
   Action: ipsec
   Mode: transport
   SA Name: sa-web-out

   Name: sp-in-any
   Source Address: ::/0
   Source Port: 0
   Destination Address: ::/0
   Destination Port: 0
   Protocol: any
   Flow: in
   Action: ipsec
   Mode: any
   SA Name: 

   Name: sp-defaults
   Source Address: ::/0
   Source Port: 0
   Destination Address: ::/0
   Destination Port: 0
   Protocol: any
   Flow: out
   Action: ipsec
   Mode: any
   SA Name: 

## Ports outside 0 to 65535 are refused before anything is stored.
$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 65536 -P 0
! Check the input value for '--source-port'. Should be in range 0-65535. Got 65536
[1]

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 --destination-port=-1
! Check the input value for '--destination-port'. Should be in range 0-65535. Got -1
[1]

## Networks and words.
$ orvixcli network ip ipsec sp add -n sp-bad -s 2001:db8::/129 -d any -p 0 -P 0
! Invalid IPv6 network: '2001:db8::/129'
[1]

$ orvixcli network ip ipsec sp add -n sp-bad -s 192.0.2.0/24 -d any -p 0 -P 0
! Invalid IPv6 network: '192.0.2.0/24'
[1]

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -A bypass
! orvixcli: Invalid value 'bypass' for --action: it must be one of none, discard, ipsec
! Run 'orvixcli network ip ipsec sp add --help' for its options.
[2]

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -u sctp
! orvixcli: Invalid value 'sctp' for --upper-layer-protocol: it must be one of any, tcp, udp, icmp6. Did you mean 'tcp'?
! Run 'orvixcli network ip ipsec sp add --help' for its options.
[2]

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -w both
! orvixcli: Invalid value 'both' for --flow-direction: it must be one of in, out
! Run 'orvixcli network ip ipsec sp add --help' for its options.
[2]

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -m beet
! orvixcli: Invalid value 'beet' for --sp-mode: it must be one of transport, tunnel
! Run 'orvixcli network ip ipsec sp add --help' for its options.
[2]

## The library's refusals: a name in use, an SA it does not have.
$ orvixcli network ip ipsec sp add -n sp-lab -s any -d any -p 0 -P 0
! SP sp-lab already exists
[1]

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -a sa-none
! SA sa-none for SP sp-bad does not exist
[1]

$ orvixcli network ip ipsec sp list --formatter=simple
   Name: sp-web-out
   Source Address: 2001:db8:10::21/128
   Source Port: 0
   Destination Address: 2001:db8:10::80/128
   Destination Port: 443
   Protocol: tcp
   Flow: out
   Action: ipsec
   Mode: transport
   SA Name: sa-web-out

   Name: sp-web-in
   Source Address: 2001:db8:10::80/128
   Source Port: 443
   Destination Address: 2001:db8:10::21/128
   Destination Port: 0
   Protocol: tcp
   Flow: in
   Action: ipsec
   Mode: transport
   SA Name: sa-web-in

   Name: sp-lab
   Source Address: 2001:db8:20::/64
   Source Port: 0
   Destination Address: 2001:db8:20::/64
   Destination Port: 0
   Protocol: any
   Flow: out
   Action: ipsec
   Mode: tunnel
   SA Name: 

   Name: sp-no-telnet
   Source Address: ::/0
   Source Port: 0
   Destination Address: ::/0
   Destination Port: 23
   Protocol: tcp
   Flow: in
   Action: discard
   Mode: any
   SA Name: 

   Name: sp-any
   Source Address: ::/0
   Source Port: 0
   Destination Address: 2001:db8:30::/48
   Destination Port: 65535
   Protocol: udp
   Flow: in
   Action: ipsec
   Mode: tunnel
   SA Name: sa-lab

   Name: sp-drop
   Source Address: 2001:db8:40::/64
   Source Port: 1024
   Destination Address: ::/0
   Destination Port: 0
   Protocol: any
   Flow: out
   Action: discard
   Mode: any
   SA Name: 

   Name: sp-plain
   Source Address: 2001:db8:50::1/128
   Source Port: 80
   Destination Address: 2001:db8:50::2/128
   Destination Port: 8080
   Protocol: icmp6
   Flow: out
   Action: none
   Mode: any
   SA Name: 

   Name: sp-transport
   Source Address: 2001:db8:60::/64
   Source Port: 22
   Destination Address: 2001:db8:61::/64
   Destination Port: 0
   Protocol: tcp
   Flow: out
   Action: ipsec
   Mode: transport
   SA Name: sa-web-out

   Name: sp-in-any
   Source Address: ::/0
   Source Port: 0
   Destination Address: ::/0
   Destination Port: 0
   Protocol: any
   Flow: in
   Action: ipsec
   Mode: any
   SA Name: 

   Name: sp-defaults
   Source Address: ::/0
   Source Port: 0
   Destination Address: ::/0
   Destination Port: 0
   Protocol: any
   Flow: out
   Action: ipsec
   Mode: any
   SA Name: 
