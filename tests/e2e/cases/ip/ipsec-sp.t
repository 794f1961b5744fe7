## network ip ipsec sp list on the default host, and sp add: networks or
## "any", ports, and the mode kept only for the action ipsec.
$ orvixcli network ip ipsec sp list

$ orvixcli network ip ipsec sp list --formatter=json

$ orvixcli network ip ipsec sp add -n sp-any -s any -d 2001:db8:30::/48 -p 0 -P 65535 -A ipsec -m tunnel -u udp -w in -a sa-lab

$ orvixcli network ip ipsec sp add --sp-name sp-drop --sp-source 2001:db8:40::/64 --sp-destination any --source-port 1024 --destination-port 0 --action discard --sp-mode tunnel

$ orvixcli network ip ipsec sp add -n sp-plain -s 2001:db8:50::1/128 -d 2001:db8:50::2/128 -p 80 -P 8080 -A none -u icmp6 -w out

$ orvixcli network ip ipsec sp add -n sp-defaults -s any -d any -p 0 -P 0

$ orvixcli network ip ipsec sp list --formatter=simple

## Ports outside 0 to 65535 are refused before anything is stored.
$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 65536 -P 0

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P -1

## Networks and words.
$ orvixcli network ip ipsec sp add -n sp-bad -s 2001:db8::/129 -d any -p 0 -P 0

$ orvixcli network ip ipsec sp add -n sp-bad -s 192.0.2.0/24 -d any -p 0 -P 0

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -A bypass

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -u sctp

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -w both

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -m beet

## The library's refusals: a name in use, an SA it does not have.
$ orvixcli network ip ipsec sp add -n sp-lab -s any -d any -p 0 -P 0

$ orvixcli network ip ipsec sp add -n sp-bad -s any -d any -p 0 -P 0 -a sa-none

$ orvixcli network ip ipsec sp list --formatter=simple
