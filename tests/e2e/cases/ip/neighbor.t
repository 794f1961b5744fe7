## network ip neighbor list on the default host: IPv4 entries before IPv6
## entries, each in the host's order; IPv4 entries have no state.
$ orvixcli network ip neighbor list
Neighbor          Mac Address        Pldnic  Expiry    State       Type
----------------  -----------------  ------  --------  ----------  -------
192.0.2.1         02:a1:fe:00:01:01  pld0    1187 sec              Dynamic
192.0.2.53        02:a1:fe:00:01:35  pld0    902 sec               Dynamic
192.0.2.254       02:a1:fe:00:01:fe  pld0    0 sec                 Static
198.51.100.1      02:a1:fe:00:02:01  pld1    1044 sec              Dynamic
192.0.2.21        02:a1:01:00:00:01  pld0    -1 sec                Local
192.0.2.80        02:a1:fe:00:01:50  pld0    1020 sec              Dynamic
192.0.2.90        02:a1:fe:00:01:5a  pld0    347 sec               Dynamic
192.0.2.200       02:a1:fe:00:01:c8  pld0    58 sec                Dynamic
198.51.100.9      02:a1:fe:00:02:09  pld1    0 sec                 Static
198.51.100.21     02:a1:01:00:00:02  pld1    -1 sec                Local
2001:db8:10::1    02:a1:fe:00:01:01  pld0    27 sec    Reachable   Router
2001:db8:10::53   02:a1:fe:00:01:35  pld0    0 sec     Stale       Dynamic
2001:db8:20::1    02:a1:fe:00:02:01  pld1    12 sec    Delay       Router
2001:db8:10::21   02:a1:01:00:00:01  pld0    0 sec     Reachable   Local
2001:db8:10::80   02:a1:fe:00:01:50  pld0    30 sec    Reachable   Dynamic
2001:db8:10::90   00:00:00:00:00:00  pld0    3 sec     Incomplete  Dynamic
2001:db8:10::fe   02:a1:fe:00:01:fe  pld0    5 sec     Probe       Router
2001:db8:10::200  02:a1:fe:00:01:c8  pld0    0 sec     Stale       Dynamic
2001:db8:20::9    02:a1:fe:00:02:09  pld1    0 sec     Reachable   Static
2001:db8:20::21   02:a1:01:00:00:02  pld1    0 sec     Reachable   Local

