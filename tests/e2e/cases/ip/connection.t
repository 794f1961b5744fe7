## network ip connection list on the default host: TCP, then UDP, then raw
## IP endpoints, each with the world that owns it.
$ orvixcli network ip connection list
Proto  Recv Q  Send Q  Local Address                    Foreign Address                               State        World ID  CC Algo  World Name
-----  ------  ------  -------------------------------  --------------------------------------------  -----------  --------  -------  -----------
tcp    0       0       0.0.0.0:22                       0.0.0.0:0                                     LISTEN       1000012   newreno  sshd
tcp    0       36      192.0.2.21:22                    198.51.100.77:51544                           ESTABLISHED  1000012   newreno  sshd
tcp    0       0       0.0.0.0:443                      0.0.0.0:0                                     LISTEN       1000010   newreno  orvix-agent
tcp    0       0       :::443                           :::0                                          LISTEN       1000010   newreno  orvix-agent
tcp    517     0       192.0.2.21:443                   192.0.2.200:60222                             ESTABLISHED  1000010   cubic    orvix-agent
tcp    0       0       2001:db8:10::21:443              2001:db8:10::200:61870                        ESTABLISHED  1000010   cubic    orvix-agent
tcp    0       0       192.0.2.21:443                   192.0.2.201:60888                             TIME_WAIT    0         newreno
tcp    0       0       198.51.100.21:20049              198.51.100.9:2049                             ESTABLISHED  1000010   newreno  orvix-agent
tcp    0       1448    192.0.2.21:443                   203.0.113.50:50111                            SYN_SENT     1000010   newreno  orvix-agent
tcp    0       0       192.0.2.21:22                    203.0.113.60:40022                            RCVD         1000012   newreno  sshd
tcp    12      0       192.0.2.21:443                   192.0.2.202:60301                             CLOSE_WAIT   1000010   cubic    orvix-agent
tcp    0       517     192.0.2.21:443                   192.0.2.203:60302                             FIN_WAIT_1   1000010   cubic    orvix-agent
tcp    0       0       192.0.2.21:443                   192.0.2.204:60303                             CLOSING      1000010   newreno  orvix-agent
tcp    0       1       192.0.2.21:443                   192.0.2.205:60304                             LAST_ACK     1000010   newreno  orvix-agent
tcp    0       0       192.0.2.21:22                    198.51.100.78:51600                           FIN_WAIT_2   1000012   newreno  sshd
tcp    0       0       192.0.2.21:8080                  0.0.0.0:0                                     CLOSED       1000010   newreno  orvix-agent
tcp    0       2896    2001:db8:10:0:a1:1ff:fe00:1:443  2001:db8:4444:5555:6666:7777:8888:9999:61234  ESTABLISHED  1000010   cubic    orvix-agent
tcp    0       0       :::22                            :::0                                          LISTEN       1000012   newreno  sshd
tcp    0       0       2001:db8:10::21:22               2001:db8:10::200:52022                        ESTABLISHED  1000012   newreno  sshd
tcp    0       0       198.51.100.21:20050              198.51.100.9:2049                             TIME_WAIT    0         newreno
tcp    0       0       192.0.2.21:902                   0.0.0.0:0                                     LISTEN       1049601   newreno  orvm:web01
tcp    0       64      192.0.2.21:902                   192.0.2.80:49152                              ESTABLISHED  1049601   newreno  orvm:web01
udp    0       0       0.0.0.0:123                      0.0.0.0:0                                     CLOSED       1000015            ntpd
udp    0       0       2001:db8:10::21:500              :::0                                          CLOSED       1000018            iked
udp    0       0       2001:db8:10::21:4500             :::0                                          CLOSED       1000018            iked
udp    0       0       192.0.2.21:123                   192.0.2.123:123                               CLOSED       1000015            ntpd
udp    0       0       0.0.0.0:68                       0.0.0.0:0                                     CLOSED       1000010            orvix-agent
udp    0       0       :::546                           :::0                                          CLOSED       1000010            orvix-agent
udp    0       0       192.0.2.21:514                   192.0.2.53:514                                CLOSED       1000010            orvix-agent
udp    0       0       192.0.2.21:53001                 192.0.2.53:53                                 CLOSED       1049777            orvm:db01
ip     0       0       0.0.0.0:0                        0.0.0.0:0                                     CLOSED       1000021            hamon
ip     0       0       :::0                             :::0                                          CLOSED       1000021            hamon
ip     256     0       192.0.2.21:0                     0.0.0.0:0                                     CLOSED       1000018            iked

