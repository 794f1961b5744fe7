## network vswitch standard policy failover get / set: the adapters' roles
## as the uplink options rebuild the order, the words shown for the settings,
## and the mistakes that leave the policy as it was.
@profile fixtures/vswitch/policy-teams.json

## vSwitch0 orders hwnic0 (active), hwnic1, hwnic2 (standby); hwnic3 is an
## uplink in no list.
$ orvixcli network vswitch standard policy failover get --vswitch-name=vSwitch0 --formatter=json
{
  "Load Balancing": "srcport",
  "Network Failure Detection": "link",
  "Notify Switches": true,
  "Failback": true,
  "Active Adapters": [
    "hwnic0"
  ],
  "Standby Adapters": [
    "hwnic1",
    "hwnic2"
  ],
  "Unused Adapters": [
    "hwnic3"
  ]
}

## A count larger than the order makes every ordered uplink active.
$ orvixcli network vswitch standard policy failover get -v vSwitch1
   Load Balancing: iphash
   Network Failure Detection: beacon
   Notify Switches: false
   Failback: false
   Active Adapters: hwnic4, hwnic5
   Standby Adapters: 
   Unused Adapters: 

## The load-balancing word "mac" is shown as "srcmac", "portid" as "srcport".
$ orvixcli network vswitch standard policy failover set -v vSwitch0 --load-balancing=mac --failure-detection=beacon --notify-switches=false --failback=false

$ orvixcli network vswitch standard policy failover get -v vSwitch0 --formatter=keyvalue
VirtualSwitchFailoverPolicy.Load Balancing=srcmac
VirtualSwitchFailoverPolicy.Network Failure Detection=beacon
VirtualSwitchFailoverPolicy.Notify Switches=false
VirtualSwitchFailoverPolicy.Failback=false
VirtualSwitchFailoverPolicy.Active Adapters[0]=hwnic0
VirtualSwitchFailoverPolicy.Standby Adapters[0]=hwnic1
VirtualSwitchFailoverPolicy.Standby Adapters[1]=hwnic2
VirtualSwitchFailoverPolicy.Unused Adapters[0]=hwnic3

$ orvixcli network vswitch standard policy failover set -v vSwitch0 -l portid -f link -n true -b true

$ orvixcli network vswitch standard policy failover get -v vSwitch0
   Load Balancing: srcport
   Network Failure Detection: link
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic0
   Standby Adapters: hwnic1, hwnic2
   Unused Adapters: hwnic3

$ orvixcli network vswitch standard policy failover set -v vSwitch0 -l iphash

$ orvixcli network vswitch standard policy failover get -v vSwitch0 --formatter=keyvalue
VirtualSwitchFailoverPolicy.Load Balancing=iphash
VirtualSwitchFailoverPolicy.Network Failure Detection=link
VirtualSwitchFailoverPolicy.Notify Switches=true
VirtualSwitchFailoverPolicy.Failback=true
VirtualSwitchFailoverPolicy.Active Adapters[0]=hwnic0
VirtualSwitchFailoverPolicy.Standby Adapters[0]=hwnic1
VirtualSwitchFailoverPolicy.Standby Adapters[1]=hwnic2
VirtualSwitchFailoverPolicy.Unused Adapters[0]=hwnic3

$ orvixcli network vswitch standard policy failover set -v vSwitch0 -l explicit

## Active uplinks alone: the old standby adapters stay behind them, a name
## after a trailing comma does not exist.
$ orvixcli network vswitch standard policy failover set -v vSwitch0 --active-uplinks=hwnic1,

$ orvixcli network vswitch standard policy failover get -v vSwitch0
   Load Balancing: explicit
   Network Failure Detection: link
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic1
   Standby Adapters: hwnic2
   Unused Adapters: hwnic0, hwnic3

## Standby uplinks alone: the old active adapters not named stay active, the
## old standby adapters become unused.
$ orvixcli network vswitch standard policy failover set -v vSwitch0 --standby-uplinks=hwnic3,hwnic0

$ orvixcli network vswitch standard policy failover get -v vSwitch0
   Load Balancing: explicit
   Network Failure Detection: link
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic1
   Standby Adapters: hwnic3, hwnic0
   Unused Adapters: hwnic2

$ orvixcli network vswitch standard policy failover set -v vSwitch0 --standby-uplinks=hwnic1

$ orvixcli network vswitch standard policy failover get -v vSwitch0 --formatter=keyvalue
VirtualSwitchFailoverPolicy.Load Balancing=explicit
VirtualSwitchFailoverPolicy.Network Failure Detection=link
VirtualSwitchFailoverPolicy.Notify Switches=true
VirtualSwitchFailoverPolicy.Failback=true
VirtualSwitchFailoverPolicy.Active Adapters=
VirtualSwitchFailoverPolicy.Standby Adapters[0]=hwnic1
VirtualSwitchFailoverPolicy.Unused Adapters[0]=hwnic0
VirtualSwitchFailoverPolicy.Unused Adapters[1]=hwnic2
VirtualSwitchFailoverPolicy.Unused Adapters[2]=hwnic3

## Both lists make the whole order.
$ orvixcli network vswitch standard policy failover set -v vSwitch0 -a hwnic2,hwnic0 -s hwnic1

$ orvixcli network vswitch standard policy failover get -v vSwitch0
   Load Balancing: explicit
   Network Failure Detection: link
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic2, hwnic0
   Standby Adapters: hwnic1
   Unused Adapters: hwnic3

## Standby uplinks alone on a switch whose count is larger than its order:
## the named adapter really becomes standby.
$ orvixcli network vswitch standard policy failover set -v vSwitch1 --standby-uplinks=hwnic5

$ orvixcli network vswitch standard policy failover get -v vSwitch1
   Load Balancing: iphash
   Network Failure Detection: beacon
   Notify Switches: false
   Failback: false
   Active Adapters: hwnic4
   Standby Adapters: hwnic5
   Unused Adapters: 

## Every bad name is reported, the good ones are not written either, and the
## result is still true (shown by json).
$ orvixcli network vswitch standard policy failover set -v vSwitch0 --active-uplinks=,hwnic9,hwnic4,hwnic3 --standby-uplinks=hwnic7 --formatter=json
true
! Unknown NIC name in active uplinks : 
! Unknown NIC name in active uplinks : hwnic9
! NIC is not connected to the vswitch : hwnic4
! Unknown NIC name in standby uplinks : hwnic7
[1]

$ orvixcli network vswitch standard policy failover set -v vSwitch0 -a hwnic0,hwnic0 -l mac
! some NICs appear in the input for more than once.
[1]

$ orvixcli network vswitch standard policy failover set -v vSwitch0 -a hwnic3 -s hwnic1,hwnic3
! some NICs appear in the input for more than once.
[1]

$ orvixcli network vswitch standard policy failover get -v vSwitch0
   Load Balancing: explicit
   Network Failure Detection: link
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic2, hwnic0
   Standby Adapters: hwnic1
   Unused Adapters: hwnic3

## Only standard switches are found.
$ orvixcli network vswitch standard policy failover get -v vSwitch9
! Unable to find a legacy virtual switch with the name vSwitch9
[1]

$ orvixcli network vswitch standard policy failover set -v vSwitch9 -l mac --formatter=json
! Unable to find a legacy virtual switch with the name vSwitch9
[1]

## The words are checked before the command runs.
$ orvixcli network vswitch standard policy failover set -v vSwitch0 -l roundrobin
! orvixcli: Invalid value 'roundrobin' for --load-balancing: it must be one of portid, iphash, mac, explicit
! Run 'orvixcli network vswitch standard policy failover set --help' for its options.
[2]
