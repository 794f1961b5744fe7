## Every TCP state word, a state no word names, long IPv6 endpoints shown
## whole, and world names: a virtual machine's in full, a world that ended
## and no world at all as empty.
@profile fixtures/ip/connections.json
$ orvixcli network ip connection list
Proto  Recv Q      Send Q  Local Address                                 Foreign Address                               State        World ID  CC Algo  World Name
-----  ----------  ------  --------------------------------------------  --------------------------------------------  -----------  --------  -------  -----------
tcp    0           0       192.0.2.21:1                                  192.0.2.90:40000                              CLOSED       1000010   newreno  orvix-agent
tcp    0           0       192.0.2.21:2                                  0.0.0.0:0                                     LISTEN       1000010   newreno  orvix-agent
tcp    0           0       192.0.2.21:3                                  192.0.2.90:40003                              SYN_SENT     1000010   newreno  orvix-agent
tcp    4294967295  0       192.0.2.21:4                                  192.0.2.90:40004                              RCVD         1000010   newreno  orvix-agent
tcp    0           65160   192.0.2.21:5                                  192.0.2.90:40005                              ESTABLISHED  1049601   cubic    orvm:web01
tcp    0           0       192.0.2.21:6                                  192.0.2.90:40006                              CLOSE_WAIT   1000010   newreno  orvix-agent
tcp    0           0       192.0.2.21:7                                  192.0.2.90:40007                              FIN_WAIT_1   1000010   newreno  orvix-agent
tcp    0           0       192.0.2.21:8                                  192.0.2.90:40008                              CLOSING      1000010   newreno  orvix-agent
tcp    0           0       192.0.2.21:9                                  192.0.2.90:40009                              LAST_ACK     1000010   newreno  orvix-agent
tcp    0           0       192.0.2.21:10                                 192.0.2.90:40010                              FIN_WAIT_2   1000010   newreno  orvix-agent
tcp    0           0       192.0.2.21:11                                 192.0.2.90:40011                              TIME_WAIT    0         newreno
tcp    0           0       2001:db8:1234:5678:9abc:def0:1234:5678:65000  2001:db8:8765:4321:fedc:ba98:7654:3210:65535               1049602   cubic
udp    0           0       2001:db8:1234:5678:9abc:def0:1234:5678:50000  :::0                                          CLOSED       1049601            orvm:web01

$ orvixcli network ip connection list -t tcp --formatter=json
[
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:1",
    "Foreign Address": "192.0.2.90:40000",
    "State": "CLOSED",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:2",
    "Foreign Address": "0.0.0.0:0",
    "State": "LISTEN",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:3",
    "Foreign Address": "192.0.2.90:40003",
    "State": "SYN_SENT",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 4294967295,
    "Send Q": 0,
    "Local Address": "192.0.2.21:4",
    "Foreign Address": "192.0.2.90:40004",
    "State": "RCVD",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 65160,
    "Local Address": "192.0.2.21:5",
    "Foreign Address": "192.0.2.90:40005",
    "State": "ESTABLISHED",
    "World ID": 1049601,
    "CC Algo": "cubic",
    "World Name": "orvm:web01"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:6",
    "Foreign Address": "192.0.2.90:40006",
    "State": "CLOSE_WAIT",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:7",
    "Foreign Address": "192.0.2.90:40007",
    "State": "FIN_WAIT_1",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:8",
    "Foreign Address": "192.0.2.90:40008",
    "State": "CLOSING",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:9",
    "Foreign Address": "192.0.2.90:40009",
    "State": "LAST_ACK",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:10",
    "Foreign Address": "192.0.2.90:40010",
    "State": "FIN_WAIT_2",
    "World ID": 1000010,
    "CC Algo": "newreno",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:11",
    "Foreign Address": "192.0.2.90:40011",
    "State": "TIME_WAIT",
    "World ID": 0,
    "CC Algo": "newreno",
    "World Name": ""
  },
  {
    "Proto": "tcp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "2001:db8:1234:5678:9abc:def0:1234:5678:65000",
    "Foreign Address": "2001:db8:8765:4321:fedc:ba98:7654:3210:65535",
    "State": "",
    "World ID": 1049602,
    "CC Algo": "cubic",
    "World Name": ""
  }
]

$ orvixcli network ip connection list -t udp --formatter=simple
   Proto: udp
   Recv Q: 0
   Send Q: 0
   Local Address: 2001:db8:1234:5678:9abc:def0:1234:5678:50000
   Foreign Address: :::0
   State: CLOSED
   World ID: 1049601
   CC Algo: 
   World Name: orvm:web01