## One protocol; all of them by name; another netstack.
$ orvixcli network ip connection list --type udp
Proto  Recv Q  Send Q  Local Address         Foreign Address  State   World ID  CC Algo  World Name
-----  ------  ------  --------------------  ---------------  ------  --------  -------  -----------
udp    0       0       0.0.0.0:123           0.0.0.0:0        CLOSED  1000015            ntpd
udp    0       0       2001:db8:10::21:500   :::0             CLOSED  1000018            iked
udp    0       0       2001:db8:10::21:4500  :::0             CLOSED  1000018            iked
udp    0       0       192.0.2.21:123        192.0.2.123:123  CLOSED  1000015            ntpd
udp    0       0       0.0.0.0:68            0.0.0.0:0        CLOSED  1000010            orvix-agent
udp    0       0       :::546                :::0             CLOSED  1000010            orvix-agent
udp    0       0       192.0.2.21:514        192.0.2.53:514   CLOSED  1000010            orvix-agent
udp    0       0       192.0.2.21:53001      192.0.2.53:53    CLOSED  1049777            orvm:db01

$ orvixcli network ip connection list -t ip --formatter=json
[
  {
    "Proto": "ip",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "0.0.0.0:0",
    "Foreign Address": "0.0.0.0:0",
    "State": "CLOSED",
    "World ID": 1000021,
    "CC Algo": "",
    "World Name": "hamon"
  },
  {
    "Proto": "ip",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": ":::0",
    "Foreign Address": ":::0",
    "State": "CLOSED",
    "World ID": 1000021,
    "CC Algo": "",
    "World Name": "hamon"
  },
  {
    "Proto": "ip",
    "Recv Q": 256,
    "Send Q": 0,
    "Local Address": "192.0.2.21:0",
    "Foreign Address": "0.0.0.0:0",
    "State": "CLOSED",
    "World ID": 1000018,
    "CC Algo": "",
    "World Name": "iked"
  }
]

$ orvixcli network ip connection list -t all -N migrix
Proto  Recv Q  Send Q  Local Address      Foreign Address     State        World ID  CC Algo  World Name
-----  ------  ------  -----------------  ------------------  -----------  --------  -------  ----------
tcp    0       0       203.0.113.21:8000  0.0.0.0:0           LISTEN       1000024   cubic    migrate-rx
tcp    0       65160   203.0.113.21:8000  203.0.113.22:40112  ESTABLISHED  1000024   cubic    migrate-rx
tcp    0       0       203.0.113.21:8000  203.0.113.23:40400  TIME_WAIT    0         cubic
udp    0       0       203.0.113.21:8001  0.0.0.0:0           CLOSED       1000024            migrate-rx
ip     0       0       203.0.113.21:0     0.0.0.0:0           CLOSED       1000021            hamon

$ orvixcli network ip connection list -t tcp -N migrix --formatter=simple
   Proto: tcp
   Recv Q: 0
   Send Q: 0
   Local Address: 203.0.113.21:8000
   Foreign Address: 0.0.0.0:0
   State: LISTEN
   World ID: 1000024
   CC Algo: cubic
   World Name: migrate-rx

   Proto: tcp
   Recv Q: 0
   Send Q: 65160
   Local Address: 203.0.113.21:8000
   Foreign Address: 203.0.113.22:40112
   State: ESTABLISHED
   World ID: 1000024
   CC Algo: cubic
   World Name: migrate-rx

   Proto: tcp
   Recv Q: 0
   Send Q: 0
   Local Address: 203.0.113.21:8000
   Foreign Address: 203.0.113.23:40400
   State: TIME_WAIT
   World ID: 0
   CC Algo: cubic
   World Name: 

## A netstack the host does not have, and a type that is not one of the
## four words.
$ orvixcli network ip connection list -N nosuch
! Unable to get connection list.
! Netstack instance nosuch does not exist
[1]

$ orvixcli network ip connection list -t sctp
! orvixcli: Invalid value 'sctp' for --type: it must be one of ip, tcp, udp, all. Did you mean 'tcp'?
! Run 'orvixcli network ip connection list --help' for its options.
[2]
