## network ip interface add: the connection point, the options' checks in
## their order, the library's refusals, and interfaces that are made.
@profile fixtures/ip/interface-points.json

## A port group, or a distributed switch together with a port on it: every
## other choice is refused with one message and adds nothing.
$ orvixcli network ip interface add

$ orvixcli network ip interface add --dvs-name dvSwitch1

$ orvixcli network ip interface add --dvport-id 6

$ orvixcli network ip interface add -p Spare -P 6

$ orvixcli network ip interface add -p Spare -s dvSwitch1

$ orvixcli network ip interface add -p Spare -s dvSwitch1 -P 6

## The connection point is checked before the MAC address, and the MAC
## address before the port group or switch is looked up.
$ orvixcli network ip interface add -s dvSwitch1 -M nonsense

$ orvixcli network ip interface add -p NoSuchGroup --mac-address 02:a1:01:00:00

$ orvixcli network ip interface add -s dvSwitch9 -P 6 -M 02-a1-01-00-00-zz

## Points the host does not have.
$ orvixcli network ip interface add -p NoSuchGroup

$ orvixcli network ip interface add -p "management network"

$ orvixcli network ip interface add -s dvSwitch9 -P 6

$ orvixcli network ip interface add -s dvSwitch1 -P 99

## Names are pld0 to pld255, without leading zeros; the MTU is 1280 to 9000.
$ orvixcli network ip interface add -p Spare -i pld256

$ orvixcli network ip interface add -p Spare -i pld01

$ orvixcli network ip interface add -p Spare -i PLD1

$ orvixcli network ip interface add -p Spare --mtu 1279

$ orvixcli network ip interface add -p Spare --mtu 9001

## What the library refuses.
$ orvixcli network ip interface add -p Spare -i pld0

$ orvixcli network ip interface add -p "Management Network"

$ orvixcli network ip interface add -s dvSwitch1 -P 5

$ orvixcli network ip interface add -p Spare -M 02:A1:01:00:00:01

$ orvixcli network ip interface add -p Spare -M 03:a1:01:00:00:09

$ orvixcli network ip interface add -p Spare -N noSuchStack

## None of it added anything.
$ orvixcli network ip interface list --formatter=csv

## A named interface on a port group, with its MTU and MAC address, and one
## on a DV port that already had a connection: it keeps the port's
## connection id. Without a name the host picks the lowest free one.
$ orvixcli network ip interface add -p Spare -i pld255 --mtu 9000 -M 02:a1:01:00:00:ff

$ orvixcli network ip interface add -s dvSwitch1 -P 6

$ orvixcli network ip interface list --formatter=json

## The new interfaces are on the default netstack and carry no tag.
$ orvixcli network ip interface tag get -i pld255

$ orvixcli network ip interface tag get -i pld6 --formatter=json

## pld0 can be made again once it is gone.
$ orvixcli network ip interface remove -i pld0

$ orvixcli network ip interface add -p Spare -i pld0

$ orvixcli network ip interface list --formatter=csv

$ orvixcli network ip interface add --help
