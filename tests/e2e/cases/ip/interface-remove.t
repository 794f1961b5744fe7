## network ip interface remove: by name, by connection point (on a
## netstack), and the ways of naming both or neither.
@profile fixtures/ip/interface-points.json

## A name and a connection point together are refused, whichever point.
$ orvixcli network ip interface remove -i pld3 -p Lab

$ orvixcli network ip interface remove -i pld1 -s dvSwitch1

$ orvixcli network ip interface remove -i pld1 --dvport-id 5

## Neither: the connection point is missing.
$ orvixcli network ip interface remove

$ orvixcli network ip interface remove -N lab

$ orvixcli network ip interface remove -s dvSwitch1

$ orvixcli network ip interface remove -p Lab -s dvSwitch1 -P 5

## Names are checked like those of add.
$ orvixcli network ip interface remove -i pld256

$ orvixcli network ip interface remove -i pld01

$ orvixcli network ip interface remove -i PLD1

## A name the host does not have: the error and a false result.
$ orvixcli network ip interface remove -i pld9

$ orvixcli network ip interface remove -i pld9 --formatter=json

## By name.
$ orvixcli network ip interface remove -i pld3

## By connection point: on the default netstack unless another is given;
## an empty netstack is the default one.
$ orvixcli network ip interface remove -p Migration

$ orvixcli network ip interface remove -p Migration -N migrix

$ orvixcli network ip interface remove -p "Management Network" --netstack ""

$ orvixcli network ip interface remove -s dvSwitch1 -P 5 -N lab

$ orvixcli network ip interface remove -s dvSwitch1 -P 5

## Points the host does not have.
$ orvixcli network ip interface remove -p NoSuchGroup

$ orvixcli network ip interface remove -s dvSwitch9 -P 5

$ orvixcli network ip interface remove -p Spare

$ orvixcli network ip interface list --formatter=csv

## The freed points can be used again.
$ orvixcli network ip interface add -p Migration -N migrix

$ orvixcli network ip interface add -s dvSwitch1 -P 5

$ orvixcli network ip interface list --formatter=csv
