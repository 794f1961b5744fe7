## network ip get / set on the default host: the change shows in every
## formatter and lives in the host store, across processes.
$ orvixcli network ip get
   IPv6 Enabled: true

$ orvixcli network ip set --ipv6-enabled=false

$ orvixcli network ip get
   IPv6 Enabled: false

$ orvixcli network ip get --formatter=table
IPv6 Enabled
------------
false

$ orvixcli network ip get --formatter=json
{
  "IPv6 Enabled": false
}

$ orvixcli --formatter xml network ip get
<?xml version="1.0" encoding="UTF-8"?>
<output>
  <structure typeName="IPInfo">
    <field name="IPv6 Enabled"><boolean>false</boolean></field>
  </structure>
</output>

$ orvixcli network ip get --formatter=csv
IPv6 Enabled
false

$ orvixcli network ip get --formatter=keyvalue
IPInfo.IPv6 Enabled=false

## Without the option nothing changes, and the result is still success.
$ orvixcli network ip set

$ orvixcli network ip get
   IPv6 Enabled: false

## Setting the value it already has is passed on as well.
$ orvixcli network ip set -e false

$ orvixcli network ip set -e YES

$ orvixcli network ip get --formatter=keyvalue
IPInfo.IPv6 Enabled=true

## A bad value is refused before anything runs.
$ orvixcli network ip set --ipv6-enabled=maybe
! orvixcli: Invalid value 'maybe' for --ipv6-enabled: expected true or false
! Run 'orvixcli network ip set --help' for its options.
[2]

$ orvixcli network ip set --ipv6-enable=false
! orvixcli: Unknown option --ipv6-enable. Did you mean --ipv6-enabled?
! Run 'orvixcli network ip set --help' for its options.
[2]

$ orvixcli network ip gte
! orvixcli: Unknown command or namespace 'gte' in 'network ip'. Did you mean 'get'?
[2]
