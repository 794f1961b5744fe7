## The formatter option needs a name, and never takes a command word for one.
$ orvixcli --formatter= network ip get
! orvixcli: Option --formatter needs a value: one of simple, table, json, xml, csv, keyvalue
[2]
$ orvixcli --formatter network ip get
! orvixcli: Option --formatter needs a value before the command word 'network': one of simple, table, json, xml, csv, keyvalue
[2]
$ orvixcli network --formatter ip get
! orvixcli: Option --formatter needs a value before the command word 'ip': one of simple, table, json, xml, csv, keyvalue
[2]
$ orvixcli --formatter=bogus network ip get
! orvixcli: Unknown formatter 'bogus'. Formatters: simple, table, json, xml, csv, keyvalue.
[2]
$ orvixcli network ip get --formatter jsn
! orvixcli: Unknown formatter 'jsn'. Did you mean 'json'? Formatters: simple, table, json, xml, csv, keyvalue.
[2]

## Unknown short options are suggested by case, like long ones by spelling.
$ orvixcli network ip set -E false
! orvixcli: Unknown option -E. Did you mean -e?
! Run 'orvixcli network ip set --help' for its options.
[2]
$ orvixcli network ip set --ipv6-enable false
! orvixcli: Unknown option --ipv6-enable. Did you mean --ipv6-enabled?
! Run 'orvixcli network ip set --help' for its options.
[2]
$ orvixcli network -H
! orvixcli: Unknown option -H for 'network'. Did you mean -h?
[2]

## A successful change: "true" in the machine formats, nothing for people.
$ orvixcli network ip set -e false
$ orvixcli network ip set -e false --formatter=table
$ orvixcli network ip set -e false --formatter=json
true
$ orvixcli network ip set -e false --formatter=csv
true
$ orvixcli network ip set -e false --formatter=keyvalue
value=true
$ orvixcli network ip set -e false --formatter=xml
<?xml version="1.0" encoding="UTF-8"?>
<output>
  <boolean>true</boolean>
</output>

## keyvalue: a set but empty list keeps its key.
$ orvixcli network vswitch standard list -v vSwitch1 --formatter=keyvalue
VirtualSwitch[0].Name=vSwitch1
VirtualSwitch[0].Class=stdswitch
VirtualSwitch[0].Num Ports=64
VirtualSwitch[0].Used Ports=0
VirtualSwitch[0].Configured Ports=1
VirtualSwitch[0].MTU=9000
VirtualSwitch[0].CDP Status=down
VirtualSwitch[0].Beacon Enabled=false
VirtualSwitch[0].Beacon Interval=1
VirtualSwitch[0].Beacon Threshold=3
VirtualSwitch[0].Beacon Required By=
VirtualSwitch[0].Uplinks=
VirtualSwitch[0].Portgroups[0]=Lab Isolated
