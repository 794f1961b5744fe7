## network ip ipsec sa remove: a unique SA by name, an automatic SA by its
## addresses and SPI, or all of them; any other mix is refused with the
## three forms explained, and nothing is removed.
$ orvixcli network ip ipsec sa remove -n sa-web-in

$ orvixcli network ip ipsec sa remove -n sa-web-in

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90 -p 0x2710

$ orvixcli network ip ipsec sa list --formatter=simple

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90 -p 2710

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90 -p -2710

$ orvixcli network ip ipsec sa remove -n auto -s 2001:db8:10::21 -d 2001:db8:10::90

$ orvixcli network ip ipsec sa remove -n sa-lab --remove-all

$ orvixcli network ip ipsec sa remove -n sa-lab -p 1000

$ orvixcli network ip ipsec sa remove -a -s any

$ orvixcli network ip ipsec sa remove

$ orvixcli network ip ipsec sa list --formatter=json

$ orvixcli network ip ipsec sa remove --remove-all

$ orvixcli network ip ipsec sa list --formatter=json