$ orvixcli network ip neighbor list --formatter=json
[
  {
    "Neighbor": "192.0.2.1",
    "Mac Address": "02:a1:fe:00:01:01",
    "Pldnic": "pld0",
    "Expiry": 1187,
    "State": "",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "192.0.2.53",
    "Mac Address": "02:a1:fe:00:01:35",
    "Pldnic": "pld0",
    "Expiry": 902,
    "State": "",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "192.0.2.254",
    "Mac Address": "02:a1:fe:00:01:fe",
    "Pldnic": "pld0",
    "Expiry": 0,
    "State": "",
    "Type": "Static"
  },
  {
    "Neighbor": "198.51.100.1",
    "Mac Address": "02:a1:fe:00:02:01",
    "Pldnic": "pld1",
    "Expiry": 1044,
    "State": "",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "192.0.2.21",
    "Mac Address": "02:a1:01:00:00:01",
    "Pldnic": "pld0",
    "Expiry": -1,
    "State": "",
    "Type": "Local"
  },
  {
    "Neighbor": "192.0.2.80",
    "Mac Address": "02:a1:fe:00:01:50",
    "Pldnic": "pld0",
    "Expiry": 1020,
    "State": "",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "192.0.2.90",
    "Mac Address": "02:a1:fe:00:01:5a",
    "Pldnic": "pld0",
    "Expiry": 347,
    "State": "",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "192.0.2.200",
    "Mac Address": "02:a1:fe:00:01:c8",
    "Pldnic": "pld0",
    "Expiry": 58,
    "State": "",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "198.51.100.9",
    "Mac Address": "02:a1:fe:00:02:09",
    "Pldnic": "pld1",
    "Expiry": 0,
    "State": "",
    "Type": "Static"
  },
  {
    "Neighbor": "198.51.100.21",
    "Mac Address": "02:a1:01:00:00:02",
    "Pldnic": "pld1",
    "Expiry": -1,
    "State": "",
    "Type": "Local"
  },
  {
    "Neighbor": "2001:db8:10::1",
    "Mac Address": "02:a1:fe:00:01:01",
    "Pldnic": "pld0",
    "Expiry": 27,
    "State": "Reachable",
    "Type": "Router"
  },
  {
    "Neighbor": "2001:db8:10::53",
    "Mac Address": "02:a1:fe:00:01:35",
    "Pldnic": "pld0",
    "Expiry": 0,
    "State": "Stale",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "2001:db8:20::1",
    "Mac Address": "02:a1:fe:00:02:01",
    "Pldnic": "pld1",
    "Expiry": 12,
    "State": "Delay",
    "Type": "Router"
  },
  {
    "Neighbor": "2001:db8:10::21",
    "Mac Address": "02:a1:01:00:00:01",
    "Pldnic": "pld0",
    "Expiry": 0,
    "State": "Reachable",
    "Type": "Local"
  },
  {
    "Neighbor": "2001:db8:10::80",
    "Mac Address": "02:a1:fe:00:01:50",
    "Pldnic": "pld0",
    "Expiry": 30,
    "State": "Reachable",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "2001:db8:10::90",
    "Mac Address": "00:00:00:00:00:00",
    "Pldnic": "pld0",
    "Expiry": 3,
    "State": "Incomplete",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "2001:db8:10::fe",
    "Mac Address": "02:a1:fe:00:01:fe",
    "Pldnic": "pld0",
    "Expiry": 5,
    "State": "Probe",
    "Type": "Router"
  },
  {
    "Neighbor": "2001:db8:10::200",
    "Mac Address": "02:a1:fe:00:01:c8",
    "Pldnic": "pld0",
    "Expiry": 0,
    "State": "Stale",
    "Type": "Dynamic"
  },
  {
    "Neighbor": "2001:db8:20::9",
    "Mac Address": "02:a1:fe:00:02:09",
    "Pldnic": "pld1",
    "Expiry": 0,
    "State": "Reachable",
    "Type": "Static"
  },
  {
    "Neighbor": "2001:db8:20::21",
    "Mac Address": "02:a1:01:00:00:02",
    "Pldnic": "pld1",
    "Expiry": 0,
    "State": "Reachable",
    "Type": "Local"
  }
]

## One family, one interface, another netstack.
$ orvixcli network ip neighbor list -v 4
Neighbor       Mac Address        Pldnic  Expiry    State  Type
-------------  -----------------  ------  --------  -----  -------
192.0.2.1      02:a1:fe:00:01:01  pld0    1187 sec         Dynamic
192.0.2.53     02:a1:fe:00:01:35  pld0    902 sec          Dynamic
192.0.2.254    02:a1:fe:00:01:fe  pld0    0 sec            Static
198.51.100.1   02:a1:fe:00:02:01  pld1    1044 sec         Dynamic
192.0.2.21     02:a1:01:00:00:01  pld0    -1 sec           Local
192.0.2.80     02:a1:fe:00:01:50  pld0    1020 sec         Dynamic
192.0.2.90     02:a1:fe:00:01:5a  pld0    347 sec          Dynamic
192.0.2.200    02:a1:fe:00:01:c8  pld0    58 sec           Dynamic
198.51.100.9   02:a1:fe:00:02:09  pld1    0 sec            Static
198.51.100.21  02:a1:01:00:00:02  pld1    -1 sec           Local

$ orvixcli network ip neighbor list --version 6 -i pld1 --formatter=json
[
  {
    "Neighbor": "2001:db8:20::1",
    "Mac Address": "02:a1:fe:00:02:01",
    "Pldnic": "pld1",
    "Expiry": 12,
    "State": "Delay",
    "Type": "Router"
  },
  {
    "Neighbor": "2001:db8:20::9",
    "Mac Address": "02:a1:fe:00:02:09",
    "Pldnic": "pld1",
    "Expiry": 0,
    "State": "Reachable",
    "Type": "Static"
  },
  {
    "Neighbor": "2001:db8:20::21",
    "Mac Address": "02:a1:01:00:00:02",
    "Pldnic": "pld1",
    "Expiry": 0,
    "State": "Reachable",
    "Type": "Local"
  }
]

