## network nic up and down change the administrative state, which the next
## process sees; a NIC down has link status Down even with a link partner.
@profile fixtures/nic/inventory.json
$ orvixcli network nic down -n hwnic0

$ orvixcli network nic list

$ orvixcli network nic up --nic-name=hwnic2

$ orvixcli network nic up -n hwnic0 --formatter=json

$ orvixcli network nic list --formatter=csv

$ orvixcli network nic down -n hwnic9

$ orvixcli network nic up -n hwnic9

## network nic set: without any option there is nothing to change.
$ orvixcli network nic set -n hwnic0

## Speed and duplex go together, and this is checked before the NIC is
## looked up, so a wrong name still gets the speed and duplex message.
$ orvixcli network nic set -n hwnic9 --speed 1000

$ orvixcli network nic set -n hwnic0 --duplex full

$ orvixcli network nic set -n hwnic9 --speed 1000 --duplex full --auto

$ orvixcli network nic set -n hwnic9 --auto

## The port hwnic0 is already on is no change, alone; with a speed and a
## duplex only the link changes.
$ orvixcli network nic set -n hwnic0 --port tp

$ orvixcli network nic set -n hwnic0 --port tp --speed 100 --duplex full

$ orvixcli network nic list --formatter=json

## --auto alone turns autonegotiation back on even though no generic option
## changed.
$ orvixcli network nic set -n hwnic0 --auto

$ orvixcli network nic get -n hwnic0

## A PHY address of -1 keeps the current one; 0 and other negative values are
## refused before anything is written.
$ orvixcli network nic set -n hwnic0 --phy-address -1

$ orvixcli network nic set -n hwnic0 --phy-address 0

$ orvixcli network nic set -n hwnic0 --phy-address -7 --port mii

## A value too large for the NIC's field reaches the library whole and is
## refused there, rather than wrapped onto a small one.
$ orvixcli network nic set -n hwnic0 --phy-address 4294967297

$ orvixcli network nic set -n hwnic0 --message-level 4294967296

$ orvixcli network nic set -n hwnic0 --message-level -1

## Nothing of the refused changes was written.
$ orvixcli network nic get -n hwnic0 --formatter=json

## Wake-on letters replace the NIC's modes in the order typed, and always
## count as a change; `d` passes the option's pattern but is no mode.
$ orvixcli network nic set -n hwnic0 --wake-on-lan pg

$ orvixcli network nic set -n hwnic0 -w pg

$ orvixcli network nic set -n hwnic0 --wake-on-lan pgd

$ orvixcli network nic set -n hwnic0 --wake-on-lan x

$ orvixcli network nic set -n hwnic1 --wake-on-lan p

$ orvixcli network nic set -n hwnic1 --message-level 3

## Every generic option at once, visible to the next process.
$ orvixcli network nic set -n hwnic0 -p mii -P 5 -V vaddr-9 -t external -l 65535 -w bums

$ orvixcli network nic get -n hwnic0

## An unknown name, once the options are consistent.
$ orvixcli network nic set -n hwnic9 --port tp
