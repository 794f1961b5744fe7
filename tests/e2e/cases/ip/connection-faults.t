## The library's failures in connection list come behind the command's own
## sentence, on a line of their own.
$ orvix-hostsim fault add NetworkInfoImpl::GetCurrentUdpPalladConnections --key defaultTcpipStack --message "UDP table of defaultTcpipStack is busy" --count 1
1

$ orvixcli network ip connection list
! Unable to get connection list.
! UDP table of defaultTcpipStack is busy
[1]

## The TCP table alone does not reach the UDP fault; the next list does not
## fail again.
$ orvixcli network ip connection list -t tcp -N migrix
Proto  Recv Q  Send Q  Local Address      Foreign Address     State        World ID  CC Algo  World Name
-----  ------  ------  -----------------  ------------------  -----------  --------  -------  ----------
tcp    0       0       203.0.113.21:8000  0.0.0.0:0           LISTEN       1000024   cubic    migrate-rx
tcp    0       65160   203.0.113.21:8000  203.0.113.22:40112  ESTABLISHED  1000024   cubic    migrate-rx
tcp    0       0       203.0.113.21:8000  203.0.113.23:40400  TIME_WAIT    0         cubic

$ orvixcli network ip connection list -t udp --formatter=json
[
  {
    "Proto": "udp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "0.0.0.0:123",
    "Foreign Address": "0.0.0.0:0",
    "State": "CLOSED",
    "World ID": 1000015,
    "CC Algo": "",
    "World Name": "ntpd"
  },
  {
    "Proto": "udp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "2001:db8:10::21:500",
    "Foreign Address": ":::0",
    "State": "CLOSED",
    "World ID": 1000018,
    "CC Algo": "",
    "World Name": "iked"
  },
  {
    "Proto": "udp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "2001:db8:10::21:4500",
    "Foreign Address": ":::0",
    "State": "CLOSED",
    "World ID": 1000018,
    "CC Algo": "",
    "World Name": "iked"
  },
  {
    "Proto": "udp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:123",
    "Foreign Address": "192.0.2.123:123",
    "State": "CLOSED",
    "World ID": 1000015,
    "CC Algo": "",
    "World Name": "ntpd"
  },
  {
    "Proto": "udp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "0.0.0.0:68",
    "Foreign Address": "0.0.0.0:0",
    "State": "CLOSED",
    "World ID": 1000010,
    "CC Algo": "",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "udp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": ":::546",
    "Foreign Address": ":::0",
    "State": "CLOSED",
    "World ID": 1000010,
    "CC Algo": "",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "udp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:514",
    "Foreign Address": "192.0.2.53:514",
    "State": "CLOSED",
    "World ID": 1000010,
    "CC Algo": "",
    "World Name": "orvix-agent"
  },
  {
    "Proto": "udp",
    "Recv Q": 0,
    "Send Q": 0,
    "Local Address": "192.0.2.21:53001",
    "Foreign Address": "192.0.2.53:53",
    "State": "CLOSED",
    "World ID": 1049777,
    "CC Algo": "",
    "World Name": "orvm:db01"
  }
]

$ orvix-hostsim fault add ResourceInfoImpl::GetWorldName --key 1000021 --message "World table is being rebuilt" --count 1
2

$ orvixcli network ip connection list -t ip
! Unable to get connection list.
! World table is being rebuilt
[1]

$ orvixcli network ip connection list -t ip
Proto  Recv Q  Send Q  Local Address  Foreign Address  State   World ID  CC Algo  World Name
-----  ------  ------  -------------  ---------------  ------  --------  -------  ----------
ip     0       0       0.0.0.0:0      0.0.0.0:0        CLOSED  1000021            hamon
ip     0       0       :::0           :::0             CLOSED  1000021            hamon
ip     256     0       192.0.2.21:0   0.0.0.0:0        CLOSED  1000018            iked
