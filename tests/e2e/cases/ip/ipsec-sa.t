## network ip ipsec sa list on the default host: states, modes and
## algorithms in words, SPIs in hexadecimal, lifetimes in hours, minutes and
## seconds (0 is infinite).
$ orvixcli network ip ipsec sa list
Name        Source Address   Destination Address  State   SPI     Mode       Encryption Algorithm  Integrity Algorithm  Lifetime
----------  ---------------  -------------------  ------  ------  ---------  --------------------  -------------------  --------
sa-web-out  2001:db8:10::21  2001:db8:10::80      mature  0x1f4   transport  aes128-cbc            hmac-sha2-256        1h
sa-web-in   2001:db8:10::80  2001:db8:10::21      mature  0x1f5   transport  aes128-cbc            hmac-sha2-256        1h
sa-lab      2001:db8:20::21  2001:db8:20::99      mature  0x1000  tunnel     null                  hmac-sha1            infinite
auto-10000  2001:db8:10::21  2001:db8:10::90      dying   0x2710  transport  aes128-cbc            hmac-sha2-256        8h

$ orvixcli network ip ipsec sa list --formatter=simple
   Name: sa-web-out
   Source Address: 2001:db8:10::21
   Destination Address: 2001:db8:10::80
   State: mature
   SPI: 0x1f4
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: 1h 

   Name: sa-web-in
   Source Address: 2001:db8:10::80
   Destination Address: 2001:db8:10::21
   State: mature
   SPI: 0x1f5
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: 1h 

   Name: sa-lab
   Source Address: 2001:db8:20::21
   Destination Address: 2001:db8:20::99
   State: mature
   SPI: 0x1000
   Mode: tunnel
   Encryption Algorithm: null
   Integrity Algorithm: hmac-sha1
   Lifetime: infinite

   Name: auto-10000
   Source Address: 2001:db8:10::21
   Destination Address: 2001:db8:10::90
   State: dying
   SPI: 0x2710
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: 8h 

$ orvixcli network ip ipsec sa list --formatter=json
[
  {
    "Name": "sa-web-out",
    "Source Address": "2001:db8:10::21",
    "Destination Address": "2001:db8:10::80",
    "State": "mature",
    "SPI": "0x1f4",
    "Mode": "transport",
    "Encryption Algorithm": "aes128-cbc",
    "Integrity Algorithm": "hmac-sha2-256",
    "Lifetime": "1h "
  },
  {
    "Name": "sa-web-in",
    "Source Address": "2001:db8:10::80",
    "Destination Address": "2001:db8:10::21",
    "State": "mature",
    "SPI": "0x1f5",
    "Mode": "transport",
    "Encryption Algorithm": "aes128-cbc",
    "Integrity Algorithm": "hmac-sha2-256",
    "Lifetime": "1h "
  },
  {
    "Name": "sa-lab",
    "Source Address": "2001:db8:20::21",
    "Destination Address": "2001:db8:20::99",
    "State": "mature",
    "SPI": "0x1000",
    "Mode": "tunnel",
    "Encryption Algorithm": "null",
    "Integrity Algorithm": "hmac-sha1",
    "Lifetime": "infinite"
  },
  {
    "Name": "auto-10000",
    "Source Address": "2001:db8:10::21",
    "Destination Address": "2001:db8:10::90",
    "State": "dying",
    "SPI": "0x2710",
    "Mode": "transport",
    "Encryption Algorithm": "aes128-cbc",
    "Integrity Algorithm": "hmac-sha2-256",
    "Lifetime": "8h "
  }
]

## sa add: "any" is the unspecified address; the SPI is hexadecimal with or
## without "0x", read up to the first character that is no hex digit.
$ orvixcli network ip ipsec sa add -n sa-any -s any -d 2001:db8:30::1 -p ff -e null -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567

$ orvixcli network ip ipsec sa add --sa-name sa-tunnel --sa-source 2001:db8:30::2 --sa-destination any --sa-mode tunnel --sa-spi 0x1F4 --encryption-algorithm 3des-cbc --encryption-key 0x0123456789abcdef0123456789abcdef0123456789abcdef --integrity-algorithm hmac-sha2-256 --integrity-key 0x000102030405060708090a0b0c0d0e0f101112131415161718191a1b1c1d1e1f

$ orvixcli network ip ipsec sa add -n sa-junk -s 2001:db8:30::3 -d 2001:db8:30::4 -p 7fffffffzz -m transport -e aes128-cbc -k 0x00112233445566778899aabbccddeeff -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567

