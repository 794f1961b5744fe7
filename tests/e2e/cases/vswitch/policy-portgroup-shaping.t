## network vswitch standard portgroup policy shaping get / set on the default
## host.

## Storage shapes with its own values: 2000000000 and 4000000000 bit/s,
## 209715200 bytes.
$ orvixcli network vswitch standard portgroup policy shaping get --portgroup-name=Storage
   Enabled: true
   Average Bandwidth: 2000000 Kbps
   Peak Bandwidth: 4000000 Kbps
   Burst Size: 1638400 Kib
   Override Vswitch Enabled: true
   Override Vswitch Average Bandwidth: true
   Override Vswitch Peak Bandwidth: true
   Override Vswitch Burst Size: true

## Lab Isolated inherits the shaping of vSwitch1.
$ orvixcli network vswitch standard portgroup policy shaping get -p "Lab Isolated" --formatter=json
{
  "Enabled": true,
  "Average Bandwidth": 500000,
  "Peak Bandwidth": 1000000,
  "Burst Size": 102400,
  "Override Vswitch Enabled": false,
  "Override Vswitch Average Bandwidth": false,
  "Override Vswitch Peak Bandwidth": false,
  "Override Vswitch Burst Size": false
}

$ orvixcli network vswitch standard portgroup policy shaping get -p "Management Network"
   Enabled: false
   Average Bandwidth: -1 Kbps
   Peak Bandwidth: -1 Kbps
   Burst Size: -1 Kib
   Override Vswitch Enabled: false
   Override Vswitch Average Bandwidth: false
   Override Vswitch Peak Bandwidth: false
   Override Vswitch Burst Size: false

$ orvixcli network vswitch standard portgroup policy shaping set -p "Management Network" --enabled=true --peak-bandwidth=2
! Missing required parameter --avg-bandwidth
! Missing required parameter --burst-size
[1]

$ orvixcli network vswitch standard portgroup policy shaping set -p "Management Network" --enabled=true --avg-bandwidth=1 --peak-bandwidth=2 --burst-size=3

$ orvixcli network vswitch standard portgroup policy shaping get -p "Management Network"
   Enabled: true
   Average Bandwidth: 1 Kbps
   Peak Bandwidth: 2 Kbps
   Burst Size: 3 Kib
   Override Vswitch Enabled: true
   Override Vswitch Average Bandwidth: true
   Override Vswitch Peak Bandwidth: true
   Override Vswitch Burst Size: true

## A port group that does not switch shaping on itself takes no values.
$ orvixcli network vswitch standard portgroup policy shaping set -p "Lab Isolated" --avg-bandwidth=10

$ orvixcli network vswitch standard portgroup policy shaping get -p "Lab Isolated"
   Enabled: true
   Average Bandwidth: 500000 Kbps
   Peak Bandwidth: 1000000 Kbps
   Burst Size: 102400 Kib
   Override Vswitch Enabled: false
   Override Vswitch Average Bandwidth: false
   Override Vswitch Peak Bandwidth: false
   Override Vswitch Burst Size: false

## --use-vswitch alone gives everything back to the switch.
$ orvixcli network vswitch standard portgroup policy shaping set -p Storage --use-vswitch

$ orvixcli network vswitch standard portgroup policy shaping get -p Storage --formatter=keyvalue
PortGroupTrafficShapingPolicy.Enabled=false
PortGroupTrafficShapingPolicy.Average Bandwidth=-1
PortGroupTrafficShapingPolicy.Peak Bandwidth=-1
PortGroupTrafficShapingPolicy.Burst Size=-1
PortGroupTrafficShapingPolicy.Override Vswitch Enabled=false
PortGroupTrafficShapingPolicy.Override Vswitch Average Bandwidth=false
PortGroupTrafficShapingPolicy.Override Vswitch Peak Bandwidth=false
PortGroupTrafficShapingPolicy.Override Vswitch Burst Size=false

$ orvixcli network vswitch standard portgroup policy shaping set -p Storage -u -e true -b 100 -k 200 -t 300

$ orvixcli network vswitch standard portgroup policy shaping get -p Storage
   Enabled: true
   Average Bandwidth: 100 Kbps
   Peak Bandwidth: 200 Kbps
   Burst Size: 300 Kib
   Override Vswitch Enabled: true
   Override Vswitch Average Bandwidth: true
   Override Vswitch Peak Bandwidth: true
   Override Vswitch Burst Size: true

## A value too large to convert is refused and nothing is written.
$ orvixcli network vswitch standard portgroup policy shaping set -p Storage -b 18446744073709552 -k 250 --formatter=json
true
! Value of --avg-bandwidth is too large
[1]

$ orvixcli network vswitch standard portgroup policy shaping get -p Storage --formatter=keyvalue
PortGroupTrafficShapingPolicy.Enabled=true
PortGroupTrafficShapingPolicy.Average Bandwidth=100
PortGroupTrafficShapingPolicy.Peak Bandwidth=200
PortGroupTrafficShapingPolicy.Burst Size=300
PortGroupTrafficShapingPolicy.Override Vswitch Enabled=true
PortGroupTrafficShapingPolicy.Override Vswitch Average Bandwidth=true
PortGroupTrafficShapingPolicy.Override Vswitch Peak Bandwidth=true
PortGroupTrafficShapingPolicy.Override Vswitch Burst Size=true

$ orvixcli network vswitch standard portgroup policy shaping get -p Nowhere
! Unable to find a port group with the name Nowhere
[1]

$ orvixcli network vswitch standard portgroup policy shaping set -p Nowhere -e false
! Unable to find a port group with the name Nowhere
[1]
