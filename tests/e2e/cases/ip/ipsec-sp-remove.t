## Policies whose unique SA was removed are marked "UNKNOWN*", and the note
## comes once with the list however many there are.
$ orvixcli network ip ipsec sa remove -n sa-web-out

$ orvixcli network ip ipsec sp list
Name          Source Address       Source Port  Destination Address  Destination Port  Protocol  Flow  Action   Mode       SA Name
------------  -------------------  -----------  -------------------  ----------------  --------  ----  -------  ---------  ---------
sp-web-out    2001:db8:10::21/128  0            2001:db8:10::80/128  443               tcp       out   ipsec    transport  UNKNOWN*
sp-web-in     2001:db8:10::80/128  443          2001:db8:10::21/128  0                 tcp       in    ipsec    transport  sa-web-in
sp-lab        2001:db8:20::/64     0            2001:db8:20::/64     0                 any       out   ipsec    tunnel
sp-no-telnet  ::/0                 0            ::/0                 23                tcp       in    discard  any
! *Some SPs with unique but deleted SAs were found. Please remove these SPs as they cannot be used anymore.
[1]

$ orvixcli network ip ipsec sa remove -n sa-web-in

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
    "SA Name": "UNKNOWN*"
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
    "SA Name": "UNKNOWN*"
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
! *Some SPs with unique but deleted SAs were found. Please remove these SPs as they cannot be used anymore.
[1]

## sp remove: by name, or all; both or neither removes nothing and still
## answers true, with a note.
$ orvixcli network ip ipsec sp remove -n sp-web-out

$ orvixcli network ip ipsec sp remove -n sp-web-out
! SP sp-web-out does not exist
[1]

$ orvixcli network ip ipsec sp remove -n sp-lab --remove-all
! You should specify exactly one of : --remove-all, --sp-name
[1]

$ orvixcli network ip ipsec sp remove
! You should specify exactly one of : --remove-all, --sp-name
[1]

$ orvixcli network ip ipsec sp list --formatter=simple
   Name: sp-web-in
   Source Address: 2001:db8:10::80/128
   Source Port: 443
   Destination Address: 2001:db8:10::21/128
   Destination Port: 0
   Protocol: tcp
   Flow: in
   Action: ipsec
   Mode: transport
   SA Name: UNKNOWN*

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
! *Some SPs with unique but deleted SAs were found. Please remove these SPs as they cannot be used anymore.
[1]

$ orvixcli network ip ipsec sp remove --remove-all

$ orvixcli network ip ipsec sp list --formatter=json
[]
