## The library's failures reach the user as the library's own message,
## with nothing else printed.
$ orvix-hostsim fault add NetworkInfoImpl::IsPldIpv6Enabled --message "Unable to query the IPv6 state: sysinfo busy" --count 1
1

$ orvixcli network ip get --formatter=json
! Unable to query the IPv6 state: sysinfo busy
[1]

## The fault was injected for one call only.
$ orvixcli network ip get
   IPv6 Enabled: true

$ orvix-hostsim fault add NetworkInfoImpl::SetPldIpv6Enabled --message "Unable to set IPv6: permission denied"
2

$ orvixcli network ip set --ipv6-enabled=false
! Unable to set IPv6: permission denied
[1]

## A failed change changes nothing.
$ orvixcli network ip get
   IPv6 Enabled: true

## Without the option the library is not asked, so nothing fails.
$ orvixcli network ip set
