## The library's failures in every DNS command reach the user as its own
## message; a configuration that was not saved is not changed.
$ orvix-hostsim fault add DnsConfigImpl::Load --key defaultTcpipStack --message "Unable to read the resolver configuration" --count 6
1

$ orvixcli network ip dns server list
! Unable to read the resolver configuration
[1]

$ orvixcli network ip dns server add -s 10.0.0.1
! Unable to read the resolver configuration
[1]

$ orvixcli network ip dns server remove -a
! Unable to read the resolver configuration
[1]

$ orvixcli network ip dns search list
! Unable to read the resolver configuration
[1]

$ orvixcli network ip dns search add -d a.example.test
! Unable to read the resolver configuration
[1]

$ orvixcli network ip dns search remove -d example.test
! Unable to read the resolver configuration
[1]

## The key is the netstack: another one is not affected.
$ orvixcli network ip dns server list -N migrix
   DNS Servers: 203.0.113.53

$ orvix-hostsim fault add DnsConfigImpl::SaveConfig --message "Unable to write the resolver configuration" --count 5
2

$ orvixcli network ip dns server add -s 10.0.0.1
! Unable to write the resolver configuration
[1]

$ orvixcli network ip dns server remove -s 192.0.2.53
! Unable to write the resolver configuration
[1]

$ orvixcli network ip dns server remove --all
! Unable to write the resolver configuration
[1]

$ orvixcli network ip dns search add -d a.example.test
! Unable to write the resolver configuration
[1]

$ orvixcli network ip dns search remove -d example.test
! Unable to write the resolver configuration
[1]

$ orvixcli network ip dns server list
   DNS Servers: 192.0.2.53, 198.51.100.53, 2001:db8:10::53

$ orvixcli network ip dns search list
   DNS Search Domains: example.test, lab.example.com

## A refused change is not saved: the armed write fault is still there for
## the next change that succeeds.
$ orvix-hostsim fault add DnsConfigImpl::SaveConfig --key migrix --message "Unable to write the resolver configuration of migrix" --count 1
3

$ orvixcli network ip dns server add -s 203.0.113.53 -N migrix
! DNS server 203.0.113.53 is already configured
[1]

$ orvixcli network ip dns search remove -d nothing.example.test -N migrix
! Search domain nothing.example.test is not configured
[1]

$ orvixcli network ip dns search add -d b.example.test -N migrix
! Unable to write the resolver configuration of migrix
[1]

$ orvixcli network ip dns search add -d b.example.test -N migrix

$ orvixcli network ip dns search list -N migrix
   DNS Search Domains: migration.example.test, b.example.test
