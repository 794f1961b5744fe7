## network nic eeprom change: the parameter combinations are refused before
## anything is written.
@profile fixtures/nic/diag.json
$ orvixcli network nic eeprom change -n hwnic0 -m 1 --value 7

$ orvixcli network nic eeprom change -n hwnic0 -m 1 --offset 4

$ orvixcli network nic eeprom change -n hwnic0 -m 1

$ orvixcli network nic eeprom change -n hwnic0 -m 1 --file f --offset 0

$ orvixcli network nic eeprom change -n hwnic0 -m 1 --file f --value 0

$ orvixcli network nic eeprom change -n hwnic9 -m 1 --offset 0 --value 1

$ orvixcli network nic eeprom change -n hwnic0 --offset 0 --value 1

## A write needs the EEPROM's magic key.
$ orvixcli network nic eeprom change -n hwnic0 -m 1 --offset 4 --value 1

## Values, offsets and keys that do not fit reach the library whole and are
## refused there.
$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset 4 --value 4294967296

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset 46 --value 1

$ orvixcli network nic eeprom change -n hwnic0 -m 4600387192 --offset 4 --value 1

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset -4 --value 1

## Nothing was written so far.
$ orvixcli network nic eeprom dump -n hwnic0 --length 16

## One double word, lowest byte first, seen by the next dump.
$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset 4 --value 3735928559

$ orvixcli network nic eeprom change -n hwnic0 --magic=305419896 --offset=8 --value=1 --formatter=json

$ orvixcli network nic eeprom dump -n hwnic0 --length 16

## A file replaces the content from byte 0 on.
$ sh -c "printf 'ABCDEF' > $TMP/eeprom.bin"

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP/eeprom.bin

$ orvixcli network nic eeprom dump -n hwnic0 --length 16

## Files that cannot be written: missing, not a regular file, larger than the
## EEPROM.
$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP/missing.bin

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP

$ sh -c "head -c 49 /dev/zero > $TMP/big.bin"

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP/big.bin

$ orvixcli network nic eeprom change -n hwnic1 -m 0 --offset 0 --value 1

$ orvixcli network nic eeprom dump -n hwnic0 --length 16
