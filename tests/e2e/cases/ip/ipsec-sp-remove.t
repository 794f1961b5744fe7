## Policies whose unique SA was removed are marked "UNKNOWN*", and the note
## comes once with the list however many there are.
$ orvixcli network ip ipsec sa remove -n sa-web-out

$ orvixcli network ip ipsec sp list

$ orvixcli network ip ipsec sa remove -n sa-web-in

$ orvixcli network ip ipsec sp list --formatter=json

## sp remove: by name, or all; both or neither removes nothing and still
## answers true, with a note.
$ orvixcli network ip ipsec sp remove -n sp-web-out

$ orvixcli network ip ipsec sp remove -n sp-web-out

$ orvixcli network ip ipsec sp remove -n sp-lab --remove-all

$ orvixcli network ip ipsec sp remove

$ orvixcli network ip ipsec sp list --formatter=simple

$ orvixcli network ip ipsec sp remove --remove-all

$ orvixcli network ip ipsec sp list --formatter=json