$ orvixcli network ip ipsec sa list --formatter=simple
   Name: sa-web-out
   Source Address: 2001:db8:10::21
   Destination Address: 2001:db8:10::80
   State: mature
   SPI: 0x1f4
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: 1h 

   Name: sa-web-in
   Source Address: 2001:db8:10::80
   Destination Address: 2001:db8:10::21
   State: mature
   SPI: 0x1f5
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: 1h 

   Name: sa-lab
   Source Address: 2001:db8:20::21
   Destination Address: 2001:db8:20::99
   State: mature
   SPI: 0x1000
   Mode: tunnel
   Encryption Algorithm: null
   Integrity Algorithm: hmac-sha1
   Lifetime: infinite

   Name: auto-10000
   Source Address: 2001:db8:10::21
   Destination Address: 2001:db8:10::90
   State: dying
   SPI: 0x2710
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: 8h 

   Name: sa-any
   Source Address: ::
   Destination Address: 2001:db8:30::1
   State: mature
   SPI: 0xff
   Mode: any
   Encryption Algorithm: null
   Integrity Algorithm: hmac-sha1
   Lifetime: infinite

   Name: sa-tunnel
   Source Address: 2001:db8:30::2
   Destination Address: ::
   State: mature
   SPI: 0x1f4
   Mode: tunnel
   Encryption Algorithm: 3des-cbc
   Integrity Algorithm: hmac-sha2-256
   Lifetime: infinite

   Name: sa-junk
   Source Address: 2001:db8:30::3
   Destination Address: 2001:db8:30::4
   State: mature
   SPI: 0x7fffffff
   Mode: transport
   Encryption Algorithm: aes128-cbc
   Integrity Algorithm: hmac-sha1
   Lifetime: infinite

## The SPI refusals: no leading hex digit, a minus sign (which would wrap
## to a huge number), more than 32 bits (which would wrap to a small one).
$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p zz -e null -i hmac-sha1 -K k
! Check the input value for '--sa-spi'. Should be hex integer. Got zz
[1]

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any --sa-spi=-1 -e null -i hmac-sha1 -K k
! Check the input value for '--sa-spi'. Should be hex integer. Got -1
[1]

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 0x1000001f4 -e null -i hmac-sha1 -K k
! Check the input value for '--sa-spi'. Should be hex integer. Got 0x1000001f4
[1]

## An address is checked before the SPI; an algorithm other than null needs
## a key.
$ orvixcli network ip ipsec sa add -n sa-bad -s 2001:db8::zz -d any -p zz -e null -i hmac-sha1 -K k
! Invalid IPv6 address: '2001:db8::zz'
[1]

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 1 -e aes128-cbc -i hmac-sha1 -K k
! Missing encryption key
[1]

## The option words are checked before the command runs.
$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 1 -m beet -e null -i hmac-sha1 -K k
! orvixcli: Invalid value 'beet' for --sa-mode: it must be one of transport, tunnel
! Run 'orvixcli network ip ipsec sa add --help' for its options.
[2]

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 1 -e aes256-gcm -i hmac-sha1 -K k
! orvixcli: Invalid value 'aes256-gcm' for --encryption-algorithm: it must be one of null, 3des-cbc, aes128-cbc
! Run 'orvixcli network ip ipsec sa add --help' for its options.
[2]

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 1 -e null -i hmac-md5 -K k
! orvixcli: Invalid value 'hmac-md5' for --integrity-algorithm: it must be one of hmac-sha1, hmac-sha2-256
! Run 'orvixcli network ip ipsec sa add --help' for its options.
[2]

## The library's refusals: a name in use, an SPI in use between the same
## addresses.
$ orvixcli network ip ipsec sa add -n sa-lab -s any -d any -p 1 -e null -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567
! SA sa-lab already exists
[1]

$ orvixcli network ip ipsec sa add -n sa-again -s 2001:db8:10::21 -d 2001:db8:10::80 -p 1f4 -e null -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567
! SA SPI 0x1f4 between 2001:db8:10::21 and 2001:db8:10::80 is in use
[1]

$ orvixcli network ip ipsec sa list
Name        Source Address   Destination Address  State   SPI         Mode       Encryption Algorithm  Integrity Algorithm  Lifetime
----------  ---------------  -------------------  ------  ----------  ---------  --------------------  -------------------  --------
sa-web-out  2001:db8:10::21  2001:db8:10::80      mature  0x1f4       transport  aes128-cbc            hmac-sha2-256        1h
sa-web-in   2001:db8:10::80  2001:db8:10::21      mature  0x1f5       transport  aes128-cbc            hmac-sha2-256        1h
sa-lab      2001:db8:20::21  2001:db8:20::99      mature  0x1000      tunnel     null                  hmac-sha1            infinite
auto-10000  2001:db8:10::21  2001:db8:10::90      dying   0x2710      transport  aes128-cbc            hmac-sha2-256        8h
sa-any      ::               2001:db8:30::1       mature  0xff        any        null                  hmac-sha1            infinite
sa-tunnel   2001:db8:30::2   ::                   mature  0x1f4       tunnel     3des-cbc              hmac-sha2-256        infinite
sa-junk     2001:db8:30::3   2001:db8:30::4       mature  0x7fffffff  transport  aes128-cbc            hmac-sha1            infinite
