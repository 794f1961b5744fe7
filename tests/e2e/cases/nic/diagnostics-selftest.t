## network nic selftest run: the result row first, then the driver's lines.
## Without --online the offline test runs.
@profile fixtures/nic/diag.json
$ orvixcli network nic selftest run -n hwnic0
Item    Value
------  --------------------------------
Result  Passed
Info    Register test (offline)     PASS
Info    Eeprom test   (offline)     PASS
Info    Interrupt test (offline)    PASS
Info    Loopback test (offline)     PASS

$ orvixcli network nic selftest run -n hwnic0 --online 1
Item    Value
------  --------------------------------
Result  Passed
Info    Register test (online)      PASS
Info    Link test   (online)      PASS

$ orvixcli network nic selftest run -n hwnic0 --online 0 --formatter=json
[
  {
    "Item": "Result",
    "Value": "Passed"
  },
  {
    "Item": "Info",
    "Value": "Register test (offline)     PASS"
  },
  {
    "Item": "Info",
    "Value": "Eeprom test   (offline)     PASS"
  },
  {
    "Item": "Info",
    "Value": "Interrupt test (offline)    PASS"
  },
  {
    "Item": "Info",
    "Value": "Loopback test (offline)     PASS"
  }
]

$ orvixcli network nic selftest run -n hwnic0 --online 2
! orvixcli: Value 2 for --online is out of range: it must be between 0 and 1
! Run 'orvixcli network nic selftest run --help' for its options.
[2]

## A failed test without any line still has its result row.
$ orvixcli network nic selftest run -n hwnic2
Item    Value
------  ------
Result  Failed

$ orvixcli network nic selftest run -n hwnic1
! The driver of NIC hwnic1 does not support self tests
[1]

$ orvixcli network nic selftest run -n hwnic9
! Pnic with name hwnic9 not found
[1]
