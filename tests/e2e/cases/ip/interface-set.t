## network ip interface set: the enabled state and the MTU of one interface,
## found by its exact name.
$ orvixcli network ip interface set -i pld0 --enabled false

$ orvixcli network ip interface set -i pld1 -e true --mtu 1280

$ orvixcli network ip interface list --formatter=csv

$ orvixcli network ip interface set -i pld0 -e true -m 9000

$ orvixcli network ip interface list --formatter=json

## Only the name: nothing changes, and the result is still success.
$ orvixcli network ip interface set -i pld0

## A negative MTU is refused before anything changes, the enabled state
## included.
$ orvixcli network ip interface set -i pld0 -e false --mtu -1

## 0 and every other value go to the library whole, which refuses those out
## of range; a value past 32 bits is not cut down to one that fits.
$ orvixcli network ip interface set -i pld0 --mtu 0

$ orvixcli network ip interface set -i pld0 --mtu 1279

$ orvixcli network ip interface set -i pld0 --mtu 9001

$ orvixcli network ip interface set -i pld0 --mtu 4294968796

$ orvixcli network ip interface set -i pld0 --mtu -9223372036854775808

$ orvixcli network ip interface list --formatter=csv

## Names are compared exactly; any text is looked up.
$ orvixcli network ip interface set -i PLD0 -e false

$ orvixcli network ip interface set -i pld9 --mtu 1500

$ orvixcli network ip interface set -i "" -e false

## Options the framework refuses.
$ orvixcli network ip interface set -e false

$ orvixcli network ip interface set -i pld0 --mtu 15x0

$ orvixcli network ip interface set -i pld0 --enabled maybe
