## network nic register dump: sixteen words a row in lowercase hex, each at
## least two digits; the offset counts words. Twenty words give two rows.
@profile fixtures/nic/diag.json
$ orvixcli network nic register dump -n hwnic0

$ orvixcli network nic register dump --hwnic=hwnic0 --formatter=json

## A driver without a register dump, and one whose dump is empty.
$ orvixcli network nic register dump -n hwnic1

$ orvixcli network nic register dump -n hwnic2

$ orvixcli network nic register dump -n hwnic9

## network nic eeprom dump: the whole EEPROM by default, in rows aligned to
## sixteen bytes.
$ orvixcli network nic eeprom dump -n hwnic0

## A range that starts inside a row begins with blank groups; one that
## crosses a row boundary goes on in the next aligned row.
$ orvixcli network nic eeprom dump -n hwnic0 --offset 5 --length 4

$ orvixcli network nic eeprom dump -n hwnic0 --offset 30 --length 4

$ orvixcli network nic eeprom dump -n hwnic0 -o 30 -l 4 --formatter=json

## The library checks the range against the EEPROM.
$ orvixcli network nic eeprom dump -n hwnic0 --offset 46 --length 4

$ orvixcli network nic eeprom dump -n hwnic0 --offset -1

$ orvixcli network nic eeprom dump -n hwnic0 --length -1

$ orvixcli network nic eeprom dump -n hwnic1

$ orvixcli network nic eeprom dump -n hwnic9

## An empty EEPROM gives an empty table.
$ orvixcli network nic eeprom dump -n hwnic2
