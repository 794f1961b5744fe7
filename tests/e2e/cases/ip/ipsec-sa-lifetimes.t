## How sa list shows every state, SPIs from 0 to 32 bits in hexadecimal,
## and lifetimes: each unit only when it is not zero, hours never folded
## into days, up to the largest lifetime the host can hold.
@profile fixtures/ip/ipsec-lifetimes.json
$ orvixcli network ip ipsec sa list
Name             Source Address  Destination Address  State   SPI         Mode       Encryption Algorithm  Integrity Algorithm  Lifetime
---------------  --------------  -------------------  ------  ----------  ---------  --------------------  -------------------  ----------------------
sa-seconds       ::              ::                   larval  0x0         any        null                  hmac-sha1            59s
sa-minute        ::              ::                   mature  0x1         any        null                  hmac-sha1            1m
sa-all-units     ::              ::                   dying   0xffffffff  tunnel     null                  hmac-sha1            1h 2m 5s
sa-hour-seconds  ::              ::                   dead    0xdeadbeef  transport  null                  hmac-sha1            1h 5s
sa-days          ::              ::                   mature  0xffff      any        null                  hmac-sha1            25h 1m 1s
sa-far           ::              ::                   mature  0x10        any        null                  hmac-sha1            5124095576030431h 15s

$ orvixcli network ip ipsec sa list --formatter=json
[
  {
    "Name": "sa-seconds",
    "Source Address": "::",
    "Destination Address": "::",
    "State": "larval",
    "SPI": "0x0",
    "Mode": "any",
    "Encryption Algorithm": "null",
    "Integrity Algorithm": "hmac-sha1",
    "Lifetime": "59s "
  },
  {
    "Name": "sa-minute",
    "Source Address": "::",
    "Destination Address": "::",
    "State": "mature",
    "SPI": "0x1",
    "Mode": "any",
    "Encryption Algorithm": "null",
    "Integrity Algorithm": "hmac-sha1",
    "Lifetime": "1m "
  },
  {
    "Name": "sa-all-units",
    "Source Address": "::",
    "Destination Address": "::",
    "State": "dying",
    "SPI": "0xffffffff",
    "Mode": "tunnel",
    "Encryption Algorithm": "null",
    "Integrity Algorithm": "hmac-sha1",
    "Lifetime": "1h 2m 5s "
  },
  {
    "Name": "sa-hour-seconds",
    "Source Address": "::",
    "Destination Address": "::",
    "State": "dead",
    "SPI": "0xdeadbeef",
    "Mode": "transport",
    "Encryption Algorithm": "null",
    "Integrity Algorithm": "hmac-sha1",
    "Lifetime": "1h 5s "
  },
  {
    "Name": "sa-days",
    "Source Address": "::",
    "Destination Address": "::",
    "State": "mature",
    "SPI": "0xffff",
    "Mode": "any",
    "Encryption Algorithm": "null",
    "Integrity Algorithm": "hmac-sha1",
    "Lifetime": "25h 1m 1s "
  },
  {
    "Name": "sa-far",
    "Source Address": "::",
    "Destination Address": "::",
    "State": "mature",
    "SPI": "0x10",
    "Mode": "any",
    "Encryption Algorithm": "null",
    "Integrity Algorithm": "hmac-sha1",
    "Lifetime": "5124095576030431h 15s "
  }
]
