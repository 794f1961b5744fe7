## network vswitch standard portgroup set: the VLAN ID of a port group.
$ orvixcli network vswitch standard portgroup set --portgroup-name="VM Network" --vlan-id=42

## Both bounds of the range pass.
$ orvixcli network vswitch standard portgroup set -p Storage -v 4095 --formatter=json
true

$ orvixcli network vswitch standard portgroup set -p Migration -v 0

$ orvixcli network vswitch standard portgroup list
Name                Virtual Switch  Active Clients  VLAN ID
------------------  --------------  --------------  -------
Management Network  vSwitch0        1               0
VM Network          vSwitch0        2               42
Storage             vSwitch0        2               4095
Migration           vSwitch0        1               0
Lab Isolated        vSwitch1        0               100

## One beyond either bound is refused before the command runs.
$ orvixcli network vswitch standard portgroup set -p Storage --vlan-id=4096
! orvixcli: Value 4096 for --vlan-id is out of range: it must be between 0 and 4095
! Run 'orvixcli network vswitch standard portgroup set --help' for its options.
[2]

$ orvixcli network vswitch standard portgroup set -p Storage --vlan-id=-1
! orvixcli: Value -1 for --vlan-id is out of range: it must be between 0 and 4095
! Run 'orvixcli network vswitch standard portgroup set --help' for its options.
[2]

## Without --vlan-id the VLAN ID is left as it is (not reset to 0), and the
## result is still true.
$ orvixcli network vswitch standard portgroup set -p "Lab Isolated"

$ orvixcli network vswitch standard portgroup set -p "Lab Isolated" --formatter=json
true

$ orvixcli network vswitch standard portgroup list
Name                Virtual Switch  Active Clients  VLAN ID
------------------  --------------  --------------  -------
Management Network  vSwitch0        1               0
VM Network          vSwitch0        2               42
Storage             vSwitch0        2               4095
Migration           vSwitch0        1               0
Lab Isolated        vSwitch1        0               100

## A port group the host does not have, with or without a VLAN ID.
$ orvixcli network vswitch standard portgroup set -p "VM network" -v 7
! Unable to find a port group with the name VM network
[1]

$ orvixcli network vswitch standard portgroup set -p Nowhere --formatter=json
! Unable to find a port group with the name Nowhere
[1]

$ orvixcli network vswitch standard portgroup set --vlan-id=7
! orvixcli: Missing required option --portgroup-name
! Run 'orvixcli network vswitch standard portgroup set --help' for its options.
[2]

## The help gives the range of VLAN IDs, the same one the option checks.
$ orvixcli network vswitch standard portgroup set --help
Usage: orvixcli network vswitch standard portgroup set [cmd options]

Description:
  Set the vlan id for the given port group

Cmd options:
  -p|--portgroup-name=<str>  (required)
      The name of the port group to set vlan id for.
  -v|--vlan-id=<long>
      The vlan id for this port group. This value is in the range (0 - 4095)
