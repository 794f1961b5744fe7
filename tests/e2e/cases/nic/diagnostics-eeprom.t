## network nic eeprom change: the parameter combinations are refused before
## anything is written.
@profile fixtures/nic/diag.json
$ orvixcli network nic eeprom change -n hwnic0 -m 1 --value 7
! Need to specify atleast one of --offset, --value or --file
[1]

$ orvixcli network nic eeprom change -n hwnic0 -m 1 --offset 4
! Need to specify atleast one of --offset, --value or --file
[1]

$ orvixcli network nic eeprom change -n hwnic0 -m 1
! Need to specify atleast one of --offset, --value or --file
[1]

$ orvixcli network nic eeprom change -n hwnic0 -m 1 --file f --offset 0
! Parameter --file can't be specified together with --offset and --value
[1]

$ orvixcli network nic eeprom change -n hwnic0 -m 1 --file f --value 0
! Parameter --file can't be specified together with --offset and --value
[1]

$ orvixcli network nic eeprom change -n hwnic9 -m 1 --offset 0 --value 1
! Pnic with name hwnic9 not found
[1]

$ orvixcli network nic eeprom change -n hwnic0 --offset 0 --value 1
! orvixcli: Missing required option --magic
! Run 'orvixcli network nic eeprom change --help' for its options.
[2]

## A write needs the EEPROM's magic key.
$ orvixcli network nic eeprom change -n hwnic0 -m 1 --offset 4 --value 1
! Wrong EEPROM magic key 1 for NIC hwnic0
[1]

## Values, offsets and keys that do not fit reach the library whole and are
## refused there.
$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset 4 --value 4294967296
! Invalid EEPROM word value 4294967296 for NIC hwnic0: must be between 0 and 4294967295
[1]

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset 46 --value 1
! Invalid EEPROM offset value 46 for NIC hwnic0: must be between 0 and 44
[1]

$ orvixcli network nic eeprom change -n hwnic0 -m 4600387192 --offset 4 --value 1
! Wrong EEPROM magic key 4600387192 for NIC hwnic0
[1]

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset -4 --value 1
! Invalid EEPROM offset value -4 for NIC hwnic0: must be between 0 and 44
[1]

## Nothing was written so far.
$ orvixcli network nic eeprom dump -n hwnic0 --length 16
Offset  Value
------  ------------------------------------------------
0000    00 01 02 03 04 05 06 07 08 09 0a 0b 0c 0d 0e 0f

## One double word, lowest byte first, seen by the next dump.
$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset 4 --value 3735928559

$ orvixcli network nic eeprom change -n hwnic0 --magic=305419896 --offset=8 --value=1 --formatter=json

$ orvixcli network nic eeprom dump -n hwnic0 --length 16
Offset  Value
------  ------------------------------------------------
0000    00 01 02 03 ef be ad de 01 00 00 00 0c 0d 0e 0f

## A file replaces the content from byte 0 on.
$ sh -c "printf 'ABCDEF' > $TMP/eeprom.bin"

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP/eeprom.bin

$ orvixcli network nic eeprom dump -n hwnic0 --length 16
Offset  Value
------  ------------------------------------------------
0000    41 42 43 44 45 46 ad de 01 00 00 00 0c 0d 0e 0f

## Files that cannot be written: missing, not a regular file, larger than the
## EEPROM.
$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP/missing.bin
! EEPROM file $TMP/missing.bin cannot be read: No such file or directory
[1]

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP
! EEPROM file $TMP is not a regular file
[1]

$ sh -c "head -c 49 /dev/zero > $TMP/big.bin"

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP/big.bin
! EEPROM file $TMP/big.bin has 49 bytes, more than the 48 bytes of the EEPROM of NIC hwnic0
[1]

$ orvixcli network nic eeprom change -n hwnic1 -m 0 --offset 0 --value 1
! The driver of NIC hwnic1 does not support EEPROM access
[1]

$ orvixcli network nic eeprom dump -n hwnic0 --length 16
Offset  Value
------  ------------------------------------------------
0000    41 42 43 44 45 46 ad de 01 00 00 00 0c 0d 0e 0f
