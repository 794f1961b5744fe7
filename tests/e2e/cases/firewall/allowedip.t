## Adding and removing allowed addresses: both families, networks, the
## canonical text, the checks in their order and the library's refusals.
@profile fixtures/firewall/firewall.json

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 192.0.2.123

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 2001:DB8:0:0::7B

$ orvixcli network firewall ruleset allowedip add -r ntpClient --ip-address 198.51.100.0/255.255.255.0

$ orvixcli network firewall ruleset allowedip add -r ntpClient --ip-address 2001:db8:50::/48

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 203.0.113.123

$ orvixcli network firewall ruleset allowedip list -r ntpClient

$ orvixcli network firewall ruleset allowedip list -r ntpClient --formatter=json

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 2001:db8::7b

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 203.0.113.9/24

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i ntp.example.test

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i 192.0.2.1-192.0.2.9

## The order of the checks: the ruleset, its flag, then the address.
$ orvixcli network firewall ruleset allowedip add -r nosuch -i ""

$ orvixcli network firewall ruleset allowedip add -r webAccess -i ""

$ orvixcli network firewall ruleset allowedip add -r webAccess -i 192.0.2.1

$ orvixcli network firewall ruleset allowedip remove -r webAccess -i 192.0.2.1

$ orvixcli network firewall ruleset allowedip add -r ntpClient -i ""

$ orvixcli network firewall ruleset allowedip remove -r ntpClient --ip-address=

$ orvixcli network firewall ruleset allowedip add -i 192.0.2.1

$ orvixcli network firewall ruleset allowedip remove -r ntpClient

$ orvixcli network firewall ruleset allowedip remove -r ntpClient -i 2001:db8:0::7b

$ orvixcli network firewall ruleset allowedip remove -r ntpClient -i 198.51.100.0/24 --formatter=json

$ orvixcli network firewall ruleset allowedip remove -r ntpClient -i 198.51.100.0/24

$ orvixcli network firewall ruleset allowedip remove -r nosuch -i 192.0.2.123

$ orvixcli network firewall ruleset allowedip list -r ntpClient --formatter=simple
