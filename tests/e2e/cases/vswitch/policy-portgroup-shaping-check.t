## A port group that shapes needs each value on itself or on its switch; a
## switch that never stored a value does not lend one.
@profile fixtures/vswitch/policy-bare-shaping.json

$ orvixcli network vswitch standard portgroup policy shaping set -p Bare --enabled=true
! Missing required parameter --avg-bandwidth
! Missing required parameter --peak-bandwidth
! Missing required parameter --burst-size
! Unable to set shaping policy. A Peak BPS value must be set on either this port group or on the parent virtual switch.
! Unable to set shaping policy. An Average BPS value must be set on either this port group or on the parent virtual switch.
! Unable to set shaping policy. A Burst Size value must be set on either this port group or on the parent virtual switch.
[1]

## Half shapes with its own peak only; a new average still leaves the burst
## size missing, so nothing is written.
$ orvixcli network vswitch standard portgroup policy shaping set -p Half --avg-bandwidth=7
! Unable to set shaping policy. A Burst Size value must be set on either this port group or on the parent virtual switch.
[1]

$ orvixcli network vswitch standard portgroup policy shaping get -p Half --formatter=keyvalue
PortGroupTrafficShapingPolicy.Enabled=true
PortGroupTrafficShapingPolicy.Average Bandwidth=100000
PortGroupTrafficShapingPolicy.Peak Bandwidth=5
PortGroupTrafficShapingPolicy.Burst Size=819200
PortGroupTrafficShapingPolicy.Override Vswitch Enabled=true
PortGroupTrafficShapingPolicy.Override Vswitch Average Bandwidth=false
PortGroupTrafficShapingPolicy.Override Vswitch Peak Bandwidth=true
PortGroupTrafficShapingPolicy.Override Vswitch Burst Size=false

## Once the switch stores its values (even with shaping off), they count.
$ orvixcli network vswitch standard policy shaping set -v vSwitch0 --enabled=true --avg-bandwidth=100 --peak-bandwidth=200 --burst-size=300

$ orvixcli network vswitch standard policy shaping set -v vSwitch0 --enabled=false

$ orvixcli network vswitch standard portgroup policy shaping set -p Half --avg-bandwidth=7

$ orvixcli network vswitch standard portgroup policy shaping get -p Half
   Enabled: true
   Average Bandwidth: 7 Kbps
   Peak Bandwidth: 5 Kbps
   Burst Size: 300 Kib
   Override Vswitch Enabled: true
   Override Vswitch Average Bandwidth: true
   Override Vswitch Peak Bandwidth: true
   Override Vswitch Burst Size: false

$ orvixcli network vswitch standard portgroup policy shaping set -p Bare --enabled=true --avg-bandwidth=1 --peak-bandwidth=2 --burst-size=3

$ orvixcli network vswitch standard portgroup policy shaping get -p Bare --formatter=csv
Enabled,Average Bandwidth,Peak Bandwidth,Burst Size,Override Vswitch Enabled,Override Vswitch Average Bandwidth,Override Vswitch Peak Bandwidth,Override Vswitch Burst Size
true,1,2,3,true,true,true,true
