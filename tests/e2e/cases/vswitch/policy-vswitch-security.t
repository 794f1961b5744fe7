## network vswitch standard policy security get / set on the default host.
$ orvixcli network vswitch standard policy security get --vswitch-name=vSwitch0
   Allow Promiscuous: false
   Allow MAC Address Change: true
   Allow Forged Transmits: true

$ orvixcli network vswitch standard policy security get -v vSwitch1 --formatter=json
{
  "Allow Promiscuous": false,
  "Allow MAC Address Change": false,
  "Allow Forged Transmits": false
}

## On the switch command allow-promiscuous is -p; each flag given is set,
## the others are kept.
$ orvixcli network vswitch standard policy security set -v vSwitch0 -p true -f false

$ orvixcli network vswitch standard policy security get -v vSwitch0
   Allow Promiscuous: true
   Allow MAC Address Change: true
   Allow Forged Transmits: false

$ orvixcli network vswitch standard policy security set -v vSwitch0 --allow-mac-change=false --formatter=json
true

$ orvixcli network vswitch standard policy security get -v vSwitch0 --formatter=keyvalue
VirtualSwitchSecurityPolicy.Allow Promiscuous=true
VirtualSwitchSecurityPolicy.Allow MAC Address Change=false
VirtualSwitchSecurityPolicy.Allow Forged Transmits=false

## No option writes the policy back unchanged.
$ orvixcli network vswitch standard policy security set -v vSwitch1

$ orvixcli network vswitch standard policy security get -v vSwitch1
   Allow Promiscuous: false
   Allow MAC Address Change: false
   Allow Forged Transmits: false

## A port group inherits what its switch allows unless it overrides it.
$ orvixcli network vswitch standard portgroup policy security get -p "Management Network"
   Allow Promiscuous: true
   Allow MAC Address Change: false
   Allow Forged Transmits: false
   Override Vswitch Allow Promiscuous: false
   Override Vswitch Allow MAC Address Change: false
   Override Vswitch Allow Forged Transmits: false

## A distributed switch is not a legacy one.
$ orvixcli network vswitch standard policy security set -v dvSwitch0 -p true
! Unable to find a legacy virtual switch with the name dvSwitch0
[1]

$ orvixcli network vswitch standard policy security get -v dvSwitch0
! Unable to find a legacy virtual switch with the name dvSwitch0
[1]
