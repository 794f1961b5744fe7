## network vswitch standard portgroup policy security get / set on the default
## host.

## VM Network overrides only promiscuous mode.
$ orvixcli network vswitch standard portgroup policy security get --portgroup-name="VM Network"
   Allow Promiscuous: true
   Allow MAC Address Change: true
   Allow Forged Transmits: true
   Override Vswitch Allow Promiscuous: true
   Override Vswitch Allow MAC Address Change: false
   Override Vswitch Allow Forged Transmits: false

$ orvixcli network vswitch standard portgroup policy security get -p "Lab Isolated" --formatter=json
{
  "Allow Promiscuous": true,
  "Allow MAC Address Change": false,
  "Allow Forged Transmits": true,
  "Override Vswitch Allow Promiscuous": true,
  "Override Vswitch Allow MAC Address Change": false,
  "Override Vswitch Allow Forged Transmits": true
}

## On the port group command allow-promiscuous is -o (-p names the port group).
$ orvixcli network vswitch standard portgroup policy security set -p "Management Network" -o true -m false

$ orvixcli network vswitch standard portgroup policy security get -p "Management Network"
   Allow Promiscuous: true
   Allow MAC Address Change: false
   Allow Forged Transmits: true
   Override Vswitch Allow Promiscuous: true
   Override Vswitch Allow MAC Address Change: true
   Override Vswitch Allow Forged Transmits: false

## Overriding with the switch's own value is still an override.
$ orvixcli network vswitch standard portgroup policy security set -p "VM Network" --allow-forged-transmits=true --formatter=json
true

$ orvixcli network vswitch standard portgroup policy security get -p "VM Network"
   Allow Promiscuous: true
   Allow MAC Address Change: true
   Allow Forged Transmits: true
   Override Vswitch Allow Promiscuous: true
   Override Vswitch Allow MAC Address Change: false
   Override Vswitch Allow Forged Transmits: true

$ orvixcli network vswitch standard portgroup policy security set -p "VM Network" --use-vswitch

$ orvixcli network vswitch standard portgroup policy security get -p "VM Network" --formatter=keyvalue
PortGroupSecurityPolicy.Allow Promiscuous=false
PortGroupSecurityPolicy.Allow MAC Address Change=true
PortGroupSecurityPolicy.Allow Forged Transmits=true
PortGroupSecurityPolicy.Override Vswitch Allow Promiscuous=false
PortGroupSecurityPolicy.Override Vswitch Allow MAC Address Change=false
PortGroupSecurityPolicy.Override Vswitch Allow Forged Transmits=false

$ orvixcli network vswitch standard portgroup policy security set -p "Lab Isolated" -u -m true

$ orvixcli network vswitch standard portgroup policy security get -p "Lab Isolated"
   Allow Promiscuous: false
   Allow MAC Address Change: true
   Allow Forged Transmits: false
   Override Vswitch Allow Promiscuous: false
   Override Vswitch Allow MAC Address Change: true
   Override Vswitch Allow Forged Transmits: false

$ orvixcli network vswitch standard portgroup policy security get -p Nowhere
! Unable to find a port group with the name Nowhere
[1]

$ orvixcli network vswitch standard portgroup policy security set -p Nowhere -o false
! Unable to find a port group with the name Nowhere
[1]
