## network vswitch standard portgroup policy failover get / set on the default
## host: the values in force, which of them the port group overrides, and how
## --use-vswitch gives them back to the switch.
$ orvixcli network vswitch standard portgroup policy failover get --portgroup-name="Management Network"
   Load Balancing: srcport
   Network Failure Detection: link
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic0
   Standby Adapters: hwnic1
   Unused Adapters: 
   Override Vswitch Load Balancing: false
   Override Vswitch Network Failure Detection: false
   Override Vswitch Notify Switches: false
   Override Vswitch Failback: false
   Override Vswitch Uplinks: false

## Migration orders only hwnic1 and probes beacons: hwnic0, an uplink of the
## switch, is unused.
$ orvixcli network vswitch standard portgroup policy failover get -p Migration --formatter=json
{
  "Load Balancing": "srcport",
  "Network Failure Detection": "beacon",
  "Notify Switches": true,
  "Failback": true,
  "Active Adapters": [
    "hwnic1"
  ],
  "Standby Adapters": [],
  "Unused Adapters": [
    "hwnic0"
  ],
  "Override Vswitch Load Balancing": false,
  "Override Vswitch Network Failure Detection": true,
  "Override Vswitch Notify Switches": false,
  "Override Vswitch Failback": false,
  "Override Vswitch Uplinks": true
}

$ orvixcli network vswitch standard portgroup policy failover get -p Storage
   Load Balancing: explicit
   Network Failure Detection: link
   Notify Switches: true
   Failback: false
   Active Adapters: hwnic0
   Standby Adapters: hwnic1
   Unused Adapters: 
   Override Vswitch Load Balancing: true
   Override Vswitch Network Failure Detection: false
   Override Vswitch Notify Switches: false
   Override Vswitch Failback: true
   Override Vswitch Uplinks: false

## Each option given becomes an override; active uplinks alone keep the old
## standby adapters of the policy in force unless they were just named.
$ orvixcli network vswitch standard portgroup policy failover set -p "Management Network" --load-balancing=mac --active-uplinks=hwnic1

$ orvixcli network vswitch standard portgroup policy failover get -p "Management Network"
   Load Balancing: srcmac
   Network Failure Detection: link
   Notify Switches: true
   Failback: true
   Active Adapters: hwnic1
   Standby Adapters: 
   Unused Adapters: hwnic0
   Override Vswitch Load Balancing: true
   Override Vswitch Network Failure Detection: false
   Override Vswitch Notify Switches: false
   Override Vswitch Failback: false
   Override Vswitch Uplinks: true

## --use-vswitch alone clears every override; from then on every setting
## follows the switch.
$ orvixcli network vswitch standard portgroup policy failover set -p "Management Network" --use-vswitch

$ orvixcli network vswitch standard policy failover set -v vSwitch0 --load-balancing=iphash --notify-switches=false

$ orvixcli network vswitch standard portgroup policy failover get -p "Management Network"
   Load Balancing: iphash
   Network Failure Detection: link
   Notify Switches: false
   Failback: true
   Active Adapters: hwnic0
   Standby Adapters: hwnic1
   Unused Adapters: 
   Override Vswitch Load Balancing: false
   Override Vswitch Network Failure Detection: false
   Override Vswitch Notify Switches: false
   Override Vswitch Failback: false
   Override Vswitch Uplinks: false

## --use-vswitch with another option first clears, then overrides that one.
$ orvixcli network vswitch standard portgroup policy failover set -p Storage --use-vswitch --failback=false

$ orvixcli network vswitch standard portgroup policy failover get -p Storage
   Load Balancing: iphash
   Network Failure Detection: link
   Notify Switches: false
   Failback: false
   Active Adapters: hwnic0
   Standby Adapters: hwnic1
   Unused Adapters: 
   Override Vswitch Load Balancing: false
   Override Vswitch Network Failure Detection: false
   Override Vswitch Notify Switches: false
   Override Vswitch Failback: true
   Override Vswitch Uplinks: false

## Standby uplinks alone on VM Network (hwnic1 active, hwnic0 standby): the
## named adapter leaves the active part, the old standby one is dropped.
$ orvixcli network vswitch standard portgroup policy failover set -p "VM Network" -s hwnic1 -f beacon

$ orvixcli network vswitch standard portgroup policy failover get -p "VM Network"
   Load Balancing: iphash
   Network Failure Detection: beacon
   Notify Switches: false
   Failback: true
   Active Adapters: 
   Standby Adapters: hwnic1
   Unused Adapters: hwnic0
   Override Vswitch Load Balancing: false
   Override Vswitch Network Failure Detection: true
   Override Vswitch Notify Switches: false
   Override Vswitch Failback: false
   Override Vswitch Uplinks: true

## A NIC of the host that is not an uplink of the port group's switch, and
## one the host does not have, are refused; nothing is written.
$ orvixcli network vswitch standard portgroup policy failover set -p "VM Network" -a hwnic2,hwnic0 -s hwnic8 -l explicit
! NIC is not connected to the vswitch : hwnic2
! Unknown NIC name in standby uplinks : hwnic8
[1]

$ orvixcli network vswitch standard portgroup policy failover set -p "VM Network" -a hwnic0 -s hwnic0 --formatter=json
true
! some NICs appear in the input for more than once.
[1]

$ orvixcli network vswitch standard portgroup policy failover get -p "VM Network" --formatter=keyvalue
PortGroupFailoverPolicy.Load Balancing=iphash
PortGroupFailoverPolicy.Network Failure Detection=beacon
PortGroupFailoverPolicy.Notify Switches=false
PortGroupFailoverPolicy.Failback=true
PortGroupFailoverPolicy.Active Adapters=
PortGroupFailoverPolicy.Standby Adapters[0]=hwnic1
PortGroupFailoverPolicy.Unused Adapters[0]=hwnic0
PortGroupFailoverPolicy.Override Vswitch Load Balancing=false
PortGroupFailoverPolicy.Override Vswitch Network Failure Detection=true
PortGroupFailoverPolicy.Override Vswitch Notify Switches=false
PortGroupFailoverPolicy.Override Vswitch Failback=false
PortGroupFailoverPolicy.Override Vswitch Uplinks=true

$ orvixcli network vswitch standard portgroup policy failover get -p "VM network"
! Unable to find a port group with the name VM network
[1]

$ orvixcli network vswitch standard portgroup policy failover set -p Nowhere --use-vswitch
! Unable to find a port group with the name Nowhere
[1]
