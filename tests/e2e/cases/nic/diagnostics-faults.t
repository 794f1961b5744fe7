## Faults of the driver's diagnostics are reported as they are; a failed
## write changes nothing.
@profile fixtures/nic/diag.json
$ orvix-hostsim fault add PnicImpl::GetRegisters --key hwnic0 --message "Register window unmapped"
1

$ orvixcli network nic register dump -n hwnic0
! Register window unmapped
[1]

$ orvix-hostsim fault add PnicImpl::GetEeprom --key hwnic0 --message "EEPROM read timed out" --count 1
2

$ orvixcli network nic eeprom dump -n hwnic0 --length 4
! EEPROM read timed out
[1]

$ orvix-hostsim fault add PnicImpl::SetEepromValue --key hwnic0 --message "EEPROM is write protected"
3

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --offset 0 --value 1
! EEPROM is write protected
[1]

$ orvix-hostsim fault add PnicImpl::SetEepromFromFile --key hwnic0 --message "EEPROM is write protected"
4

$ sh -c "printf 'AB' > $TMP/eeprom.bin"

$ orvixcli network nic eeprom change -n hwnic0 -m 305419896 --file $TMP/eeprom.bin
! EEPROM is write protected
[1]

$ orvixcli network nic eeprom dump -n hwnic0 --length 4
Offset  Value
------  ------------
0000    00 01 02 03

$ orvix-hostsim fault add PnicImpl::RunSelfTest --key hwnic0 --message "Self test aborted"
5

$ orvixcli network nic selftest run -n hwnic0 --online 1
! Self test aborted
[1]
