## The default host's firewall: loaded, enabled, dropping by default, with a
## dozen rulesets.
$ orvixcli network firewall get
   Loaded: true
   Enabled: true
   DefaultAction: DROP

$ orvixcli network firewall ruleset list
Name            Enabled
--------------  -------
sshServer       true
sshClient       false
webAccess       true
ntpClient       true
dnsClient       true
dhcpClient      true
liveMigration   true
ikeDaemon       true
snmpServer      true
syslog          false
remoteConsole   true
faultTolerance  false

$ orvixcli network firewall ruleset rule list
Ruleset         Direction  Protocol  Port Type  Port Begin  Port End
--------------  ---------  --------  ---------  ----------  --------
sshServer       Inbound    TCP       Dst        22          22
sshClient       Outbound   TCP       Dst        22          22
webAccess       Inbound    TCP       Dst        443         443
webAccess       Inbound    TCP       Dst        80          80
ntpClient       Outbound   UDP       Dst        123         123
dnsClient       Outbound   UDP       Dst        53          53
dnsClient       Outbound   TCP       Dst        53          53
dnsClient       Inbound    UDP       Src        53          53
dhcpClient      Inbound    UDP       Dst        68          68
dhcpClient      Outbound   UDP       Dst        67          67
dhcpClient      Inbound    UDP       Dst        546         546
dhcpClient      Outbound   UDP       Dst        547         547
liveMigration   Inbound    TCP       Dst        8000        8000
liveMigration   Outbound   TCP       Dst        8000        8000
ikeDaemon       Inbound    UDP       Dst        500         500
ikeDaemon       Inbound    UDP       Dst        4500        4500
ikeDaemon       Outbound   UDP       Dst        500         500
ikeDaemon       Outbound   UDP       Dst        4500        4500
snmpServer      Inbound    UDP       Dst        161         161
snmpServer      Outbound   UDP       Dst        162         162
syslog          Outbound   UDP       Dst        514         514
syslog          Outbound   TCP       Dst        1514        1514
remoteConsole   Inbound    TCP       Dst        5900        5964
faultTolerance  Inbound    TCP       Dst        8300        8300
faultTolerance  Outbound   TCP       Src        8300        8300
faultTolerance  Outbound   UDP       Src        8301        8301
faultTolerance  Inbound    TCP       Src        8100        8200

$ orvixcli network firewall ruleset allowedip list
Ruleset         Allowed IP Addresses
--------------  ---------------------------------------------------------------
sshServer       198.51.100.77, 2001:db8:10::200, 192.0.2.0/24, 2001:db8:10::/64
sshClient       All
webAccess       All
ntpClient       192.0.2.123, 198.51.100.123
dnsClient       All
dhcpClient      All
liveMigration   203.0.113.0/24
ikeDaemon       2001:db8:20::99, 2001:db8:10::/64
snmpServer      203.0.113.161, 198.51.100.0/24, 2001:db8:30::/48
syslog          All
remoteConsole   203.0.113.40, 2001:db8:40::15
faultTolerance
