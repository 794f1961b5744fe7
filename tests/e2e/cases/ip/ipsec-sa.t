## network ip ipsec sa list on the default host: states, modes and
## algorithms in words, SPIs in hexadecimal, lifetimes in hours, minutes and
## seconds (0 is infinite).
$ orvixcli network ip ipsec sa list

$ orvixcli network ip ipsec sa list --formatter=simple

$ orvixcli network ip ipsec sa list --formatter=json

## sa add: "any" is the unspecified address; the SPI is hexadecimal with or
## without "0x", read up to the first character that is no hex digit.
$ orvixcli network ip ipsec sa add -n sa-any -s any -d 2001:db8:30::1 -p ff -e null -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567

$ orvixcli network ip ipsec sa add --sa-name sa-tunnel --sa-source 2001:db8:30::2 --sa-destination any --sa-mode tunnel --sa-spi 0x1F4 --encryption-algorithm 3des-cbc --encryption-key 0x0123456789abcdef0123456789abcdef0123456789abcdef --integrity-algorithm hmac-sha2-256 --integrity-key 0x000102030405060708090a0b0c0d0e0f101112131415161718191a1b1c1d1e1f

$ orvixcli network ip ipsec sa add -n sa-junk -s 2001:db8:30::3 -d 2001:db8:30::4 -p 7fffffffzz -m transport -e aes128-cbc -k 0x00112233445566778899aabbccddeeff -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567

$ orvixcli network ip ipsec sa list --formatter=simple

## The SPI refusals: no leading hex digit, a minus sign (which would wrap
## to a huge number), more than 32 bits (which would wrap to a small one).
$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p zz -e null -i hmac-sha1 -K k

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p -1 -e null -i hmac-sha1 -K k

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 0x1000001f4 -e null -i hmac-sha1 -K k

## An address is checked before the SPI; an algorithm other than null needs
## a key.
$ orvixcli network ip ipsec sa add -n sa-bad -s 2001:db8::zz -d any -p zz -e null -i hmac-sha1 -K k

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 1 -e aes128-cbc -i hmac-sha1 -K k

## The option words are checked before the command runs.
$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 1 -m beet -e null -i hmac-sha1 -K k

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 1 -e aes256-gcm -i hmac-sha1 -K k

$ orvixcli network ip ipsec sa add -n sa-bad -s any -d any -p 1 -e null -i hmac-md5 -K k

## The library's refusals: a name in use, an SPI in use between the same
## addresses.
$ orvixcli network ip ipsec sa add -n sa-lab -s any -d any -p 1 -e null -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567

$ orvixcli network ip ipsec sa add -n sa-again -s 2001:db8:10::21 -d 2001:db8:10::80 -p 1f4 -e null -i hmac-sha1 -K 0x0123456789abcdef0123456789abcdef01234567

$ orvixcli network ip ipsec sa list
