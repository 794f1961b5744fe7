## network ip ipsec set: a good file is copied and the IKE daemons are
## restarted; a missing file, a folder or an empty path change nothing and
## restart nothing.
$ sh -c "printf 'listen 2001:db8:10::21\npeer 2001:db8:10::91 psk-file=/etc/orvix/ike/psk\n' > iked.conf"

$ orvixcli network ip ipsec set --ike-conf iked.conf

$ sh -c "orvix-hostsim dump | sed -n '/\"execLog\"/,/^  ]/p'"

$ orvixcli network ip ipsec set -f missing.conf

$ mkdir conf.d

$ orvixcli network ip ipsec set -f conf.d

$ orvixcli network ip ipsec set

$ sh -c "orvix-hostsim dump | sed -n '/\"ipsec\"/,/}/p'"