$ orvixcli network ip neighbor list -i pld1
Neighbor         Mac Address        Pldnic  Expiry    State      Type
---------------  -----------------  ------  --------  ---------  -------
198.51.100.1     02:a1:fe:00:02:01  pld1    1044 sec             Dynamic
198.51.100.9     02:a1:fe:00:02:09  pld1    0 sec                Static
198.51.100.21    02:a1:01:00:00:02  pld1    -1 sec               Local
2001:db8:20::1   02:a1:fe:00:02:01  pld1    12 sec    Delay      Router
2001:db8:20::9   02:a1:fe:00:02:09  pld1    0 sec     Reachable  Static
2001:db8:20::21  02:a1:01:00:00:02  pld1    0 sec     Reachable  Local

$ orvixcli network ip neighbor list -N migrix --formatter=simple
   Neighbor: 203.0.113.1
   Mac Address: 02:a1:fe:00:03:01
   Pldnic: pld2
   Expiry: 1160 sec
   State: 
   Type: Dynamic

   Neighbor: 203.0.113.22
   Mac Address: 02:a1:01:00:10:03
   Pldnic: pld2
   Expiry: 611 sec
   State: 
   Type: Dynamic

   Neighbor: 2001:db8:30::1
   Mac Address: 02:a1:fe:00:03:01
   Pldnic: pld2
   Expiry: 22 sec
   State: Reachable
   Type: Router

   Neighbor: 2001:db8:30::22
   Mac Address: 02:a1:01:00:10:03
   Pldnic: pld2
   Expiry: 4 sec
   State: Delay
   Type: Dynamic

## An interface the host does not have stops the command before any table
## is read; so does a netstack it does not have, with the library's words.
$ orvixcli network ip neighbor list -i pld9
! Unable to find a Pallad interface with the name pld9
[1]

$ orvixcli network ip neighbor list -N nosuch
! Netstack instance nosuch does not exist
[1]

## The version is one of three words.
$ orvixcli network ip neighbor list -v 5
! orvixcli: Invalid value '5' for --version: it must be one of 4, 6, all. Did you mean '4'?
! Run 'orvixcli network ip neighbor list --help' for its options.
[2]

## With IPv6 off, IPv6 entries are not listed, and asking for them alone
## gives an empty list rather than an error.
$ orvixcli network ip set --ipv6-enabled=false

$ orvixcli network ip neighbor list
Neighbor       Mac Address        Pldnic  Expiry    State  Type
-------------  -----------------  ------  --------  -----  -------
192.0.2.1      02:a1:fe:00:01:01  pld0    1187 sec         Dynamic
192.0.2.53     02:a1:fe:00:01:35  pld0    902 sec          Dynamic
192.0.2.254    02:a1:fe:00:01:fe  pld0    0 sec            Static
198.51.100.1   02:a1:fe:00:02:01  pld1    1044 sec         Dynamic
192.0.2.21     02:a1:01:00:00:01  pld0    -1 sec           Local
192.0.2.80     02:a1:fe:00:01:50  pld0    1020 sec         Dynamic
192.0.2.90     02:a1:fe:00:01:5a  pld0    347 sec          Dynamic
192.0.2.200    02:a1:fe:00:01:c8  pld0    58 sec           Dynamic
198.51.100.9   02:a1:fe:00:02:09  pld1    0 sec            Static
198.51.100.21  02:a1:01:00:00:02  pld1    -1 sec           Local

$ orvixcli network ip neighbor list -v 6 --formatter=json
[]

$ orvixcli network ip neighbor list -v 6
Neighbor  Mac Address  Pldnic  Expiry  State  Type
--------  -----------  ------  ------  -----  ----
