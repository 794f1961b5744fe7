## network nic register dump: sixteen words a row in lowercase hex, each at
## least two digits; the offset counts words. Twenty words give two rows.
@profile fixtures/nic/diag.json
$ orvixcli network nic register dump -n hwnic0
Offset  Value
------  -----------------------------------------------------------------
0000    01 ff 100 deadbeef 00 10 1000 ffff 80000000 07 08 09 0a 0b 0c 0d
0010    ffffffff 00 2a beef

$ orvixcli network nic register dump --hwnic=hwnic0 --formatter=json
[
  {
    "Offset": "0000",
    "Value": "01 ff 100 deadbeef 00 10 1000 ffff 80000000 07 08 09 0a 0b 0c 0d "
  },
  {
    "Offset": "0010",
    "Value": "ffffffff 00 2a beef "
  }
]

## A driver without a register dump, and one whose dump is empty.
$ orvixcli network nic register dump -n hwnic1
! The driver of NIC hwnic1 does not support register dumps
[1]

$ orvixcli network nic register dump -n hwnic2
Offset  Value
------  -----

$ orvixcli network nic register dump -n hwnic9
! Pnic with name hwnic9 not found
[1]

## network nic eeprom dump: the whole EEPROM by default, in rows aligned to
## sixteen bytes.
$ orvixcli network nic eeprom dump -n hwnic0
Offset  Value
------  ------------------------------------------------
0000    00 01 02 03 04 05 06 07 08 09 0a 0b 0c 0d 0e 0f
0010    10 11 12 13 14 15 16 17 18 19 1a 1b 1c 1d 1e 1f
0020    20 21 22 23 24 25 26 27 28 29 2a 2b 2c 2d 2e 2f

## A range that starts inside a row begins with blank groups; one that
## crosses a row boundary goes on in the next aligned row.
$ orvixcli network nic eeprom dump -n hwnic0 --offset 5 --length 4
Offset  Value
------  ---------------------------
0000                   05 06 07 08

$ orvixcli network nic eeprom dump -n hwnic0 --offset 30 --length 4
Offset  Value
------  ------------------------------------------------
0010                                              1e 1f
0020    20 21

$ orvixcli network nic eeprom dump -n hwnic0 -o 30 -l 4 --formatter=json
[
  {
    "Offset": "0010",
    "Value": "                                          1e 1f "
  },
  {
    "Offset": "0020",
    "Value": "20 21 "
  }
]

## The library checks the range against the EEPROM.
$ orvixcli network nic eeprom dump -n hwnic0 --offset 46 --length 4
! Invalid EEPROM length value 4 for NIC hwnic0: must be between 0 and 2
[1]

$ orvixcli network nic eeprom dump -n hwnic0 --offset -1
! Invalid EEPROM offset value -1 for NIC hwnic0: must be between 0 and 47
[1]

$ orvixcli network nic eeprom dump -n hwnic0 --length -1
! Invalid EEPROM length value -1 for NIC hwnic0: must be between 0 and 48
[1]

$ orvixcli network nic eeprom dump -n hwnic1
! The driver of NIC hwnic1 does not support EEPROM access
[1]

$ orvixcli network nic eeprom dump -n hwnic9
! Pnic with name hwnic9 not found
[1]

## Without a length the dump goes on to the end of the EEPROM.
$ orvixcli network nic eeprom dump -n hwnic0 --offset 47
Offset  Value
------  ------------------------------------------------
0020                                                 2f
