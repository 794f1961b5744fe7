## network vswitch standard policy shaping get / set: bandwidths are entered
## and shown in Kbps, burst sizes in Kib; the host keeps bits per second and
## bytes.
@profile fixtures/vswitch/policy-teams.json

## The host keeps 1999 bit/s, 2999 bit/s and 255 bytes: shown rounded down.
## With this division known, a value set and read back shows the
## multiplication the set command applies.
$ orvixcli network vswitch standard policy shaping get --vswitch-name=vSwitch0
   Enabled: true
   Average Bandwidth: 1 Kbps
   Peak Bandwidth: 2 Kbps
   Burst Size: 1 Kib

## Shaping off shows -1 for the three values.
$ orvixcli network vswitch standard policy shaping get -v vSwitch1 --formatter=json
{
  "Enabled": false,
  "Average Bandwidth": -1,
  "Peak Bandwidth": -1,
  "Burst Size": -1
}

## Switching shaping on demands all three values; nothing is written.
$ orvixcli network vswitch standard policy shaping set -v vSwitch1 --enabled=true
! Missing required parameter --avg-bandwidth
! Missing required parameter --peak-bandwidth
! Missing required parameter --burst-size
[1]

$ orvixcli network vswitch standard policy shaping set -v vSwitch1 --enabled=true --avg-bandwidth=1000 --formatter=json
true
! Missing required parameter --peak-bandwidth
! Missing required parameter --burst-size
[1]

$ orvixcli network vswitch standard policy shaping get -v vSwitch1
   Enabled: false
   Average Bandwidth: -1 Kbps
   Peak Bandwidth: -1 Kbps
   Burst Size: -1 Kib

## On a switch that does not shape, the values are ignored.
$ orvixcli network vswitch standard policy shaping set -v vSwitch1 --avg-bandwidth=1000

$ orvixcli network vswitch standard policy shaping set -v vSwitch1 -e true -b 1000 -k 2500 -t 3

$ orvixcli network vswitch standard policy shaping get -v vSwitch1
   Enabled: true
   Average Bandwidth: 1000 Kbps
   Peak Bandwidth: 2500 Kbps
   Burst Size: 3 Kib

## An enabled policy takes one value alone.
$ orvixcli network vswitch standard policy shaping set -v vSwitch0 --peak-bandwidth=7

$ orvixcli network vswitch standard policy shaping get -v vSwitch0 --formatter=keyvalue
VirtualSwitchTrafficShapingPolicy.Enabled=true
VirtualSwitchTrafficShapingPolicy.Average Bandwidth=1
VirtualSwitchTrafficShapingPolicy.Peak Bandwidth=7
VirtualSwitchTrafficShapingPolicy.Burst Size=1

## The largest values that still fit the host's 64 bits are kept exactly;
## one more is refused.
$ orvixcli network vswitch standard policy shaping set -v vSwitch0 -b 18446744073709551 -k 18446744073709551 -t 144115188075855871

$ orvixcli network vswitch standard policy shaping get -v vSwitch0
   Enabled: true
   Average Bandwidth: 18446744073709551 Kbps
   Peak Bandwidth: 18446744073709551 Kbps
   Burst Size: 144115188075855871 Kib

$ orvixcli network vswitch standard policy shaping set -v vSwitch0 -b 18446744073709552 -k 9223372036854775807 -t 144115188075855872
! Value of --avg-bandwidth is too large
! Value of --peak-bandwidth is too large
! Value of --burst-size is too large
[1]

$ orvixcli network vswitch standard policy shaping set -v vSwitch0 -b 5 -t 144115188075855872
! Value of --burst-size is too large
[1]

$ orvixcli network vswitch standard policy shaping get -v vSwitch0
   Enabled: true
   Average Bandwidth: 18446744073709551 Kbps
   Peak Bandwidth: 18446744073709551 Kbps
   Burst Size: 144115188075855871 Kib

## Switching shaping off keeps the values, and shows -1.
$ orvixcli network vswitch standard policy shaping set -v vSwitch0 --enabled=false --avg-bandwidth=3

$ orvixcli network vswitch standard policy shaping get -v vSwitch0
   Enabled: false
   Average Bandwidth: -1 Kbps
   Peak Bandwidth: -1 Kbps
   Burst Size: -1 Kib

$ orvixcli network vswitch standard policy shaping set -v vSwitch0 --enabled=true -b 1 -k 1 -t 1

$ orvixcli network vswitch standard policy shaping get -v vSwitch0
   Enabled: true
   Average Bandwidth: 1 Kbps
   Peak Bandwidth: 1 Kbps
   Burst Size: 1 Kib

## Values are at least 1, checked before the command runs.
$ orvixcli network vswitch standard policy shaping set -v vSwitch0 --avg-bandwidth=0
! orvixcli: Value 0 for --avg-bandwidth is out of range: it must be between 1 and 9223372036854775807
! Run 'orvixcli network vswitch standard policy shaping set --help' for its options.
[2]

$ orvixcli network vswitch standard policy shaping set -v vSwitch2 -e false
! Unable to find a legacy virtual switch with the name vSwitch2
[1]
